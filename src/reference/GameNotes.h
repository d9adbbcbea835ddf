#pragma once
#include <string>
#include <string_view>

#include "app/Options.h"
#include "catalogue/MyClass.h"
#include "reference/DetailsText.h"

namespace qv {

// Notes are stored in one tab-separated field of games.inc, so tabs and line breaks are
// written as "<tab>" and "<crlf>". Plain, case-sensitive replacements; a lone CR or LF stays.
std::string EscapeNotes(std::string_view text);
std::string UnescapeNotes(std::string_view stored);

// The notes view of the details text area. It remembers whose notes the area shows
// (NotesOwnerKey) so that they are stored back whenever the area is about to change content.
class GameNotes {
public:
    GameNotes(MyClass& records, const Options& options) : records_(records), options_(options) {}

    // Stores the area's text into the owner's record (escaped) and forgets the owner.
    void SaveNotes(const DetailsText& area);
    // Saves pending notes, then shows the notes of the game with that key.
    void ShowNotes(DetailsText& area, const std::string& name);

    const std::string& NotesOwnerKey() const { return ownerKey_; }

private:
    MyClass& records_;
    const Options& options_;
    std::string ownerKey_;
};

}  // namespace qv
