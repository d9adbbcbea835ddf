// The main window's voice: when it speaks, the voice check and its log lines.
#include <gtest/gtest.h>

#include "support/FixedLog.h"
#include "reference/Speaker.h"
#include "support/RecordingSpeechEngine.h"

namespace qv {
namespace {

class SpeakerTest : public ::testing::Test, protected test::LogFixture {
protected:
    SpeakerTest() { options.Speak = true; }
    Options options;
    test::RecordingSpeechEngine engine{3};
    Speaker speaker{engine, options, log};
};

TEST_F(SpeakerTest, SpeaksOnlyWhenReadySwitchedOnAndGivenText) {
    speaker.Speak("dropped while starting");
    speaker.SetReady(true);
    speaker.Speak("");
    options.Speak = false;
    speaker.Speak("dropped while off");
    EXPECT_TRUE(engine.spoken.empty());
    EXPECT_EQ(engine.stops, 0);  // an empty text does not cut off an utterance

    options.Speak = true;
    speaker.Speak("Pac-Man");
    speaker.Speak("Galaga");
    EXPECT_EQ(engine.spoken, (std::vector<std::string>{"Pac-Man", "Galaga"}));
    EXPECT_EQ(engine.stops, 2);  // every text stops the one before it
    EXPECT_EQ(LogText(), "");
}

TEST_F(SpeakerTest, EngineErrorIsLoggedAndSurvived) {
    speaker.SetReady(true);
    engine.saySucceeds = false;
    speaker.Speak("No audio here");
    EXPECT_NE(LogText().find(" *** PlayForm Speak Error\r\n"), std::string::npos);
    EXPECT_TRUE(options.Speak);  // only the voice check switches speech off
}

TEST_F(SpeakerTest, CheckVoiceClampsTheVoiceAndLogsItsDescriptions) {
    options.Voice = 9;
    EXPECT_TRUE(speaker.CheckVoice());
    EXPECT_EQ(options.Voice, 3);
    EXPECT_EQ(engine.selectedVoice, 3);
    const std::string text = LogText();
    EXPECT_NE(text.find("     Voice using: Voice 3 description 1\r\n"), std::string::npos);
    EXPECT_NE(text.find("     Voice 3 description 2 - Voice 3 description 3\r\n"),
              std::string::npos);

    options.Voice = 0;
    EXPECT_TRUE(speaker.CheckVoice());
    EXPECT_EQ(options.Voice, 1);
    options.Voice = -4;
    EXPECT_TRUE(speaker.CheckVoice());
    EXPECT_EQ(engine.selectedVoice, 1);
    EXPECT_TRUE(options.Speak);
}

TEST_F(SpeakerTest, NoVoicesOrNoEngineSwitchSpeechOff) {
    engine.voiceCount = 0;
    options.Voice = 1;
    EXPECT_FALSE(speaker.CheckVoice());
    EXPECT_EQ(options.Voice, 0);
    EXPECT_FALSE(options.Speak);
    EXPECT_NE(LogText().find(" *** PlayForm CheckVoice Error\r\n"), std::string::npos);
    EXPECT_EQ(LogText().find("Voice using"), std::string::npos);
    speaker.SetReady(true);
    speaker.Speak("silence");
    EXPECT_TRUE(engine.spoken.empty());

    test::RecordingSpeechEngine broken{2};
    broken.initialiseSucceeds = false;
    Options other;
    other.Speak = true;
    other.Voice = 2;
    Speaker second(broken, other, log);
    EXPECT_FALSE(second.CheckVoice());
    EXPECT_FALSE(other.Speak);
    EXPECT_EQ(other.Voice, 2);  // nothing was learnt about the voices, so the setting stays
}

}  // namespace
}  // namespace qv
