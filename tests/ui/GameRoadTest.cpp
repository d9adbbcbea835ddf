#include <QApplication>
#include <QLabel>
#include <QLineEdit>
#include <QTest>
#include <QTreeView>

#include "PlayFormFixture.h"
#include "support/RecordingSpeechEngine.h"
#include "ui/DetailsPanel.h"
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
        NoStatusDisplay status;
        LoadRomLibrary(program.romLibrary, program.options.RomLibraryFile, *program.log, status);
        form = std::make_unique<PlayForm>(program, nullptr);
        road = new GameRoadController(*form, program, speech, launcher);
        form->Load();
        speech.spoken.clear();
    }

    template <typename T = QLabel>
    T* Control(const char* name) {
        auto* control = form->findChild<T*>(QString::fromLatin1(name));
        EXPECT_NE(control, nullptr) << name;
        return control;
    }
    QString Text(const char* name) { return Control(name)->text(); }
    QColor Colour(const char* name) {
        return Control(name)->palette().color(QPalette::WindowText);
    }
    bool Shown(const char* name) { return !Control(name)->isHidden(); }
    void Click(const char* name) { QTest::mouseClick(Control(name), Qt::LeftButton); }

    void Select(const std::string& key) {
        form->Pane().View()->setCurrentIndex(NodeIndex(key));
    }

    RecordingSpeechEngine speech;
    FakeLauncher launcher;
    GameRoadController* road = nullptr;
};

TEST_F(GameRoadTest, StartsWithOffSwitchesSoundFromSettingsAndSpeaksTheIntro) {
    program.options.Intro = "Hey you!";
    program.options.Speak = true;
    NoStatusDisplay status;
    LoadRomLibrary(program.romLibrary, program.options.RomLibraryFile, *program.log, status);
    form = std::make_unique<PlayForm>(program, nullptr);
    new GameRoadController(*form, program, speech, launcher);
    form->Load();

    EXPECT_EQ(speech.spoken, (std::vector<std::string>{"Hey you!"}));  // load steps stay quiet
    EXPECT_TRUE(Shown("IUSoundY"));
    EXPECT_FALSE(Shown("IUSoundN"));
    EXPECT_EQ(Text("Label16"), "Sound On");
    EXPECT_TRUE(Shown("IJoyY"));  // Joystick is on in the defaults
    for (const char* off : {"IWorkingN", "IMouseN", "IHiddenN", "ICheatN", "IArtN", "IPriorityN",
                            "IWinN", "IR0", "IPlayN"})
        EXPECT_TRUE(Shown(off)) << off;
    for (const char* on : {"IWorkingY", "IMouseY", "IHiddenY", "ICheatY", "IArtY", "IPriorityY",
                           "IWinY", "IR1", "IR5", "IPlayY", "IPlayX"})
        EXPECT_FALSE(Shown(on)) << on;
    EXPECT_EQ(Text("Label1"), "Name of the Game");
    EXPECT_EQ(Text("Label21"), "Auto");
    EXPECT_EQ(Text("Label25"), "MAME");
}

