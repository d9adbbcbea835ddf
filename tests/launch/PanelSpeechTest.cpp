#include "launch/PanelSpeech.h"

#include <gtest/gtest.h>

#include "launch/PanelSwitches.h"

namespace qv {
namespace {

TEST(PanelSpeech, ClickedTextsSpeakTheirSpokenForms) {
    DetailsState state;
    state.titleCaption = "Tom && Jerry...";
    state.titleTooltip = "Tom & Jerry II (Japan)";
    state.maker.text = "(C) 1982, Cops && Co";
    state.category.text = "Category: Maze";
    state.archive.text = "ROM: a.zip, 2 KB";
    state.plays.text = "Never played";
    state.frameRate.text = "FPS: 59.924";

    EXPECT_EQ(SpokenLabelText(PanelLabel::Title, state), "TOM & JERRY 2");
    EXPECT_EQ(SpokenLabelText(PanelLabel::Maker, state), "Copyright 1982, COPS and CO");
    EXPECT_EQ(SpokenLabelText(PanelLabel::Category, state), "Category: Maze");
    EXPECT_EQ(SpokenLabelText(PanelLabel::Archive, state), "ROM: a.zip, 2 KB");
    EXPECT_EQ(SpokenLabelText(PanelLabel::Plays, state), "Never played");
    EXPECT_EQ(SpokenLabelText(PanelLabel::FrameRate, state), "Frames per second : 59.924");
}

TEST(PlayButton, ActiveOnlyOverAWorkingGameAndDisabledStays) {
    DetailsState state;
    HoverPlay(state);
    EXPECT_EQ(state.play, PlayImage::Normal);  // working switch off

    state.working.on = true;
    HoverPlay(state);
    EXPECT_EQ(state.play, PlayImage::Active);
    RestorePlay(state);
    EXPECT_EQ(state.play, PlayImage::Normal);

    state.play = PlayImage::Disabled;
    HoverPlay(state);
    RestorePlay(state);
    EXPECT_EQ(state.play, PlayImage::Disabled);
}

}  // namespace
}  // namespace qv
