#pragma once
#include <string>

#include "app/ActivityLog.h"
#include "app/Options.h"
#include "catalogue/GameTree.h"
#include "catalogue/MyClass.h"
#include "platform/Prompt.h"

namespace qv {

// The Edit menu's changes to the catalogue. They change the records, GameType and the tree in
// memory; only deleting an archive touches the disk at once.
struct CatalogueEdit {
    MyClass& records;
    const MyClass& library;
    Options& options;
    GameTree& tree;
    Prompt& prompt;
    ActivityLog& log;
};

// The alphabetical root cannot be renamed.
bool CanEditLabel(const GameTree& tree, NodeId node);

// A game's new title (selectedKey non-empty): the node, every other node of the game and the
// record follow. Returns the text to speak (the new title).
std::string RenameGame(CatalogueEdit& edit, NodeId node, const std::string& selectedKey,
                       const std::string& newTitle);
// A category's new name in GameType and in every record's Categories. The node texts may carry
// their game count (" (N)"), which is not part of the name. Nothing is spoken.
void RenameCategory(CatalogueEdit& edit, const std::string& oldText, const std::string& newText);

enum class DeleteOutcome { Nothing, Declined, GameDeleted, GameMarkedRemoved, CategoryDeleted };

// Deletes the shown game (asking once, or twice when its archive is on disk), or else the
// selected category folder.
DeleteOutcome DeleteSelected(CatalogueEdit& edit, const std::string& selectedKey, NodeId node);

// What "Insert MAME Information" puts on the panel.
struct LibraryInfoShown {
    bool copied = false;
    std::string title;
    std::string makerLine;  // "(C) Year, Company", shown in green
};
LibraryInfoShown InsertMameInformation(CatalogueEdit& edit, const std::string& selectedKey,
                                       NodeId node);

// "Update MAME Info for All ROMs": asks all (Yes) or unidentified only (No); Cancel changes
// nothing. Rebuilds the tree afterwards. Returns false when cancelled.
bool UpdateAllFromLibrary(CatalogueEdit& edit);

}  // namespace qv
