#include "launch/DetailsSelection.h"

#include <gtest/gtest.h>

#include <fstream>

#include "support/TempDir.h"

namespace qv {
namespace {

struct Details {
    Details() {
        folder_ = tree_.Add(NoNode, "All", "All Games (3)", "fclosed", "fopen");
        options_.ArtworkDir = (temp_.path() / "artwork").string();
        std::filesystem::create_directories(options_.ArtworkDir);
    }

    MyClass& Owned(const std::string& key, const std::string& title) {
        MyClass& game = *records_.Add(key);
        game.RomFile = key;
        game.Title = title;
        game.Present = true;
        game.Working = true;
        game.FileSize = 2048;
        return game;
    }
    MyClass& Library(const std::string& key, const std::string& title) {
        MyClass& entry = *library_.Add(key);
        entry.RomFile = key;
        entry.Title = title;
        return entry;
    }
    NodeId GameNode(const std::string& key) {
        NodeId id = tree_.Add(folder_, "All." + key, key, "good");
        tree_.SetTag(id, key);
        return id;
    }
    SelectionResult Select(NodeId node) {
        SelectionSources sources{records_, library_, options_, host_, regional_,
                                 [this](const std::string& key) {
                                     asked_ = key;
                                     return fps_;
                                 },
                                 executableFound_};
        return SelectNode(state_, tree_, node, sources);
    }

