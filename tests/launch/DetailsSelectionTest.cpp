#include "launch/DetailsSelection.h"

#include <gtest/gtest.h>

#include <fstream>

#include "support/TempDir.h"

namespace qv {
namespace {

class DetailsSelectionTest : public ::testing::Test {
protected:
    DetailsSelectionTest() {
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

TEST_F(DetailsSelectionTest, PlaysLineSingularPluralAndRounding) {
    MyClass& game = Owned("a.zip", "A");
    NodeId node = GameNode("a.zip");
    game.LastPlayed = "x";

    Select(node);
    EXPECT_EQ(state_.plays, (PanelText{"Never played", colours::Red}));

    game.Plays = 1;
    game.PlaySeconds = 89;
    Select(node);
    EXPECT_EQ(state_.plays.text, "1 play (1 min), Last Played: x");

    game.Plays = 2;
    game.PlaySeconds = 29;
    Select(node);
    EXPECT_EQ(state_.plays.text, "2 plays (0 min), Last Played: x");
}

TEST_F(DetailsSelectionTest, MakerNeedsBothYearAndCompanyAndDoublesAmpersands) {
    MyClass& game = Owned("a.zip", "A");
    NodeId node = GameNode("a.zip");
    game.Company = "Acme";
    Select(node);
    EXPECT_EQ(state_.maker, (PanelText{"Manufacturer information not available", colours::Red}));

    game.Year = "1982";
    game.Company = "Cops & Co";
    Select(node);
    EXPECT_EQ(state_.maker.text, "(C) 1982, Cops && Co");
}

TEST_F(DetailsSelectionTest, TitleIsEscapedAndCutAfterFortyCharacters) {
    MyClass& game = Owned("a.zip", std::string(40, 'x'));
    NodeId node = GameNode("a.zip");
    Select(node);
    EXPECT_EQ(state_.titleCaption, std::string(40, 'x'));

    game.Title = std::string(41, 'y');
    Select(node);
    EXPECT_EQ(state_.titleCaption, std::string(40, 'y') + "...");
    EXPECT_EQ(state_.titleTooltip, std::string(41, 'y'));

    // The doubled ampersands count towards the limit.
    game.Title = "Tom & Jerry " + std::string(27, 'z');  // 39 characters, 40 once escaped
    Select(node);
    EXPECT_EQ(state_.titleCaption, "Tom && Jerry " + std::string(27, 'z'));
    EXPECT_EQ(CaptionDisplayText(state_.titleCaption), game.Title);
    game.Title += "!";
    Select(node);
    EXPECT_EQ(state_.titleCaption, "Tom && Jerry " + std::string(27, 'z') + "...");
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
}

TEST_F(DetailsSelectionTest, MissingExecutableDisablesPlay) {
    Owned("a.zip", "A");
    executableFound_ = false;
    Select(GameNode("a.zip"));
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

TEST_F(DetailsSelectionTest, EmptyResolutionIsShownAndStoredAsAuto) {
    MyClass& game = Owned("a.zip", "A");
    NodeId node = GameNode("a.zip");
    Select(node);
    EXPECT_EQ(state_.resolution, "Auto");
    EXPECT_EQ(game.Resolution, "Auto");
    game.Resolution = "640 x 480";
    Select(node);
    EXPECT_EQ(state_.resolution, "640 x 480");
}

TEST_F(DetailsSelectionTest, RatingFromAsterisksTooManyShowsNone) {
    MyClass& game = Owned("a.zip", "A");
    NodeId node = GameNode("a.zip");
    game.Rating = "*****";
    Select(node);
    EXPECT_EQ(state_.rating, 5);
    game.Rating = "******";
    Select(node);
    EXPECT_EQ(state_.rating, 0);
}

TEST_F(DetailsSelectionTest, LibraryOnlyGameShowsOffSwitchesAndNoKey) {
    MyClass& entry = Library("galaga.zip", "Galaga");
    entry.Year = "1981";
    entry.Company = "Namco";
    entry.EmuSound = true;
    entry.FileSize = 0;
    NodeId node = GameNode("galaga.zip");
    state_.frameRate.colour = colours::Blue;
    state_.rating = 4;
    state_.resolution = "800 x 600";
    Owned("a.zip", "A").Mouse = true;
    Select(GameNode("a.zip"));
    state_.frameRate.colour = colours::Blue;

    SelectionResult result = Select(node);
    EXPECT_TRUE(state_.selectedGameKey.empty());
    EXPECT_EQ(state_.titleCaption, "Galaga");
    EXPECT_EQ(state_.maker.text, "(C) 1981, Namco");
    EXPECT_EQ(state_.plays, (PanelText{"Never played", colours::Red}));
    EXPECT_EQ(state_.archive, (PanelText{"ROM: galaga.zip, 0 KB", colours::Red}));
    EXPECT_EQ(state_.emuSound, colours::Green);
    EXPECT_FALSE(state_.working.on);
    EXPECT_FALSE(state_.mouse.on);
    EXPECT_EQ(state_.mouse.label, (PanelText{"Mouse Off", colours::Red}));
    EXPECT_EQ(tree_.Node(node).Image, "bad");
    EXPECT_EQ(state_.play, PlayImage::Disabled);
    EXPECT_EQ(state_.rating, 0);
    EXPECT_EQ(state_.frameRate.colour, colours::Blue);  // colour left alone
    EXPECT_EQ(state_.resolution, "Auto");                // from the owned game before
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
