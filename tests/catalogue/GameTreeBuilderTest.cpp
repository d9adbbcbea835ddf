#include "catalogue/GameTreeBuilder.h"

#include <gtest/gtest.h>

#include <functional>
#include <string>
#include <vector>

#include "CatalogueTestSupport.h"

namespace qv {
namespace {

using test::RecordingStatus;

class GameTreeBuilderTest : public ::testing::Test {
protected:
    MyClass& Record(const std::string& romFile, const std::string& title, bool working = true,
                    bool present = true) {
        MyClass& record = *records.Add(romFile);
        record.RomFile = romFile;
        record.Title = title;
        record.Working = working;
        record.Present = present;
        return record;
    }
    MyClass& Entry(const std::string& romFile, const std::string& title,
                   const std::string& category) {
        MyClass& entry = *library.Add(romFile);
        entry.RomFile = romFile;
        entry.Title = title;
        entry.Category = category;
        return entry;
    }
    void Build() { BuildGameTree(tree, records, library, options, SnapshotIndex(snap.path().string())); }
    const TreeNode& NodeOf(const std::string& key) const {
        const NodeId id = tree.Find(key);
        EXPECT_NE(id, NoNode) << key;
        static const TreeNode missing{};
        return id == NoNode ? missing : tree.Node(id);
    }

