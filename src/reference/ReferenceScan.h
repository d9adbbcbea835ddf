#pragma once
#include <string>
#include <string_view>

namespace qv {

// The two reference databases differ only in how the collected text starts and in whether
// empty lines before the first content line are kept.
enum class ReferenceKind { History, Info };

// What the lookup found for one game.
struct EntryText {
    bool matched = false;  // an "$info=" line listed the game
    bool closed = false;   // ... and a "$end" line closed the entry
    std::string text;      // content lines, each followed by CR LF ("MAME " first for Info)
};

// Lower case with every ".zip" removed: PacMan.ZIP and pacman both give pacman.
std::string ReferenceKey(std::string_view name);

// The text collected before any line is read.
std::string_view CollectedStart(ReferenceKind kind);

// Plain top-to-bottom scan of a whole database held in memory. Kept as the reference
// behaviour: the indexed lookup must give exactly the same answer.
EntryText ScanReference(std::string_view bytes, std::string_view key, ReferenceKind kind);

// True when the item list of an "$info=" line (the text after "=") names the key exactly.
// Empty items never match.
bool InfoLineNames(std::string_view itemList, std::string_view key);

}  // namespace qv
