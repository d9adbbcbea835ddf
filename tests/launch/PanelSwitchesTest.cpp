#include "launch/PanelSwitches.h"

#include <gtest/gtest.h>

#include "support/TempDir.h"

namespace qv {
namespace {

class PanelSwitchesTest : public ::testing::Test {
protected:
    PanelSwitchesTest() {
        MyClass& game = *records_.Add("pacman.zip");
        game.RomFile = "pacman.zip";
        game.Present = true;
        node_ = tree_.Add(NoNode, "All.pacman.zip", "Pac-Man", "bad");
        options_.Rate0 = "No opinion";
        options_.Rate1 = "It sucks!";
        options_.Rate5 = "This game rocks!";
    }
    MyClass& Game() { return *records_.Item("pacman.zip"); }
    void SelectGame() { state_.selectedGameKey = "pacman.zip"; }
    SwitchResult Click(PanelSwitch which) { return switches_.Click(which, tree_, node_); }

    test::TempDir temp_;
    MyClass records_;
    Options options_;
    DetailsState state_;
    GameTree tree_;
    NodeId node_;
    PanelSwitches switches_{state_, records_, options_};
};

TEST_F(PanelSwitchesTest, GuardedSwitchesOnlySpeakWithoutGameOrEditing) {
    EXPECT_EQ(Click(PanelSwitch::Mouse).spoken, "Mouse disabled");
    EXPECT_EQ(Click(PanelSwitch::Hidden).spoken, "Not hidden");
    EXPECT_EQ(Click(PanelSwitch::Working).spoken, "Not working");
    EXPECT_FALSE(state_.mouse.on);

    SelectGame();
    options_.Edit = false;
    EXPECT_EQ(Click(PanelSwitch::Mouse).spoken, "Mouse disabled");
    EXPECT_FALSE(state_.mouse.on);
    EXPECT_FALSE(Game().Mouse);

    state_.working.on = true;
    SwitchResult result = Click(PanelSwitch::Working);
    EXPECT_EQ(result.spoken, "Working");
    EXPECT_TRUE(result.nodeChanged);
    EXPECT_EQ(tree_.Node(node_).Image, "good");
    EXPECT_TRUE(state_.working.on);
    EXPECT_FALSE(Game().Working);
}

TEST_F(PanelSwitchesTest, MouseAndHiddenFlipStoreAndSpeak) {
    SelectGame();
    EXPECT_EQ(Click(PanelSwitch::Mouse).spoken, "Mouse enabled");
    EXPECT_TRUE(state_.mouse.on);
    EXPECT_TRUE(Game().Mouse);
    EXPECT_EQ(state_.mouse.label, (PanelText{"Mouse On", colours::Green}));
    EXPECT_EQ(Click(PanelSwitch::Mouse).spoken, "Mouse disabled");
    EXPECT_FALSE(Game().Mouse);
    EXPECT_EQ(state_.mouse.label, (PanelText{"Mouse Off", colours::Red}));

    EXPECT_EQ(Click(PanelSwitch::Hidden).spoken, "Hidden");
    EXPECT_TRUE(Game().Hidden);
    EXPECT_EQ(state_.hidden.label, (PanelText{"Hidden", colours::Green}));
    EXPECT_EQ(Click(PanelSwitch::Hidden).spoken, "Not hidden");
    EXPECT_EQ(state_.hidden.label, (PanelText{"Not Hidden", colours::Red}));
}

TEST_F(PanelSwitchesTest, WorkingNeedsThePresentArchiveAndRecolorsTheNode) {
    SelectGame();
    Game().Present = false;
    state_.play = PlayImage::Disabled;
    EXPECT_EQ(Click(PanelSwitch::Working).spoken, "Cannot find ROM file!");
    EXPECT_FALSE(state_.working.on);
    EXPECT_FALSE(Game().Working);

    Game().Present = true;
    tree_.SetColour(node_, colours::Red);
    SwitchResult on = Click(PanelSwitch::Working);
    EXPECT_EQ(on.spoken, "Working");
    EXPECT_TRUE(on.nodeChanged);
    EXPECT_TRUE(Game().Working);
    EXPECT_EQ(state_.working.label, (PanelText{"Working", colours::Green}));
    EXPECT_EQ(tree_.Node(node_).Image, "good");
    EXPECT_EQ(tree_.Node(node_).Colour, colours::Black);
    EXPECT_EQ(state_.play, PlayImage::Normal);

    // Switching off is allowed even when the archive went missing.
    Game().Present = false;
    SwitchResult off = Click(PanelSwitch::Working);
    EXPECT_EQ(off.spoken, "Not Working");
    EXPECT_FALSE(Game().Working);
    EXPECT_EQ(state_.working.label, (PanelText{"Not Working", colours::Red}));
    EXPECT_EQ(tree_.Node(node_).Image, "bad");
    EXPECT_EQ(tree_.Node(node_).Colour, colours::Red);
    EXPECT_EQ(state_.play, PlayImage::Disabled);
}

TEST_F(PanelSwitchesTest, GameWithoutRecordIsNotEdited) {
    state_.selectedGameKey = "offered.zip";  // a ROM-server game the user does not own
    EXPECT_EQ(Click(PanelSwitch::Mouse).spoken, "Mouse disabled");
    EXPECT_FALSE(state_.mouse.on);
    EXPECT_EQ(switches_.ClickRating(), "No opinion");
    EXPECT_EQ(state_.rating, 0);
}

TEST_F(PanelSwitchesTest, CheatsNeedAnExistingCheatsFile) {
    EXPECT_EQ(Click(PanelSwitch::Cheats).spoken, "No cheats file identified.");
    options_.CheatsFile = (temp_.path() / "cheat.dat").string();
    EXPECT_EQ(Click(PanelSwitch::Cheats).spoken, "Cannot find cheats file.");
    EXPECT_FALSE(state_.cheats.on);

    temp_.Write("cheat.dat", "x");
    EXPECT_EQ(Click(PanelSwitch::Cheats).spoken, "Cheats enabled");
    EXPECT_EQ(state_.cheats.label, (PanelText{"Cheats On", colours::Green}));
    EXPECT_TRUE(state_.Run().Cheats);
    options_.CheatsFile.clear();  // switching off never needs the file
    EXPECT_EQ(Click(PanelSwitch::Cheats).spoken, "Cheats disabled");
    EXPECT_EQ(state_.cheats.label, (PanelText{"Cheats Off", colours::Red}));
    EXPECT_FALSE(state_.Run().Cheats);
}

TEST_F(PanelSwitchesTest, ArtworkNeedsTheMark) {
    EXPECT_EQ(Click(PanelSwitch::Artwork).spoken, "Can not find artwork");
    EXPECT_FALSE(state_.artwork.on);
    state_.artworkMark = true;
    EXPECT_EQ(Click(PanelSwitch::Artwork).spoken, "Artwork Enabled");
    EXPECT_EQ(state_.artwork.label, (PanelText{"Use Artwork", colours::Green}));
    EXPECT_TRUE(state_.Run().Artwork);
    EXPECT_EQ(Click(PanelSwitch::Artwork).spoken, "Artwork disabled");
    EXPECT_EQ(state_.artwork.label, (PanelText{"No Artwork", colours::Red}));
}

TEST_F(PanelSwitchesTest, SoundAndJoystickChangeOptionsWithoutAGame) {
    options_.Sound = false;
    EXPECT_EQ(Click(PanelSwitch::Sound).spoken, "Sound enabled");
    EXPECT_TRUE(options_.Sound);
    EXPECT_EQ(state_.sound.label, (PanelText{"Sound On", colours::Green}));
    EXPECT_EQ(Click(PanelSwitch::Sound).spoken, "Sound disabled");
    EXPECT_FALSE(options_.Sound);
    EXPECT_EQ(state_.sound.label, (PanelText{"Sound Off", colours::Red}));

    options_.Joystick = false;
    EXPECT_EQ(Click(PanelSwitch::Joystick).spoken, "Joystick enabled");
    EXPECT_TRUE(options_.Joystick);
    EXPECT_EQ(state_.joystick.label, (PanelText{"Joystick On", colours::Green}));
    EXPECT_EQ(Click(PanelSwitch::Joystick).spoken, "Joystick disabled");
    EXPECT_FALSE(options_.Joystick);
}

TEST_F(PanelSwitchesTest, PriorityAndWindowOnlyColourTheirFixedLabels) {
    SwitchResult result = Click(PanelSwitch::Priority);
    EXPECT_TRUE(result.spoken.empty());
    EXPECT_EQ(state_.priority.label, (PanelText{"High Priority", colours::Green}));
    EXPECT_TRUE(state_.Run().Priority);
    Click(PanelSwitch::Priority);
    EXPECT_EQ(state_.priority.label, (PanelText{"High Priority", colours::Red}));

    Click(PanelSwitch::Window);
    EXPECT_EQ(state_.window.label, (PanelText{"Windowed", colours::Green}));
    EXPECT_TRUE(state_.Run().Window);
    EXPECT_FALSE(state_.Run().Priority);
}

TEST_F(PanelSwitchesTest, RatingAdvancesWrapsAndStoresAsterisks) {
    SelectGame();
    EXPECT_EQ(switches_.ClickRating(), "It sucks!");
    EXPECT_EQ(Game().Rating, "*");
    state_.rating = 4;
    EXPECT_EQ(switches_.ClickRating(), "This game rocks!");
    EXPECT_EQ(Game().Rating, "*****");
    EXPECT_EQ(switches_.ClickRating(), "No opinion");
    EXPECT_EQ(state_.rating, 0);
    EXPECT_EQ(Game().Rating, "");
}

TEST_F(PanelSwitchesTest, RatingWithoutGameOrEditingOnlySpeaksTheShownLevel) {
    state_.rating = 5;
    EXPECT_EQ(switches_.ClickRating(), "This game rocks!");
    EXPECT_EQ(state_.rating, 5);

    SelectGame();
    options_.Edit = false;
    Game().Rating = "**";
    EXPECT_EQ(switches_.ClickRating(), "This game rocks!");
    EXPECT_EQ(Game().Rating, "**");
}

}  // namespace
}  // namespace qv
