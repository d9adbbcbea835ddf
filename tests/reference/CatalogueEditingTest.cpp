#include <gtest/gtest.h>

#include <filesystem>
#include <vector>

#include "catalogue/GameTreeBuilder.h"
#include "reference/ArchiveFile.h"
#include "reference/CatalogueEditing.h"
#include "reference/CategoryList.h"
#include "support/ScriptedPrompt.h"
#include "support/FixedLog.h"

namespace qv {
namespace {

TEST(CategoryList, WholeItemsAreEditedAndLongerNamesStayIntact) {
    EXPECT_EQ(RemoveListItem("Shooter,Classic", ",", "Shooter"), "Classic");
    EXPECT_EQ(RemoveListItem("Classic,Shooter", ",", "Shooter"), "Classic,");
    EXPECT_EQ(RemoveListItem("Shooter, Classic", ", ", "Shooter"), "Classic");
    EXPECT_EQ(RemoveListItem("Shoot,Shooter,Shoot", ",", "Shoot"), "Shooter,");
    EXPECT_EQ(RemoveListItem("Shooter, Maze", ", ", "Shoot"), "Shooter, Maze");
    EXPECT_EQ(RenameListItem("Shooter, Shoot, Maze", ", ", "Shoot", "Blaster"),
              "Shooter, Blaster, Maze");
    EXPECT_EQ(RenameListItem("Shooter,Classic", ",", "Shooter", "Blaster"), "Blaster,Classic");
    EXPECT_TRUE(ListHasItem("Classic,Shoot", ",", "Shoot"));
    EXPECT_FALSE(ListHasItem("Classic,Shooter", ",", "Shoot"));
    EXPECT_EQ(CategoryNameOf("Maze (12)"), "Maze");
    EXPECT_EQ(CategoryNameOf("Maze"), "Maze");
    EXPECT_EQ(CategoryNameOf("Maze (two)"), "Maze (two)");
}

struct Editing : test::LogFixture {
    MyClass records;
    MyClass library;
    Options options;
    GameTree tree;
    test::ScriptedPrompt prompt;
    CatalogueEdit edit{records, library, options, tree, prompt, log};