TEST_F(GameRoadTest, SelectingAGameFillsThePanelAndSpeaksTheTitle) {
    OpenRoad();
    Select("alpha_pacman.zip");
    EXPECT_EQ(road->State().selectedGameKey, "pacman.zip");
    EXPECT_EQ(Text("Label1"), "Pac-Man");
    EXPECT_EQ(Control("Label1")->toolTip(), "Pac-Man");
    EXPECT_EQ(Text("Label3"), "(C) 1980, Namco");
    EXPECT_EQ(Colour("Label3"), kGreen);
    EXPECT_EQ(Text("Label23"), "Category: Maze");
    EXPECT_EQ(Text("Label10"), "ROM: pacman.zip, 2 KB, .30");
    EXPECT_EQ(Text("Label30"), "3 plays (1 min), Last Played: Never");
    EXPECT_EQ(Text("Label28"), "FPS: Not available");
    EXPECT_EQ(Colour("Label28"), kRed);
    EXPECT_EQ(Colour("Label2"), kGreen);
    EXPECT_TRUE(Shown("IWorkingY"));
    EXPECT_EQ(Text("Label7"), "Working");
    EXPECT_TRUE(Shown("IR3"));
    EXPECT_FALSE(Shown("IR0"));
    EXPECT_EQ(speech.Last(), "PAC-MAN");

    // A folder changes nothing.
    Select("alpha_");
    EXPECT_EQ(Text("Label1"), "Pac-Man");
    EXPECT_EQ(road->State().selectedGameKey, "pacman.zip");

    // Clicked texts speak.
    Click("Label3");
    EXPECT_EQ(speech.Last(), "Copyright 1980, NAMCO");
    Click("Label30");
    EXPECT_EQ(speech.Last(), "3 plays (1 min), Last Played: Never");
    Click("Label28");
    EXPECT_EQ(speech.Last(), "Frames per second : Not available");
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
    EXPECT_FALSE(pacman.Mouse);
    EXPECT_EQ(speech.Last(), "Mouse disabled");

    Click("IWorkingY");
    EXPECT_FALSE(pacman.Working);
    EXPECT_EQ(Text("Label7"), "Not Working");
    EXPECT_EQ(speech.Last(), "Not Working");
    EXPECT_EQ(PictureOf("alpha_pacman.zip"), "bad");
    EXPECT_EQ(ColourOf("alpha_pacman.zip"), kRed);
    EXPECT_TRUE(Shown("IPlayX"));
    EXPECT_FALSE(Shown("IPlayN"));

    Click("ICheatN");
    EXPECT_EQ(speech.Last(), "Cannot find cheats file.");
    EXPECT_TRUE(Shown("ICheatN"));
    Click("IArtN");
    EXPECT_EQ(speech.Last(), "Can not find artwork");
    Click("IUSoundY");
    EXPECT_FALSE(program.options.Sound);
    EXPECT_EQ(speech.Last(), "Sound disabled");
    const std::size_t said = speech.spoken.size();
    Click("IWinN");
    EXPECT_TRUE(Shown("IWinY"));
    EXPECT_EQ(Colour("Label39"), kGreen);
    EXPECT_TRUE(road->State().Run().Window);
    EXPECT_EQ(speech.spoken.size(), said);  // nothing said
}

TEST_F(GameRoadTest, RatingImagesAdvanceAndSpeak) {
    OpenRoad();
    Click("IR0");  // no game selected: stays, says the shown level
    EXPECT_TRUE(Shown("IR0"));
    EXPECT_EQ(speech.Last(), program.options.Rate0);

    Select("alpha_pacman.zip");
    Click("IR3");
    EXPECT_TRUE(Shown("IR4"));
    EXPECT_FALSE(Shown("IR3"));
    EXPECT_EQ(program.gameRecords.Item("pacman.zip")->Rating, "****");
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
    ASSERT_FALSE(launcher.started.empty());
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

TEST_F(GameRoadTest, DoubleClickOnANotWorkingGameStartsNothing) {
    OpenRoad();
    Select("alpha_dkong.zip");
    const std::size_t before = launcher.started.size();
    emit form->Pane().View()->doubleClicked(NodeIndex("alpha_dkong.zip"));
    EXPECT_EQ(launcher.started.size(), before);
    EXPECT_TRUE(Shown("IPlayX"));

    Select("alpha_galaga.zip");
    emit form->Pane().View()->doubleClicked(NodeIndex("alpha_galaga.zip"));
    ASSERT_EQ(launcher.started.size(), before + 1);
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
    Click("Label21");
    EXPECT_EQ(Text("Label21"), "Auto");
    EXPECT_EQ(program.gameRecords.Item("pacman.zip")->Resolution, "");

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
    safe->trigger();
    EXPECT_FALSE(road->SafeMode());
}

TEST_F(GameRoadTest, UseVoiceSwitchesSpeechOffAndOn) {
    OpenRoad();
    QAction* voice = Command("mVoice");
    ASSERT_TRUE(voice->isChecked());
    voice->trigger();
    EXPECT_FALSE(program.options.Speak);
    EXPECT_FALSE(voice->isChecked());
    Select("alpha_pacman.zip");
    EXPECT_TRUE(speech.spoken.empty());
    voice->trigger();
    EXPECT_TRUE(program.options.Speak);
    EXPECT_TRUE(voice->isChecked());
}

TEST_F(GameRoadTest, NoVoiceSwitchesSpeechOff) {
    speech.voiceCount = 0;
    OpenRoad();
    EXPECT_FALSE(program.options.Speak);
    EXPECT_FALSE(Command("mVoice")->isChecked());
}

TEST_F(GameRoadTest, SearchBoxSelectsMatchesAndReportsNone) {
    OpenRoad();
    auto* box = Control<QLineEdit>("Text1");
    ASSERT_TRUE(box->isEnabled());
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
