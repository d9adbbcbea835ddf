#include "reference/CatalogueEditing.h"

#include <system_error>
#include <vector>

#include "catalogue/GameTreeBuilder.h"
#include "reference/ArchiveFile.h"
#include "reference/CategoryList.h"

namespace qv {
namespace {

void RemoveNodeIfExists(GameTree& tree, const std::string& key) {
    if (!tree.NodeExists(key)) return;
    tree.Remove(tree.Find(key));
}

bool AskYes(Prompt& prompt, const std::string& text) {
    return prompt.Ask("Quorvane", text, PromptButtons::YesNo, PromptIcon::Question) ==
           PromptAnswer::Yes;
}

DeleteOutcome DeleteGame(CatalogueEdit& edit, MyClass& record, const std::string& key) {
    if (!AskYes(edit.prompt, "Are you sure you want to delete " + record.Title + "?"))
        return DeleteOutcome::Declined;
    if (const auto archive = ArchiveInRomFolder(edit.options.DefaultROMdir, record.RomFile)) {
        if (AskYes(edit.prompt, "Do you want to delete the ROM: " + record.RomFile + "?")) {
            std::error_code error;
            std::filesystem::remove(*archive, error);
            if (error) edit.log.LogError("PlayForm", "mDelete", {error.value(), error.message()});
        }
        record.RomFile = "^" + record.RomFile;
    }
    std::size_t start = 0;
    const std::string& categories = record.Categories;
    while (start <= categories.size()) {
        std::size_t comma = categories.find(',', start);
        if (comma == std::string::npos) comma = categories.size();
        RemoveNodeIfExists(edit.tree, categories.substr(start, comma - start) + "_" + key);
        start = comma + 1;
    }
    // The tree groups games by their library category too; that node goes with the game.
    if (const MyClass* entry = edit.library.Item(key); entry && !entry->Category.empty())
        RemoveNodeIfExists(edit.tree, entry->Category + "_" + key);
    RemoveNodeIfExists(edit.tree, "alpha_" + key);
    if (!record.RomFile.empty() && record.RomFile.front() == '^')
        return DeleteOutcome::GameMarkedRemoved;
    edit.records.Delete(key);
    return DeleteOutcome::GameDeleted;
}

DeleteOutcome DeleteCategory(CatalogueEdit& edit, NodeId node) {
    // Only a category folder is a category; the alphabetical root holds every game.
    if (node == NoNode || node >= edit.tree.Count() || !edit.tree.IsFolder(node) ||
        edit.tree.Node(node).Key == "alpha_")
        return DeleteOutcome::Nothing;
    const std::string name = CategoryNameOf(edit.tree.Node(node).Text);
    if (!AskYes(edit.prompt, "Are you sure you want to delete the category: " + name + "?\n" +
                                 "This will remove this category from all of the ROMs."))
        return DeleteOutcome::Declined;
    for (MyClass& record : edit.records)
        if (ListHasItem(record.Categories, ",", name))
            record.Categories = RemoveListItem(record.Categories, ",", name);
    edit.options.GameType = RemoveListItem(edit.options.GameType, ", ", name);
    edit.tree.Remove(node);
    return DeleteOutcome::CategoryDeleted;
}

}  // namespace

bool CanEditLabel(const GameTree& tree, NodeId node) {
    return node != NoNode && node < tree.Count() && tree.Node(node).Key != "alpha_";
}

std::string RenameGame(CatalogueEdit& edit, NodeId node, const std::string& selectedKey,
                       const std::string& newTitle) {
    if (node != NoNode && node < edit.tree.Count()) edit.tree.SetText(node, newTitle);
    // Every other node of the same game follows at once.
    for (NodeId id = 0; id < edit.tree.Count(); ++id)
        if (!edit.tree.IsFolder(id) &&
            MyClass::FoldKey(edit.tree.Node(id).Tag) == MyClass::FoldKey(selectedKey))
            edit.tree.SetText(id, newTitle);
    if (MyClass* record = edit.records.Item(selectedKey)) record->Title = newTitle;
    return newTitle;
}

void RenameCategory(CatalogueEdit& edit, const std::string& oldText, const std::string& newText) {
    const std::string oldName = CategoryNameOf(oldText);
    const std::string newName = CategoryNameOf(newText);
    if (oldName.empty()) return;
    edit.options.GameType = RenameListItem(edit.options.GameType, ", ", oldName, newName);
    for (MyClass& record : edit.records)
        if (ListHasItem(record.Categories, ",", oldName))
            record.Categories = RenameListItem(record.Categories, ",", oldName, newName);
}

DeleteOutcome DeleteSelected(CatalogueEdit& edit, const std::string& selectedKey, NodeId node) {
    if (!selectedKey.empty())
        if (MyClass* record = edit.records.Item(selectedKey))
            return DeleteGame(edit, *record, selectedKey);
    return DeleteCategory(edit, node);
}

LibraryInfoShown InsertMameInformation(CatalogueEdit& edit, const std::string& selectedKey,
                                       NodeId node) {
    LibraryInfoShown shown;
    const MyClass* entry = selectedKey.empty() ? nullptr : edit.library.Item(selectedKey);
    if (entry == nullptr) return shown;
    if (MyClass* record = edit.records.Item(selectedKey)) {
        record->Title = entry->Title;
        record->Company = entry->Company;
        record->Year = entry->Year;
    }
    if (node != NoNode && node < edit.tree.Count()) edit.tree.SetText(node, entry->Title);
    shown.copied = true;
    shown.title = entry->Title;
    shown.makerLine = "(C) " + entry->Year + ", " + entry->Company;
    return shown;
}

bool UpdateAllFromLibrary(CatalogueEdit& edit) {
    const PromptAnswer answer =
        edit.prompt.Ask("Quorvane", "Do you want to update all ROMs (yes) or unidentified (no)?",
                        PromptButtons::YesNoCancel, PromptIcon::Question);
    if (answer == PromptAnswer::Cancel) return false;
    const bool all = answer == PromptAnswer::Yes;
    for (NodeId id = 0; id < edit.tree.Count(); ++id) {
        const std::string& key = edit.tree.Node(id).Tag;
        if (key.empty()) continue;
        const MyClass* entry = edit.library.Item(key);
        MyClass* record = edit.records.Item(key);
        // Library-only nodes (all-games list) have no record to update.
        if (entry == nullptr || record == nullptr) continue;
        if (!all && record->Title != record->RomFile) continue;
        record->Title = entry->Title;
        record->Company = entry->Company;
        record->Year = entry->Year;
        record->Working = entry->EmuWorking;
    }
    BuildGameTree(edit.tree, edit.records, edit.library, edit.options,
                  SnapshotIndex(edit.options.SnapDir));
    return true;
}

}  // namespace qv
