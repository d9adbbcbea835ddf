#include "launch/PanelSwitches.h"

#include <gtest/gtest.h>

#include <functional>

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
    state_.selectedGameKey = "offered.zip";  // a ROM-server game the user does not own
    EXPECT_EQ(Click(PanelSwitch::Mouse).spoken, "Mouse disabled");
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

// Each two-state switch, allowed to change: on, then off, with its words and its stored value.
TEST_F(PanelSwitchesTest, SwitchesFlipStoreSpeakAndRelabel) {
    SelectGame();
    temp_.Write("cheat.dat", "x");
    options_.CheatsFile = (temp_.path() / "cheat.dat").string();
    state_.artworkMark = true;
    options_.Sound = options_.Joystick = false;
    const struct {
        PanelSwitch which;
        SwitchView DetailsState::*view;
        std::function<bool()> stored;
        const char *onSaid, *onLabel, *offSaid, *offLabel;
    } rows[] = {
        {PanelSwitch::Mouse, &DetailsState::mouse, [&] { return Game().Mouse; }, "Mouse enabled",
         "Mouse On", "Mouse disabled", "Mouse Off"},
        {PanelSwitch::Hidden, &DetailsState::hidden, [&] { return Game().Hidden; }, "Hidden",
         "Hidden", "Not hidden", "Not Hidden"},
        {PanelSwitch::Sound, &DetailsState::sound, [&] { return options_.Sound; },
         "Sound enabled", "Sound On", "Sound disabled", "Sound Off"},
        {PanelSwitch::Joystick, &DetailsState::joystick, [&] { return options_.Joystick; },
         "Joystick enabled", "Joystick On", "Joystick disabled", "Joystick Off"},
        {PanelSwitch::Cheats, &DetailsState::cheats, [&] { return state_.Run().Cheats; },
         "Cheats enabled", "Cheats On", "Cheats disabled", "Cheats Off"},
        {PanelSwitch::Artwork, &DetailsState::artwork, [&] { return state_.Run().Artwork; },
         "Artwork Enabled", "Use Artwork", "Artwork disabled", "No Artwork"},
    };
    for (const auto& row : rows) {
        SCOPED_TRACE(row.onSaid);
        EXPECT_EQ(Click(row.which).spoken, row.onSaid);
        EXPECT_TRUE(row.stored());
        EXPECT_EQ((state_.*row.view).label, (PanelText{row.onLabel, colours::Green}));
        EXPECT_EQ(Click(row.which).spoken, row.offSaid);
        EXPECT_FALSE(row.stored());
        EXPECT_EQ((state_.*row.view).label, (PanelText{row.offLabel, colours::Red}));
    }
}

TEST_F(PanelSwitchesTest, CheatsNeedTheFileArtworkNeedsTheMark) {
    EXPECT_EQ(Click(PanelSwitch::Cheats).spoken, "No cheats file identified.");
    options_.CheatsFile = (temp_.path() / "cheat.dat").string();
    EXPECT_EQ(Click(PanelSwitch::Cheats).spoken, "Cannot find cheats file.");
    EXPECT_FALSE(state_.cheats.on);
    state_.cheats.on = true;
    options_.CheatsFile.clear();  // switching off never needs the file
    EXPECT_EQ(Click(PanelSwitch::Cheats).spoken, "Cheats disabled");

    EXPECT_EQ(Click(PanelSwitch::Artwork).spoken, "Can not find artwork");
    EXPECT_FALSE(state_.artwork.on);
}

TEST_F(PanelSwitchesTest, PriorityAndWindowOnlyColourTheirFixedLabels) {
    EXPECT_TRUE(Click(PanelSwitch::Priority).spoken.empty());
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
    state_.selectedGameKey = "offered.zip";  // no record behind it
    EXPECT_EQ(switches_.ClickRating(), "No opinion");
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