    test::TempDir snap;
    MyClass records;
    MyClass library;
    Options options;
    GameTree tree;
};

TEST_F(GameTreeBuilderTest, SnapshotIndexListsFolderOnceAndMissingFolderIsEmpty) {
    snap.Write("pacman.png", "png");
    snap.Write("sub/galaga.png", "png");  // not in the folder itself
    std::filesystem::create_directories(snap / "folder.png");  // a folder, not a screenshot
    const SnapshotIndex index(snap.path().string());
    EXPECT_TRUE(index.Has("pacman.png"));
    EXPECT_FALSE(index.Has("PACMAN.png"));
    EXPECT_FALSE(index.Has("galaga.png"));
    EXPECT_FALSE(index.Has("folder.png"));

    const SnapshotIndex missing((snap / "nope").string());
    EXPECT_FALSE(missing.Has("pacman.png"));
    EXPECT_EQ(SnapshotIndex::PngName("pacman.zip"), "pacman.png");
    EXPECT_EQ(SnapshotIndex::PngName("PacMan.ZIP"), "PacMan.ZIP");  // the marker is exact
}

TEST_F(GameTreeBuilderTest, RootsCarryKeysTextsImagesAndChildCounts) {
    Entry("pacman.zip", "Pac-Man", "Maze");
    Entry("dkong.zip", "Donkey Kong", "Maze");
    Entry("galaga.zip", "Galaga", "Shooter");
    Entry("mystery.zip", "Mystery", "");
    Record("pacman.zip", "Pac-Man");
    Record("dkong.zip", "Donkey Kong");
    Record("mystery.zip", "Mystery");
    Build();

    EXPECT_EQ(NodeOf("alpha_").Text, " Alphabetical (3)");
    EXPECT_EQ(NodeOf("Maze_").Text, "Maze (2)");
    EXPECT_EQ(NodeOf("Maze_").Image + NodeOf("Maze_").ExpandedImage, "fclosedfopen");
    // No record of Galaga, and Mystery has no category: no further roots.
    EXPECT_EQ(tree.Find("Shooter_"), NoNode);
    EXPECT_EQ(tree.ChildCount(NoNode), 2);
    EXPECT_EQ(tree.Count(), 2 + 3 + 2);

    const TreeNode& game = NodeOf("Maze_pacman.zip");
    EXPECT_EQ(game.Text + "|" + game.Tag + "|" + game.ExpandedImage, "Pac-Man|pacman.zip|");
    EXPECT_EQ(game.Parent, tree.Find("Maze_"));
}

TEST_F(GameTreeBuilderTest, GameColoursFollowWorkingPresentAndScreenshot) {
    snap.Write("pacman.png", "png");
    Entry("pacman.zip", "Pac-Man", "Maze");
    MyClass& pacman = Record("pacman.zip", "Pac-Man");
    Record("galaga.zip", "Galaga");
    Record("dkong.zip", "Donkey Kong", /*working=*/false);
    snap.Write("frogger.png", "png");
    Record("Frogger.zip", "Frogger");  // the screenshot name keeps the record's case
    Build();
    // Colour and picture of each node in one text.
    const auto look = [&](const std::string& key) {
        return std::to_string(NodeOf(key).Colour.r) + "," + std::to_string(NodeOf(key).Colour.g) +
               "," + std::to_string(NodeOf(key).Colour.b) + " " + NodeOf(key).Image;
    };
    EXPECT_EQ(look("alpha_Frogger.zip"), "128,128,255 good");  // light blue: no screenshot
    EXPECT_EQ(look("alpha_pacman.zip"), "0,0,0 good");
    EXPECT_EQ(look("Maze_pacman.zip"), "0,0,0 good");
    EXPECT_EQ(look("alpha_galaga.zip"), "128,128,255 good");
    EXPECT_EQ(look("alpha_dkong.zip"), "255,0,0 bad");

    // The archive goes missing: grey, "bad", and the record is now not working.
    pacman.Present = false;
    Build();
    EXPECT_EQ(look("alpha_pacman.zip"), "128,128,128 bad");
    EXPECT_EQ(look("Maze_pacman.zip"), "128,128,128 bad");
    EXPECT_FALSE(pacman.Working);
}

TEST_F(GameTreeBuilderTest, HiddenAndWorkingFilters) {
    Entry("pacman.zip", "Pac-Man", "Maze");
    Entry("hidden.zip", "Hidden Game", "Maze");
    Entry("broken.zip", "Broken Game", "Maze");
    Record("pacman.zip", "Pac-Man");
    Record("hidden.zip", "Hidden Game").Hidden = true;
    Record("broken.zip", "Broken Game", /*working=*/false);

    Build();
    EXPECT_EQ(tree.Find("Maze_hidden.zip"), NoNode);
    EXPECT_NE(tree.Find("Maze_broken.zip"), NoNode);
    EXPECT_EQ(NodeOf("Maze_").Text, "Maze (2)");

    options.ShowHidden = true;
    Build();
    EXPECT_NE(tree.Find("Maze_hidden.zip"), NoNode);

    options.ShowWorking = true;
    Build();
    EXPECT_EQ(tree.Find("Maze_broken.zip"), NoNode);
    EXPECT_EQ(NodeOf("alpha_").Text, " Alphabetical (2)");
}

TEST_F(GameTreeBuilderTest, OddRecordsUnknownRemovedAndUnderscoreNamed) {
    options.ShowWorking = true;
    // Unidentified: still named by its file, no category, survives both filters.
    MyClass& unknown = Record("unknown.zip", "unknown.zip", /*working=*/false);
    unknown.Hidden = true;
    // Removed during an earlier run: never shown, even with hidden games shown.
    Entry("pacman.zip", "Pac-Man", "Maze");
    Record("pacman.zip", "^pacman.zip").RomFile = "^pacman.zip";
    Record("odd_", "Odd Game");  // a name ending in "_" is a game, not a root
    Build();
    EXPECT_EQ(NodeOf("alpha_unknown.zip").Text, "unknown.zip");
    EXPECT_EQ(NodeOf("alpha_unknown.zip").Colour, colours::Red);
    EXPECT_EQ(NodeOf("alpha_odd_").Text, "Odd Game");
    EXPECT_EQ(NodeOf("alpha_").Text, " Alphabetical (2)");
    EXPECT_EQ(tree.Count(), 3);
}

TEST_F(GameTreeBuilderTest, RebuildReplacesEverythingIncludingAllGamesRoot) {
    Entry("pacman.zip", "Pac-Man", "Maze");
    Record("pacman.zip", "Pac-Man");
    Build();
    RecordingStatus status;
    NoEventYield yield;
    ASSERT_TRUE(AddAllEmulatedGames(tree, library, records, SnapshotIndex(), status, yield));
    Build();
    EXPECT_EQ(tree.Find("MAME.ROMS"), NoNode);
    EXPECT_EQ(NodeOf("Maze_").Text, "Maze (1)");  // counted once, not " (1) (1)"
}

TEST_F(GameTreeBuilderTest, AddGameNodeIgnoresEmptyGroupAndDuplicates) {
    const SnapshotIndex none;
    AddGameNode(tree, none, "", "pacman.zip", "Pac-Man", true, true);
    AddGameNode(tree, none, "Maze", "pacman.zip", "Pac-Man", true, true);
    AddGameNode(tree, none, "maze", "PACMAN.ZIP", "Other", false, false);
    EXPECT_EQ(tree.Count(), 2);
    EXPECT_EQ(NodeOf("Maze_").Text, "Maze");  // the root is created without a count
    EXPECT_EQ(NodeOf("Maze_pacman.zip").Text, "Pac-Man");
}

TEST_F(GameTreeBuilderTest, AllGamesNodesColouredByOwnershipAndScreenshot) {
    snap.Write("pacman.png", "png");
    snap.Write("galaga.png", "png");
    Entry("PACMAN.zip", "Pac-Man", "Maze");   // lower-cased for the screenshot name
    Entry("galaga.zip", "Galaga", "Shooter");
    Entry("dkong.zip", "Donkey Kong", "Maze");
    Entry("mspacman.zip", "Ms. Pac-Man", "Maze");
    Entry("frogger.zip", "Frogger", "Maze");
    Record("PACMAN.zip", "Pac-Man");                                  // owned, present, shot
    Record("dkong.zip", "Donkey Kong");                               // owned, present, no shot
    Record("mspacman.zip", "Ms. Pac-Man", true, /*present=*/false);  // owned, missing
    RecordingStatus status;
    NoEventYield yield;
    ASSERT_TRUE(AddAllEmulatedGames(tree, library, records, SnapshotIndex(snap.path().string()),
                                    status, yield));

    EXPECT_EQ(NodeOf("MAME.ROMS").Text, "All MAME ROMs");
    EXPECT_EQ(tree.ChildCount(tree.Find("MAME.ROMS")), 5);
    EXPECT_EQ(NodeOf("MAME.ROMS_PACMAN.zip").Tag, "PACMAN.zip");
    const struct { const char* key; Rgb colour; const char* image; } rows[] = {
        {"PACMAN.zip", colours::Black, "good"},   {"dkong.zip", colours::LightBlue, "good"},
        {"mspacman.zip", colours::Grey, ""},      {"galaga.zip", colours::Blue, "bad"},
        {"frogger.zip", colours::Grey, "bad"},
    };
    for (const auto& row : rows) {
        SCOPED_TRACE(row.key);
        EXPECT_EQ(NodeOf(std::string("MAME.ROMS_") + row.key).Colour, row.colour);
        EXPECT_EQ(NodeOf(std::string("MAME.ROMS_") + row.key).Image, row.image);
    }
    EXPECT_TRUE(status.texts.empty());  // fewer than 100 entries: no progress
    EXPECT_EQ(yield.yields, 0);
    // The root is added only once.
    const auto count = tree.Count();
    EXPECT_FALSE(AddAllEmulatedGames(tree, library, records, SnapshotIndex(), status, yield));
    EXPECT_EQ(tree.Count(), count);
}

TEST_F(GameTreeBuilderTest, AllGamesReportsProgressEveryHundredEntries) {
    for (int i = 0; i < 250; ++i) Entry("g" + std::to_string(i) + ".zip", "Game", "Maze");
    RecordingStatus status;
    NoEventYield yield;
    AddAllEmulatedGames(tree, library, records, SnapshotIndex(), status, yield);
    EXPECT_EQ(status.texts, (std::vector<std::string>{"Adding all MAME ROMs ... 40%",
                                                      "Adding all MAME ROMs ... 80%"}));
    EXPECT_EQ(yield.yields, 2);
    EXPECT_EQ(tree.ChildCount(tree.Find("MAME.ROMS")), 250);

    // With the wait window closed the events still run, but no status is set.
    GameTree other;
    RecordingStatus hidden;
    hidden.visible = false;
    AddAllEmulatedGames(other, library, records, SnapshotIndex(), hidden, yield);
    EXPECT_TRUE(hidden.texts.empty());
    EXPECT_EQ(yield.yields, 4);
}

// A window event during the yield rebuilds the tree; the fill must stop rather than add
// nodes under whatever node now has the old root's id.
class RebuildingYield final : public EventYield {
public:
    explicit RebuildingYield(std::function<void()> onYield) : onYield_(std::move(onYield)) {}
    void Yield() override { onYield_(); }
private:
    std::function<void()> onYield_;
};

TEST_F(GameTreeBuilderTest, AllGamesStopsWhenTreeIsRebuiltDuringYield) {
    for (int i = 0; i < 300; ++i) Entry("g" + std::to_string(i) + ".zip", "Game", "Maze");
    Record("g1.zip", "Game");
    NoStatusDisplay status;
    RebuildingYield yield([&] { Build(); });
    AddAllEmulatedGames(tree, library, records, SnapshotIndex(), status, yield);
    EXPECT_EQ(tree.Find("MAME.ROMS"), NoNode);
    EXPECT_EQ(tree.ChildCount(tree.Find("alpha_")), 1);
    EXPECT_EQ(tree.ChildCount(tree.Find("Maze_")), 1);
    EXPECT_EQ(tree.Count(), 4);
}

TEST_F(GameTreeBuilderTest, AllGamesSurvivesLibraryEmptiedDuringYield) {
    for (int i = 0; i < 300; ++i) Entry("g" + std::to_string(i) + ".zip", "Game", "Maze");
    NoStatusDisplay status;
    RebuildingYield yield([&] { library.Clear(); });
    EXPECT_TRUE(AddAllEmulatedGames(tree, library, records, SnapshotIndex(), status, yield));
    EXPECT_EQ(tree.ChildCount(tree.Find("MAME.ROMS")), 100);
}

}  // namespace
}  // namespace qv
