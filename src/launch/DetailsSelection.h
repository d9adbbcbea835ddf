#pragma once
#include <functional>
#include <string>

#include "app/HostConventions.h"
#include "app/Options.h"
#include "catalogue/GameTree.h"
#include "catalogue/MyClass.h"
#include "launch/DetailsState.h"
#include "platform/Regional.h"

namespace qv {

// What the details panel reads when a node is selected.
struct SelectionSources {
    MyClass& records;        // GameRecords
    const MyClass& library;  // RomLibrary
    const Options& options;
    const HostConventions& host;
    const Regional& regional;
    // The frame-rate text of a game's last run ("FPS: 59.924", "FPS: Not available", ...).
    std::function<std::string(const std::string& key)> frameRateText;
    // The emulator executable exists (the executable label is green).
    bool executableFound = true;
};

// Which text-area views follow the new selection: owned games refresh every view, games known
// only from the library leave a log view as it was.
enum class TextViewRefresh { None, NotesHistoryInfo, All };

struct SelectionResult {
    bool folder = false;           // a folder node: nothing changed
    bool gameShown = false;        // an owned or library-only game filled the panel
    bool nodeChanged = false;      // the node's picture was set ("good" / "bad")
    std::string titleToSpeak;      // the full title; spoken in its speakable form
    TextViewRefresh textView = TextViewRefresh::None;
    bool refreshPictures = false;  // screenshot and marquee follow the selection
};

// The parent key of the nodes a ROM server offers.
inline constexpr const char* RomServerParentKey = "Download.ROMS";
inline constexpr std::size_t TitleCaptionLimit = 40;

// Fills the panel state for a tree node (the node's tag is the game's key). Records may change:
// an empty resolution is stored as "Auto".
SelectionResult SelectNode(DetailsState& state, GameTree& tree, NodeId node,
                           const SelectionSources& sources);

// Every "&" doubled, so a label shows it literally.
std::string DoubleAmpersands(const std::string& text);

}  // namespace qv