    test::TempDir temp_;
    MyClass records_, library_;
    Options options_;
    HostConventions host_ = HostConventions::Posix();
    EnglishRegional regional_;
    GameTree tree_;
    NodeId folder_;
    DetailsState state_;
    std::string fps_ = "FPS: Not available";
    std::string asked_;
    bool executableFound_ = true;
};

struct DetailsSelectionTest : ::testing::Test, Details {};

TEST_F(DetailsSelectionTest, OwnedGameFillsEveryLine) {
    MyClass& game = Owned("pacman.zip", "Pac-Man");
    game.Year = "1980";
    game.Company = "Namco";
    game.Plays = 3;
    game.PlaySeconds = 3600000;
    game.LastPlayed = "3/17/2004 3:30:00 PM";
    game.Rating = "***";
    MyClass& entry = Library("pacman.zip", "Pac-Man");
    entry.Category = "Maze";
    entry.MameVersion = "0.37b5";
    entry.EmuWorking = true;
    entry.EmuColors = true;
    fps_ = "FPS: 59.924";

    SelectionResult result = Select(GameNode("pacman.zip"));

    EXPECT_TRUE(result.gameShown);
    EXPECT_EQ(state_.titleCaption, "Pac-Man");
    EXPECT_EQ(state_.titleTooltip, "Pac-Man");
    EXPECT_EQ(state_.maker, (PanelText{"(C) 1980, Namco", colours::Green}));
    EXPECT_EQ(state_.category.text, "Category: Maze");
    EXPECT_EQ(state_.archive, (PanelText{"ROM: pacman.zip, 2 KB, 0.37b5", colours::Green}));
    EXPECT_EQ(state_.plays,
              (PanelText{"3 plays (60,000 min), Last Played: 3/17/2004 3:30:00 PM", colours::Green}));
    EXPECT_EQ(asked_, "pacman.zip");
    EXPECT_EQ(state_.frameRate, (PanelText{"FPS: 59.924", colours::Green}));
    EXPECT_EQ(state_.emuWorking, colours::Green);
    EXPECT_EQ(state_.emuSound, colours::Red);
    EXPECT_EQ(state_.emuColors, colours::Green);
    EXPECT_EQ(state_.emuScreenFlip, colours::Red);
    EXPECT_EQ(state_.rating, 3);
    EXPECT_EQ(state_.selectedGameKey, "pacman.zip");
    EXPECT_EQ(result.titleToSpeak, "Pac-Man");
    EXPECT_EQ(result.textView, TextViewRefresh::All);
    EXPECT_TRUE(result.refreshPictures);
}

// One line of the panel for one owned game, set up by the row.
TEST(DetailsSelectionRules, PanelLinesFollowTheirFormattingRules) {
    using Set = void (*)(MyClass&);
    using Get = std::string (*)(const DetailsState&);
    const Get plays = [](const DetailsState& s) { return s.plays.text; };
    const Get maker = [](const DetailsState& s) { return s.maker.text; };
    const Get title = [](const DetailsState& s) { return s.titleCaption; };
    const Get rating = [](const DetailsState& s) { return std::to_string(s.rating); };
    const Get resolution = [](const DetailsState& s) { return s.resolution; };
    const struct {
        Set set;
        Get get;
        std::string expected;
    } rows[] = {
        {[](MyClass& g) { g.LastPlayed = "x"; }, plays, "Never played"},
        {[](MyClass& g) { g.Plays = 1, g.PlaySeconds = 89, g.LastPlayed = "x"; }, plays,
         "1 play (1 min), Last Played: x"},
        {[](MyClass& g) { g.Plays = 2, g.PlaySeconds = 29, g.LastPlayed = "x"; }, plays,
         "2 plays (0 min), Last Played: x"},
        {[](MyClass& g) { g.Company = "Acme"; }, maker, "Manufacturer information not available"},
        {[](MyClass& g) { g.Year = "1982", g.Company = "Cops & Co"; }, maker,
         "(C) 1982, Cops && Co"},
        {[](MyClass& g) { g.Title = std::string(40, 'x'); }, title, std::string(40, 'x')},
        {[](MyClass& g) { g.Title = std::string(41, 'y'); }, title, std::string(40, 'y') + "..."},
        {[](MyClass& g) { g.Title = "Tom & Jerry " + std::string(27, 'z'); }, title,
         "Tom && Jerry " + std::string(27, 'z')},
        {[](MyClass& g) { g.Title = "Tom & Jerry " + std::string(27, 'z') + "!"; }, title,
         "Tom && Jerry " + std::string(27, 'z') + "..."},
        {[](MyClass& g) { g.Rating = "*****"; }, rating, "5"},
        {[](MyClass& g) { g.Rating = "******"; }, rating, "0"},
        {[](MyClass& g) { g.Resolution = "640 x 480"; }, resolution, "640 x 480"},
        {[](MyClass&) {}, resolution, "Auto"},
    };
    for (const auto& row : rows) {
        SCOPED_TRACE(row.expected);
        Details d;
        MyClass& game = d.Owned("a.zip", "A");
        row.set(game);
        d.Select(d.GameNode("a.zip"));
        EXPECT_EQ(row.get(d.state_), row.expected);
        if (row.get == resolution) { EXPECT_EQ(game.Resolution, row.expected); }  // stored too
    }
    Details d;
    d.Owned("a.zip", std::string(41, 'y'));
    d.Select(d.GameNode("a.zip"));
    EXPECT_EQ(d.state_.titleTooltip, std::string(41, 'y'));  // the tooltip keeps it whole
}

TEST_F(DetailsSelectionTest, WithoutLibraryEntryStatusIsRedAndCategoryStays) {
    Owned("a.zip", "A");
    state_.category.text = "Category: Maze";
    Select(GameNode("a.zip"));
    EXPECT_EQ(state_.category.text, "Category: Maze");
    EXPECT_EQ(state_.emuWorking, colours::Red);
    EXPECT_EQ(state_.emuScreenFlip, colours::Red);
    EXPECT_EQ(state_.archive.text, "ROM: a.zip, 2 KB");

    Owned("b.zip", "B");
    Library("b.zip", "B");
    Select(GameNode("b.zip"));
    EXPECT_EQ(state_.category.text, "Category: None");
}

TEST_F(DetailsSelectionTest, WorkingFlagSetsSwitchNodeAndPlayImage) {
    MyClass& game = Owned("a.zip", "A");
    game.Mouse = true;
    NodeId node = GameNode("a.zip");
    Select(node);
    EXPECT_TRUE(state_.working.on);
    EXPECT_EQ(state_.working.label, (PanelText{"Working", colours::Green}));
    EXPECT_EQ(state_.mouse.label, (PanelText{"Mouse On", colours::Green}));
    EXPECT_EQ(state_.hidden.label, (PanelText{"Not Hidden", colours::Red}));
    EXPECT_EQ(tree_.Node(node).Image, "good");
    EXPECT_EQ(state_.play, PlayImage::Normal);

    game.Working = false;
    game.Hidden = true;
    game.Present = false;
    Select(node);
    EXPECT_FALSE(state_.working.on);
    EXPECT_EQ(state_.working.label, (PanelText{"Not Working", colours::Red}));
    EXPECT_EQ(state_.hidden.label, (PanelText{"Hidden", colours::Green}));
    EXPECT_EQ(tree_.Node(node).Image, "bad");
    EXPECT_EQ(state_.play, PlayImage::Disabled);
    EXPECT_EQ(state_.archive.colour, colours::Red);

    game.Working = game.Present = true;
    executableFound_ = false;  // no emulator: nothing can be played
    Select(node);
    EXPECT_EQ(state_.play, PlayImage::Disabled);
}

TEST_F(DetailsSelectionTest, ArtworkArchiveSetsMarkOtherwiseArtworkIsForcedOff) {
    Owned("art.zip", "Art");
    Owned("plain.zip", "Plain");
    std::ofstream(std::filesystem::path(options_.ArtworkDir) / "art.zip") << "zip";
    NodeId art = GameNode("art.zip");
    NodeId plain = GameNode("plain.zip");

    Select(art);
    EXPECT_TRUE(state_.artworkMark);
    state_.artwork = {true, {"Use Artwork", colours::Green}};
    Select(art);
    EXPECT_TRUE(state_.artwork.on);  // left as it was

    Select(plain);
    EXPECT_FALSE(state_.artwork.on);
    EXPECT_EQ(state_.artwork.label, (PanelText{"No Artwork", colours::Red}));
    EXPECT_TRUE(state_.artworkMark);  // only ever set
}

TEST_F(DetailsSelectionTest, LibraryOnlyGameShowsOffSwitchesAndNoKey) {
    MyClass& entry = Library("galaga.zip", "Galaga");
    entry.Year = "1981";
    entry.Company = "Namco";
    NodeId node = GameNode("galaga.zip");
    Owned("a.zip", "A").Mouse = true;
    Select(GameNode("a.zip"));
    state_.frameRate.colour = colours::Blue;

    SelectionResult result = Select(node);
    EXPECT_TRUE(state_.selectedGameKey.empty());  // nothing to edit or run
    EXPECT_EQ(state_.maker.text, "(C) 1981, Namco");
    EXPECT_EQ(state_.plays, (PanelText{"Never played", colours::Red}));
    EXPECT_EQ(state_.archive, (PanelText{"ROM: galaga.zip, 0 KB", colours::Red}));
    EXPECT_EQ(state_.mouse.label, (PanelText{"Mouse Off", colours::Red}));
    EXPECT_EQ(tree_.Node(node).Image, "bad");
    EXPECT_EQ(state_.play, PlayImage::Disabled);
    EXPECT_EQ(state_.frameRate.colour, colours::Blue);  // colour left alone
    EXPECT_EQ(state_.resolution, "Auto");
    EXPECT_EQ(result.textView, TextViewRefresh::NotesHistoryInfo);
    EXPECT_EQ(result.titleToSpeak, "Galaga");
}

TEST_F(DetailsSelectionTest, FolderChangesNothingUnknownKeyClearsSelection) {
    Owned("a.zip", "A");
    Select(GameNode("a.zip"));
    DetailsState before = state_;

    SelectionResult result = Select(folder_);
    EXPECT_TRUE(result.folder);
    EXPECT_EQ(state_.selectedGameKey, "a.zip");
    EXPECT_EQ(state_.titleCaption, before.titleCaption);

    result = Select(GameNode("unknown.zip"));
    EXPECT_FALSE(result.gameShown);
    EXPECT_TRUE(state_.selectedGameKey.empty());
    EXPECT_EQ(state_.titleCaption, "A");
    EXPECT_TRUE(result.titleToSpeak.empty());
}

TEST_F(DetailsSelectionTest, RomServerGameSetsKeyAndShowsDownload) {
    NodeId server = tree_.Add(NoNode, RomServerParentKey, "ROM Server", "fclosed", "fopen");
    NodeId offered = tree_.Add(server, "Download.x.zip", "x.zip");
    tree_.SetTag(offered, "x.zip");
    Select(offered);
    EXPECT_TRUE(state_.downloadShown);
    EXPECT_EQ(state_.selectedGameKey, "x.zip");

    Owned("a.zip", "A");
    Select(GameNode("a.zip"));
    EXPECT_FALSE(state_.downloadShown);
}

TEST(CaptionDisplayText, DoubledAmpersandShowsOnceSingleOneIsAMarker) {
    EXPECT_EQ(CaptionDisplayText("Cops && Robbers"), "Cops & Robbers");
    EXPECT_EQ(CaptionDisplayText("&File"), "File");
    EXPECT_EQ(CaptionDisplayText("a&&&&b"), "a&&b");
}

}  // namespace
}  // namespace qv
