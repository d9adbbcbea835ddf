// The details panel wired to the core: clicks reach the rules (tested in the launch tests) and
// the widgets show what they decided.
#include <QLineEdit>

#include "PlayFormFixture.h"
#include "support/RecordingSpeechEngine.h"
#include "ui/GameRoadController.h"

namespace qv::test {
namespace {

// Starts nothing: hands out one process id and says it runs until told otherwise.
class FakeLauncher final : public ProcessLauncher {
public:
    ProcessId Start(const LaunchRequest& request) override {
        started.push_back(request);
        return 4242;
    }
    bool IsRunning(ProcessId) override { return running; }
    std::vector<LaunchRequest> started;
    bool running = false;
};

const QColor kGreen(0, 255, 0), kRed(255, 0, 0);

class GameRoadTest : public PlayFormFixture {
protected:
    void OpenRoad() {
        program.options.Speak = true;
        program.options.Sound = true;
        program.options.Joystick = false;
        program.options.Rate4 = "It's Cool!";
        Open([&](PlayForm& f) { road = new GameRoadController(f, program, speech, launcher); });
        speech.spoken.clear();
        launcher.started.clear();  // the emulator's version check at load
    }
    QColor Colour(const char* name) {
        return Control(name)->palette().color(QPalette::WindowText);
    }
    void DoubleClick(const std::string& key) {
        emit form->Pane().View()->doubleClicked(NodeIndex(key));
    }

