#pragma once
#include <string>
#include <unordered_set>

#include "app/Options.h"
#include "catalogue/GameTree.h"
#include "catalogue/MyClass.h"
#include "platform/EventYield.h"
#include "platform/StatusDisplay.h"

namespace qv {

// The names of the screenshots in the snapshot folder, listed once per tree build instead of
// asking the file system once per game.
class SnapshotIndex {
public:
    SnapshotIndex() = default;
    explicit SnapshotIndex(const std::string& snapDir);
    // True when snapDir holds this file name (exact case, as on the host's file system).
    bool Has(const std::string& fileName) const { return names_.count(fileName) != 0; }
    // Screenshot file name of a game key: ".zip" replaced by ".png".
    static std::string PngName(const std::string& romFile);

private:
    std::unordered_set<std::string> names_;
};

// Rebuilds the user's tree: " Alphabetical (N)" and one root per library category, with the
// hidden/working filters of options. Records whose archive is missing are marked not working.
void BuildGameTree(GameTree& tree, MyClass& records, const MyClass& library,
                   const Options& options, const SnapshotIndex& snapshots);

// One game node under the group's root (created when needed); nothing for an empty group.
void AddGameNode(GameTree& tree, const SnapshotIndex& snapshots, const std::string& group,
                 const std::string& key, const std::string& title, bool working, bool present);

// Adds "All MAME ROMs" with one node per library entry. Every 100 entries the wait window shows
// "Adding all MAME ROMs ... N%" and the event loop runs. Returns false when it already exists.
bool AddAllEmulatedGames(GameTree& tree, const MyClass& library, const MyClass& records,
                         const SnapshotIndex& snapshots, StatusDisplay& status,
                         EventYield& yield);

}  // namespace qv
