#include "catalogue/GameTreeBuilder.h"

#include <filesystem>
#include <system_error>

#include "app/TextFile.h"

namespace qv {

namespace {

constexpr const char* kClosedFolder = "fclosed";
constexpr const char* kOpenFolder = "fopen";
constexpr const char* kAlphaGroup = "alpha";
constexpr const char* kAlphaText = " Alphabetical";
constexpr const char* kAllGamesKey = "MAME.ROMS";
constexpr const char* kAllGamesText = "All MAME ROMs";

// Every occurrence of `from` replaced, left to right, case-sensitively.
std::string ReplaceAll(std::string text, std::string_view from, std::string_view to) {
    std::size_t at = text.find(from);
    while (at != std::string::npos) {
        text.replace(at, from.size(), to);
        at = text.find(from, at + to.size());
    }
    return text;
}

bool EndsWith(std::string_view text, char c) { return !text.empty() && text.back() == c; }

// The shown/hidden decision of one record under the view filters.
bool IsShown(const MyClass& record, const Options& options) {
    bool shown = true;
    if (record.Hidden && !options.ShowHidden) shown = false;
    if (!record.Working && options.ShowWorking) shown = false;
    // An archive still named by its file is never filtered away, so the user can identify it.
    if (!shown && record.Title == record.RomFile) shown = true;
    if (!record.RomFile.empty() && record.RomFile.front() == '^') shown = false;
    return shown;
}

}  // namespace

SnapshotIndex::SnapshotIndex(const std::string& snapDir) {
    if (snapDir.empty()) return;
    std::error_code error;
    std::filesystem::directory_iterator it(snapDir, error);
    if (error) return;  // a missing or unreadable folder simply has no screenshots
    for (const std::filesystem::directory_iterator end; it != end; it.increment(error)) {
        if (error) break;
        std::error_code typeError;
        if (it->is_regular_file(typeError)) names_.insert(it->path().filename().string());
    }
}

std::string SnapshotIndex::PngName(const std::string& romFile) {
    return ReplaceAll(romFile, ".zip", ".png");
}

void AddGameNode(GameTree& tree, const SnapshotIndex& snapshots, const std::string& group,
                 const std::string& key, const std::string& title, bool working, bool present) {
    if (group.empty()) return;
    std::string rootKey = group + "_";
    NodeId root = tree.Find(rootKey);
    if (root == NoNode) {
        root = tree.Add(NoNode, rootKey, group, kClosedFolder, kOpenFolder);
        if (root == NoNode) return;
    }
    // Add refuses a key that is taken, which is exactly "the game is already there".
    const NodeId node = tree.Add(root, rootKey + key, title);
    if (node == NoNode) return;
    tree.SetTag(node, key);
    if (!working) {
        tree.SetColour(node, colours::Red);
        tree.SetImage(node, "bad");
    } else {
        tree.SetImage(node, "good");
        tree.SetColour(node, snapshots.Has(SnapshotIndex::PngName(key)) ? colours::Black
                                                                         : colours::LightBlue);
    }
    if (!present) {
        tree.SetColour(node, colours::Grey);
        tree.SetImage(node, "bad");
    }
}

void BuildGameTree(GameTree& tree, MyClass& records, const MyClass& library,
                   const Options& options, const SnapshotIndex& snapshots) {
    tree.Clear();
    // Each shown record gives at most two nodes (alphabetical and category).
    tree.Reserve(2 * static_cast<std::size_t>(records.Count()) + 1);
    tree.Add(NoNode, std::string(kAlphaGroup) + "_", kAlphaText, kClosedFolder, kOpenFolder);

    for (MyClass& record : records) {
        if (!IsShown(record, options)) continue;
        AddGameNode(tree, snapshots, kAlphaGroup, record.RomFile, record.Title, record.Working,
                    record.Present);
        // A game whose archive is missing is recorded as not working (saved with the records).
        if (!record.Present) record.Working = false;
        const MyClass* entry = library.Item(record.Key());
        if (entry != nullptr && !entry->Category.empty())
            AddGameNode(tree, snapshots, entry->Category, record.RomFile, record.Title,
                        record.Working, record.Present);
    }

    // Only the roots carry the child count; a game whose file name ends in "_" is not a root.
    const std::vector<NodeId> roots = tree.Children(NoNode);
    for (const NodeId root : roots) {
        const TreeNode& node = tree.Node(root);
        if (!EndsWith(node.Key, '_')) continue;
        tree.SetText(root, node.Text + " (" + std::to_string(tree.ChildCount(root)) + ")");
    }
}

bool AddAllEmulatedGames(GameTree& tree, const MyClass& library, const MyClass& records,
                         const SnapshotIndex& snapshots, StatusDisplay& status,
                         EventYield& yield) {
    if (tree.Find(kAllGamesKey) != NoNode) return false;
    NodeId root = tree.Add(NoNode, kAllGamesKey, kAllGamesText, kClosedFolder, kOpenFolder);
    if (root == NoNode) return false;

    tree.Reserve(static_cast<std::size_t>(tree.Count()) + static_cast<std::size_t>(library.Count()));
    const std::string prefix = std::string(kAllGamesKey) + "_";
    // Walk by position and re-check the count: window events run during the yields below and
    // may reload the library or rebuild the tree.
    for (std::int32_t position = 1; position <= library.Count(); ++position) {
        const MyClass* entry = library.Item(position);
        if (entry == nullptr) break;
        const NodeId node = tree.Add(root, prefix + entry->RomFile, entry->Title);
        if (node != NoNode) {
            tree.SetTag(node, entry->RomFile);
            const bool hasSnapshot = snapshots.Has(SnapshotIndex::PngName(LowerAscii(entry->RomFile)));
            tree.SetColour(node, hasSnapshot ? colours::Blue : colours::Grey);
            if (const MyClass* record = records.Item(entry->RomFile)) {
                if (record->Present) {
                    tree.SetImage(node, "good");
                    tree.SetColour(node, hasSnapshot ? colours::Black : colours::LightBlue);
                }
            } else {
                tree.SetImage(node, "bad");
            }
        }
        if (position % 100 == 0) {
            const auto percent = static_cast<long long>(position) * 100 / library.Count();
            status.ShowStatusIfVisible("Adding all MAME ROMs ... " + std::to_string(percent) + "%");
            yield.Yield();
            // A rebuild during the yield removed the root (or moved it): follow it or stop.
            root = tree.Find(kAllGamesKey);
            if (root == NoNode) break;
        }
    }
    return true;
}

}  // namespace qv