    RecordingSpeechEngine speech;
    FakeLauncher launcher;
    GameRoadController* road = nullptr;
};

TEST_F(GameRoadTest, StartsWithOffSwitchesSoundFromSettingsAndSpeaksTheIntro) {
    program.options.Intro = "Hey you!";
    program.options.Speak = true;
    Open([&](PlayForm& f) { new GameRoadController(f, program, speech, launcher); });

    EXPECT_EQ(speech.spoken, (std::vector<std::string>{"Hey you!"}));  // load steps stay quiet
    EXPECT_TRUE(Shown("IUSoundY"));
    EXPECT_EQ(Text("Label16"), "Sound On");
    // One switch per group shows its off image until a game says otherwise.
    for (const char* off : {"IMouseN", "ICheatN", "IR0", "IPlayN"}) EXPECT_TRUE(Shown(off)) << off;
    EXPECT_EQ(Text("Label1"), "Name of the Game");
}

TEST_F(GameRoadTest, SelectingAGameFillsThePanelAndSpeaksTheTitle) {
    OpenRoad();
    Select("alpha_pacman.zip");
    EXPECT_EQ(road->State().selectedGameKey, "pacman.zip");
    EXPECT_EQ(Text("Label1"), "Pac-Man");
    EXPECT_EQ(Text("Label3"), "(C) 1980, Namco");
    EXPECT_EQ(Colour("Label3"), kGreen);
    EXPECT_EQ(Text("Label10"), "ROM: pacman.zip, 2 KB, .30");
    EXPECT_EQ(Text("Label30"), "3 plays (1 min), Last Played: Never");
    EXPECT_EQ(Colour("Label28"), kRed);
    EXPECT_TRUE(Shown("IWorkingY"));
    EXPECT_TRUE(Shown("IR3"));
    EXPECT_FALSE(Shown("IR0"));
    EXPECT_EQ(speech.Last(), "PAC-MAN");

    Select("alpha_");  // a folder changes nothing
    EXPECT_EQ(Text("Label1"), "Pac-Man");
    Click("Label3");  // clicked texts speak
    EXPECT_EQ(speech.Last(), "Copyright 1980, NAMCO");
}

TEST_F(GameRoadTest, SwitchImagesAndLabelsFlipStoreAndSpeak) {
    OpenRoad();
    Select("alpha_pacman.zip");
    MyClass& pacman = *program.gameRecords.Item("pacman.zip");
    Click("IMouseN");
    EXPECT_TRUE(Shown("IMouseY"));
    EXPECT_FALSE(Shown("IMouseN"));
    EXPECT_EQ(Text("Label8"), "Mouse On");
    EXPECT_EQ(Colour("Label8"), kGreen);
    EXPECT_TRUE(pacman.Mouse);
    EXPECT_EQ(speech.Last(), "Mouse enabled");
    Click("Label8");  // the label does what its shown image does
    EXPECT_TRUE(Shown("IMouseN"));

    Click("IWorkingY");  // the tree node and the play image follow
    EXPECT_EQ(PictureOf("alpha_pacman.zip"), "bad");
    EXPECT_TRUE(Shown("IPlayX"));

    Click("IR3");  // rating images advance and speak
    EXPECT_TRUE(Shown("IR4"));
    EXPECT_EQ(speech.Last(), "It's Cool!");
}

TEST_F(GameRoadTest, PlayImageStartsTheGameAndTheWatchRefreshesThePanel) {
    OpenRoad();
    Select("alpha_pacman.zip");
    QEvent enter(QEvent::Enter);
    QApplication::sendEvent(Control("IPlayN"), &enter);
    ASSERT_TRUE(Shown("IPlayY"));
    launcher.running = true;
    Click("IPlayY");
    EXPECT_TRUE(Shown("IPlayN"));
    ASSERT_EQ(launcher.started.size(), 1u);
    EXPECT_EQ(launcher.started.back().arguments.front(), "pacman.zip");
    EXPECT_EQ(program.gameRecords.Item("pacman.zip")->Plays, 4);

    road->WatchTick();
    road->WatchTick();
    EXPECT_EQ(Text("Label30"), "3 plays (1 min), Last Played: Never");  // still running
    launcher.running = false;
    road->WatchTick();
    EXPECT_EQ(program.gameRecords.Item("pacman.zip")->PlaySeconds, 63);
    EXPECT_TRUE(Text("Label30").startsWith("4 plays (1 min), Last Played: "));
    EXPECT_FALSE(road->Watch().Watching());
}

TEST_F(GameRoadTest, DoubleClickStartsOnlyAWorkingGame) {
    OpenRoad();
    DoubleClick("Maze_");
    Select("alpha_dkong.zip");
    DoubleClick("alpha_dkong.zip");
    EXPECT_TRUE(launcher.started.empty());
    Select("alpha_galaga.zip");
    DoubleClick("alpha_galaga.zip");
    ASSERT_EQ(launcher.started.size(), 1u);
    EXPECT_EQ(launcher.started.back().arguments.front(), "galaga.zip");
}

TEST_F(GameRoadTest, ResolutionExecutableAndSafeMode) {
    program.options.Resolutions = "640 x 480, 800 x 600";
    OpenRoad();
    Select("alpha_pacman.zip");
    Click("Label21");
    EXPECT_EQ(Text("Label21"), "640 x 480");
    EXPECT_EQ(program.gameRecords.Item("pacman.zip")->Resolution, "640 x 480");
    Click("Image9");
    EXPECT_EQ(Text("Label21"), " 800 x 600");

    Click("Label25");
    EXPECT_EQ(program.options.MameExec, "mamepp");
    EXPECT_EQ(Text("Label25"), "MAMEPP");
    EXPECT_EQ(Colour("Label25"), kRed);  // no such build here
    EXPECT_TRUE(Shown("IPlayX"));
    EXPECT_TRUE(Text("Label32").startsWith("Using mamepp Version: "));

    QAction* safe = Command("mSafeMode");
    EXPECT_TRUE(safe->isEnabled());
    EXPECT_FALSE(safe->isChecked());
    safe->trigger();
    EXPECT_TRUE(road->SafeMode());
}

TEST_F(GameRoadTest, SafeModeMarkMatchesTheFlagSetAtStart) {
    program.options.Windows2000XP = false;
    OpenRoad();
    QAction* safe = Command("mSafeMode");
    EXPECT_TRUE(road->SafeMode());
    EXPECT_TRUE(safe->isChecked());
    safe->trigger();
    EXPECT_FALSE(road->SafeMode());
    EXPECT_FALSE(safe->isChecked());
}

TEST_F(GameRoadTest, UseVoiceSwitchesSpeechOffAndOn) {
    OpenRoad();
    QAction* voice = Command("mVoice");
    ASSERT_TRUE(voice->isChecked());
    voice->trigger();
    EXPECT_FALSE(program.options.Speak);
    Select("alpha_pacman.zip");
    EXPECT_TRUE(speech.spoken.empty());
    voice->trigger();
    EXPECT_TRUE(program.options.Speak);
}

TEST_F(GameRoadTest, NoVoiceSwitchesSpeechOff) {
    speech.voiceCount = 0;
    OpenRoad();
    EXPECT_FALSE(Command("mVoice")->isChecked());
}

TEST_F(GameRoadTest, SearchBoxSelectsMatchesAndReportsNone) {
    OpenRoad();
    auto* box = Control<QLineEdit>("Text1");
    box->setText(QStringLiteral("dig"));
    QTest::keyClick(box, Qt::Key_Return);
    EXPECT_EQ(Text("Label1"), "Dig Dug");
    EXPECT_EQ(speech.Last(), "DIG DUG");
    box->setText(QStringLiteral("zzz"));
    QTest::keyClick(box, Qt::Key_Return);
    ASSERT_FALSE(prompt->asked.empty());
    EXPECT_EQ(prompt->asked.back().text, "Could not find 'zzz'");
    EXPECT_EQ(Text("Label1"), "Dig Dug");  // the selection is back where it was
}

}  // namespace
}  // namespace qv::test
