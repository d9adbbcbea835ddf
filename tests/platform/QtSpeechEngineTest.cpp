// The Qt speech engine on this machine: voices when an engine offers them, a voice count of 0
// and refusals (never a crash) when it does not.
#include <QCoreApplication>
#include <QElapsedTimer>
#include <QTextToSpeech>
#include <gtest/gtest.h>

#include "platform/qt/QtSpeechEngine.h"

namespace qv {
namespace {

TEST(QtSpeechEngineTest, UnknownEngineHasNoVoicesAndRefusesEverything) {
    QtSpeechEngine engine(QStringLiteral("no-such-speech-engine"));
    engine.Initialise();
    EXPECT_EQ(engine.VoiceCount(), 0);
    EXPECT_FALSE(engine.SelectVoice(1));
    EXPECT_FALSE(engine.SelectVoice(0));
    EXPECT_EQ(engine.VoiceName(1), "");
    EXPECT_EQ(engine.VoiceDescription(1, 1), "");
    engine.Stop();
    EXPECT_FALSE(engine.Say("nobody hears this"));
}

TEST(QtSpeechEngineTest, FliteOffersVoicesAndSurvivesMissingAudio) {
    if (!QTextToSpeech::availableEngines().contains(QStringLiteral("flite")))
        GTEST_SKIP() << "no flite speech engine installed";
    QtSpeechEngine engine(QStringLiteral("flite"));
    ASSERT_TRUE(engine.Initialise());
    EXPECT_EQ(engine.EngineName(), "flite");
    const int count = engine.VoiceCount();
    ASSERT_GT(count, 0);
    EXPECT_FALSE(engine.SelectVoice(count + 1));
    EXPECT_TRUE(engine.SelectVoice(count));
    EXPECT_FALSE(engine.VoiceName(1).empty());
    EXPECT_EQ(engine.VoiceDescription(1, 1), engine.VoiceName(1));
    EXPECT_FALSE(engine.VoiceDescription(1, 2).empty());
    EXPECT_NE(engine.VoiceDescription(1, 3).find(", "), std::string::npos);

    // Without an audio device the engine ends in its error state; saying more must then
    // report failure with a reason instead of pretending to speak.
    const bool first = engine.Say("Hey you!");
    QElapsedTimer timer;
    timer.start();
    while (timer.elapsed() < 3000) QCoreApplication::processEvents(QEventLoop::AllEvents, 50);
    engine.Stop();
    const bool said = engine.Say("Would you like to play a game?");
    // Here (no audio device) the second text fails with the engine's reason; with a working
    // device it is spoken and there is no reason to give.
    EXPECT_EQ(said, engine.LastError().empty()) << "first say: " << first;
}

TEST(QtSpeechEngineTest, DefaultChoicePrefersAnEngineWithVoices) {
    QtSpeechEngine engine;
    engine.Initialise();
    bool anyVoices = false;
    for (const QString& name : QTextToSpeech::availableEngines()) {
        QTextToSpeech probe(name);
        if (probe.state() != QTextToSpeech::Error && !probe.availableVoices().isEmpty())
            anyVoices = true;
    }
    EXPECT_EQ(engine.VoiceCount() > 0, anyVoices);
}

}  // namespace
}  // namespace qv