    Editing() {
        options.DefaultROMdir = (dir / "roms").string();
        std::filesystem::create_directories(options.DefaultROMdir);
        options.SnapDir = (dir / "snap").string();
        options.GameType = "Shooter, Shoot, Classic";
        AddRecord("pacman.zip", "Pac-Man", "Shooter,Classic");
        AddRecord("galaga.zip", "galaga.zip", "Classic,Shooter");
        AddRecord("shoot.zip", "Shoot Game", "Shoot");
        AddEntry("pacman.zip", "Pac-Man (Midway)", "1980").Category = "Maze";
        AddEntry("galaga.zip", "Galaga", "1981");
        Rebuild();
    }
    MyClass& AddEntry(const std::string& key, const std::string& title, const std::string& year) {
        MyClass& entry = *library.Add(key);
        entry.RomFile = key;
        entry.Title = title;
        entry.Company = "Namco";
        entry.Year = year;
        entry.EmuWorking = true;
        return entry;
    }
    void AddRecord(const std::string& key, const std::string& title, const std::string& cats) {
        MyClass* record = records.Add(key);
        record->RomFile = key;
        record->Title = title;
        record->Categories = cats;
        record->Present = true;
        record->Working = true;
    }
    void Rebuild() { BuildGameTree(tree, records, library, options, SnapshotIndex(options.SnapDir)); }
    std::filesystem::path Archive(const std::string& name) {
        return dir.Write("roms/" + name, "PK");
    }
};

TEST(EditingLabels, RenamingAGameChangesRecordAndEveryNodeOfItButNotTheRoot) {
    Editing e;
    EXPECT_FALSE(CanEditLabel(e.tree, e.tree.Find("alpha_")));
    EXPECT_TRUE(CanEditLabel(e.tree, e.tree.Find("Maze_")));
    EXPECT_FALSE(CanEditLabel(e.tree, NoNode));
    const NodeId node = e.tree.Find("alpha_pacman.zip");
    EXPECT_TRUE(CanEditLabel(e.tree, node));
    EXPECT_EQ(RenameGame(e.edit, node, "pacman.zip", "Puck Man"), "Puck Man");
    EXPECT_EQ(e.records.Item("pacman.zip")->Title, "Puck Man");
    EXPECT_EQ(e.tree.Node(e.tree.Find("alpha_pacman.zip")).Text, "Puck Man");
    EXPECT_EQ(e.tree.Node(e.tree.Find("Maze_pacman.zip")).Text, "Puck Man");
}

TEST(EditingLabels, RenamingACategoryKeepsLongerNamesIntact) {
    Editing e;
    RenameCategory(e.edit, "Shoot (1)", "Blaster (1)");
    EXPECT_EQ(e.options.GameType, "Shooter, Blaster, Classic");
    EXPECT_EQ(e.records.Item("pacman.zip")->Categories, "Shooter,Classic");
    EXPECT_EQ(e.records.Item("shoot.zip")->Categories, "Blaster");
    RenameCategory(e.edit, "Shooter", "Blaster");
    EXPECT_EQ(e.options.GameType, "Blaster, Blaster, Classic");
    EXPECT_EQ(e.records.Item("pacman.zip")->Categories, "Blaster,Classic");
    EXPECT_EQ(e.records.Item("galaga.zip")->Categories, "Classic,Blaster");
}

TEST(EditingDelete, GameWithoutArchiveIsAskedOnceAndDroppedCompletelyUnlessDeclined) {
    Editing e;
    e.prompt.Answer(PromptAnswer::No);
    EXPECT_EQ(DeleteSelected(e.edit, "pacman.zip", e.tree.Find("alpha_pacman.zip")),
              DeleteOutcome::Declined);
    EXPECT_EQ(e.records.Item("pacman.zip")->RomFile, "pacman.zip");
    EXPECT_TRUE(e.tree.NodeExists("alpha_pacman.zip"));

    e.prompt.Answer(PromptAnswer::Yes);
    EXPECT_EQ(DeleteSelected(e.edit, "pacman.zip", e.tree.Find("alpha_pacman.zip")),
              DeleteOutcome::GameDeleted);
    ASSERT_EQ(e.prompt.asked.size(), 2u);
    EXPECT_EQ(e.prompt.asked[1].text, "Are you sure you want to delete Pac-Man?");
    EXPECT_EQ(e.prompt.asked[1].buttons, PromptButtons::YesNo);
    EXPECT_FALSE(e.records.exists("pacman.zip"));
    EXPECT_FALSE(e.tree.NodeExists("alpha_pacman.zip"));
    EXPECT_FALSE(e.tree.NodeExists("Maze_pacman.zip"));
}

TEST(EditingDelete, ArchiveOnDiskIsAskedAboutAndTheRecordIsMarkedRemoved) {
    Editing e;
    const auto pacman = e.Archive("pacman.zip");
    e.prompt.Answer(PromptAnswer::No);  // declining the first question keeps the archive too
    EXPECT_EQ(DeleteSelected(e.edit, "pacman.zip", NoNode), DeleteOutcome::Declined);
    EXPECT_TRUE(std::filesystem::exists(pacman));
    e.prompt.asked.clear();
    e.prompt.Answer(PromptAnswer::Yes);
    e.prompt.Answer(PromptAnswer::No);
    EXPECT_EQ(DeleteSelected(e.edit, "pacman.zip", NoNode), DeleteOutcome::GameMarkedRemoved);
    ASSERT_EQ(e.prompt.asked.size(), 2u);
    EXPECT_EQ(e.prompt.asked[1].text, "Do you want to delete the ROM: pacman.zip?");
    EXPECT_TRUE(std::filesystem::exists(pacman));
    EXPECT_EQ(e.records.Item("pacman.zip")->RomFile, "^pacman.zip");
    EXPECT_FALSE(e.tree.NodeExists("alpha_pacman.zip"));

    const auto galaga = e.Archive("galaga.zip");
    e.prompt.Answer(PromptAnswer::Yes);
    e.prompt.Answer(PromptAnswer::Yes);
    EXPECT_EQ(DeleteSelected(e.edit, "galaga.zip", NoNode), DeleteOutcome::GameMarkedRemoved);
    EXPECT_FALSE(std::filesystem::exists(galaga));
    EXPECT_EQ(e.records.Item("galaga.zip")->RomFile, "^galaga.zip");
    EXPECT_EQ(e.prompt.unexpected, 0);
}

TEST(EditingDelete, NamesLeadingOutsideTheRomFolderDeleteNothingOnDisk) {
    Editing e;
    const auto outside = e.dir.Write("outside.zip", "keep me");
    const auto elsewhere = e.dir.Write("elsewhere/inner.zip", "keep me too");
    std::filesystem::create_symlink(outside, e.dir / "roms" / "link.zip");
    for (const std::string& name : std::vector<std::string>{"../outside.zip", outside.string(), "link.zip",
                                   "../elsewhere/inner.zip", "..", "."}) {
        e.AddRecord(name, "Danger", "");
        e.prompt.Answer(PromptAnswer::Yes);
        e.prompt.Answer(PromptAnswer::Yes);  // would confirm the archive if it were asked
        EXPECT_EQ(DeleteSelected(e.edit, name, NoNode), DeleteOutcome::GameDeleted) << name;
        EXPECT_EQ(e.prompt.asked.back().text, "Are you sure you want to delete Danger?");
        e.prompt.answers.clear();
    }
    EXPECT_TRUE(std::filesystem::exists(outside));
    EXPECT_TRUE(std::filesystem::exists(elsewhere));
    EXPECT_TRUE(std::filesystem::is_symlink(e.dir / "roms" / "link.zip"));
    EXPECT_FALSE(ArchiveInRomFolder(e.options.DefaultROMdir, "nothere.zip").has_value());
    e.Archive("real.zip");
    EXPECT_TRUE(ArchiveInRomFolder(e.options.DefaultROMdir, "real.zip").has_value());
}

TEST(EditingDelete, CategoryIsRemovedFromRecordsGameTypeAndTree) {
    Editing e;
    e.options.GameType = "Shooter, Classic, Shoot";
    NodeId maze = e.tree.Find("Maze_");
    e.prompt.Answer(PromptAnswer::No);
    EXPECT_EQ(DeleteSelected(e.edit, "", maze), DeleteOutcome::Declined);
    EXPECT_EQ(e.prompt.asked[0].text,
              "Are you sure you want to delete the category: Maze?\n"
              "This will remove this category from all of the ROMs.");
    EXPECT_TRUE(e.tree.NodeExists("Maze_"));

    // A category folder named like a user category: the lists lose it as whole items.
    const NodeId root = e.tree.Add(NoNode, "Shooter_", "Shooter (2)", "fclosed", "fopen");
    e.tree.Add(root, "Shooter_pacman.zip", "Pac-Man", "good");
    e.prompt.Answer(PromptAnswer::Yes);
    EXPECT_EQ(DeleteSelected(e.edit, "", e.tree.Find("Shooter_")), DeleteOutcome::CategoryDeleted);
    EXPECT_EQ(e.records.Item("pacman.zip")->Categories, "Classic");
    EXPECT_EQ(e.records.Item("galaga.zip")->Categories, "Classic,");
    EXPECT_EQ(e.records.Item("shoot.zip")->Categories, "Shoot");
    EXPECT_EQ(e.options.GameType, "Classic, Shoot");
    EXPECT_FALSE(e.tree.NodeExists("Shooter_"));
    EXPECT_FALSE(e.tree.NodeExists("Shooter_pacman.zip"));

    // Game nodes and the alphabetical root are not categories.
    EXPECT_EQ(DeleteSelected(e.edit, "", e.tree.Find("alpha_")), DeleteOutcome::Nothing);
    EXPECT_EQ(DeleteSelected(e.edit, "", e.tree.Find("alpha_shoot.zip")), DeleteOutcome::Nothing);
    EXPECT_EQ(e.prompt.unexpected, 0);
}

TEST(EditingLibraryInfo, InsertCopiesTitleCompanyAndYear) {
    Editing e;
    const NodeId node = e.tree.Find("alpha_pacman.zip");
    const LibraryInfoShown shown = InsertMameInformation(e.edit, "pacman.zip", node);
    EXPECT_TRUE(shown.copied);
    EXPECT_EQ(shown.makerLine, "(C) 1980, Namco");
    const MyClass& pacman = *e.records.Item("pacman.zip");
    EXPECT_EQ(pacman.Title + "|" + pacman.Company + "|" + pacman.Year, "Pac-Man (Midway)|Namco|1980");
    EXPECT_EQ(e.tree.Node(node).Text, "Pac-Man (Midway)");
    EXPECT_FALSE(InsertMameInformation(e.edit, "shoot.zip", NoNode).copied);
    EXPECT_FALSE(InsertMameInformation(e.edit, "", NoNode).copied);
}

TEST(EditingLibraryInfo, UpdateAllInUnidentifiedModeOnlyTouchesFileNamedGames) {
    Editing e;
    e.records.Item("galaga.zip")->Working = false;
    e.prompt.Answer(PromptAnswer::No);
    EXPECT_TRUE(UpdateAllFromLibrary(e.edit));
    EXPECT_EQ(e.prompt.asked[0].text, "Do you want to update all ROMs (yes) or unidentified (no)?");
    EXPECT_EQ(e.prompt.asked[0].buttons, PromptButtons::YesNoCancel);
    EXPECT_EQ(e.records.Item("pacman.zip")->Title, "Pac-Man");
    EXPECT_EQ(e.records.Item("galaga.zip")->Title, "Galaga");
    EXPECT_TRUE(e.records.Item("galaga.zip")->Working);
    EXPECT_EQ(e.tree.Node(e.tree.Find("alpha_galaga.zip")).Text, "Galaga");

    e.prompt.Answer(PromptAnswer::Cancel);
    e.records.Item("pacman.zip")->Title = "pacman.zip";
    EXPECT_FALSE(UpdateAllFromLibrary(e.edit));
    EXPECT_EQ(e.records.Item("pacman.zip")->Title, "pacman.zip");

    e.prompt.Answer(PromptAnswer::Yes);
    e.records.Item("pacman.zip")->Title = "Custom";
    EXPECT_TRUE(UpdateAllFromLibrary(e.edit));
    EXPECT_EQ(e.records.Item("pacman.zip")->Title, "Pac-Man (Midway)");
}

TEST(EditingLibraryInfo, UpdateAllSkipsLibraryNodesWithoutRecord) {
    Editing e;
    e.AddEntry("dkong.zip", "Donkey Kong", "1981");
    NoEventYield yield;
    NoStatusDisplay status;
    AddAllEmulatedGames(e.tree, e.library, e.records, SnapshotIndex(), status, yield);
    e.prompt.Answer(PromptAnswer::Yes);
    EXPECT_TRUE(UpdateAllFromLibrary(e.edit));
    EXPECT_FALSE(e.records.exists("dkong.zip"));
    EXPECT_EQ(e.records.Item("galaga.zip")->Title, "Galaga");
}

}  // namespace
}  // namespace qv
