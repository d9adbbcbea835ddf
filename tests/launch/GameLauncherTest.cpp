// RunGame and the watch with real processes: the project's stand-in emulator, started through
// the POSIX launcher, writes the game log the reader then reports from.
#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>

#include "launch/GameLog.h"
#include "launch/LaunchFixture.h"

namespace qv {
namespace {

namespace fs = std::filesystem;

class GameLauncherTest : public ::testing::Test, protected test::LaunchFixture {
protected:
    GameLauncherTest() {
        UseEmulator(TEST_EMULATOR_PATH);
        request.romFolder = (dir / "roms").string();
        request.currentEmulator = true;
    }
    fs::path GameLog(const std::string& key) const {
        return GameLogPath(dir.path().string(), key, HostConventions::Posix());
    }
    // A stand-in emulator that runs for a while and reports its speed, as "mame" in its own
    // folder: the launcher still starts it directly and watches its own process id.
    void UseSlowEmulator(const std::string& flags) {
        const fs::path script = dir.Write("bin/mame", "#!/bin/sh\nexec '" +
                                                          std::string(TEST_EMULATOR_PATH) +
                                                          "' " + flags + " \"$@\"\n");
        fs::permissions(script, fs::perms::owner_all);
        UseEmulator(script);
    }

    RunRequest request;
};

TEST_F(GameLauncherTest, StartsTheGameCountsItsSecondsAndReadsItsLog) {
    UseSlowEmulator("--current --seconds 1.2 --speed 99.99");
    MyClass& game = AddGame("pacman.zip", "Pac-Man");
    game.Plays = 4;
    game.PlaySeconds = 100;
    ASSERT_FALSE(fs::exists(dir / "logs"));

    request.selectedGameKey = "pacman.zip";
    const RunResult result = RunGame(request, Services());
    ASSERT_EQ(result.outcome, RunOutcome::Started);
    EXPECT_GT(result.processId, 0);
    EXPECT_EQ(watch.GameTaskId(), result.processId);
    EXPECT_EQ(game.Plays, 5);
    EXPECT_EQ(game.LastPlayed, regional.GeneralDate(clock.Now()));
    EXPECT_TRUE(fs::is_directory(dir / "logs"));

    const std::string activity = LogText();
    EXPECT_NE(activity.find("     Play: Pac-Man\r\n"), std::string::npos);
    EXPECT_NE(activity.find(options.MamePath + "mame pacman.zip -rompath " + request.romFolder +
                            " -skip_gameinfo > \"" + GameLog("pacman.zip").string() + "\""),
              std::string::npos);

    // Ticks every 200 ms: a run of 1.2 s is seen for at least 6 ticks plus the one after it.
    const GameWatch::TickResult end = TickUntilEnd("pacman.zip", std::chrono::milliseconds(200));
    ASSERT_TRUE(end.ended);
    EXPECT_TRUE(end.credited);
    EXPECT_GE(end.seconds, 6);
    EXPECT_LE(end.seconds, 60);
    EXPECT_EQ(game.PlaySeconds, 100 + end.seconds);
    EXPECT_FALSE(watch.Watching());
    EXPECT_EQ(watch.PlaySecondsCounter(), 0);
    // Idle again: further ticks touch nothing.
    EXPECT_FALSE(watch.Tick(records, "pacman.zip").ended);
    EXPECT_EQ(game.PlaySeconds, 100 + end.seconds);

    const std::string output = test::ReadAll(GameLog("pacman.zip"));
    EXPECT_EQ(output.rfind("MAME v0.251 (unknown)\n", 0), 0u);
    EXPECT_NE(output.find("[pacman.zip] [-rompath] [" + request.romFolder + "] [-skip_gameinfo]"),
              std::string::npos);
    const FrameRateReport rate = ReadFrameRate(GameLog("pacman.zip"), regional);
    EXPECT_EQ(rate.text, "Speed: 99.99%");
    EXPECT_TRUE(rate.available);
}

TEST_F(GameLauncherTest, ClassicEmulatorGetsTheClassicLayoutAndReportsFps) {
    UseSlowEmulator("--classic --fps 59.923664");
    AddGame("galaga.zip", "Galaga");
    request.selectedGameKey = "galaga.zip";
    request.currentEmulator = false;
    ASSERT_EQ(RunGame(request, Services()).outcome, RunOutcome::Started);
    ASSERT_TRUE(TickUntilEnd("galaga.zip", std::chrono::milliseconds(50)).ended);

    const std::string output = test::ReadAll(GameLog("galaga.zip"));
    EXPECT_NE(output.find("[galaga.zip] [-rp] [" + request.romFolder +
                          "] [-noart] [-skip_disclaimer] [-skip_gameinfo]"),
              std::string::npos);
    EXPECT_EQ(ReadFrameRate(GameLog("galaga.zip"), regional).text, "FPS: 59.924");
    // The log names the classic command text without a shell prefix on this host.
    EXPECT_NE(LogText().find("mame galaga.zip -rp " + request.romFolder +
                             " -noart -skip_disclaimer -skip_gameinfo  > \""),
              std::string::npos);
}

TEST_F(GameLauncherTest, UnsafeArchiveNameArrivesAsOneArgument) {
    const std::string key = "a;b $(touch pwned).zip";
    AddGame(key, "Unsafe");
    request.selectedGameKey = key;
    ASSERT_EQ(RunGame(request, Services()).outcome, RunOutcome::Started);
    ASSERT_TRUE(TickUntilEnd(key, std::chrono::milliseconds(50)).ended);

    const fs::path gameLog = dir / "logs" / "a;b $(touch pwned).log";
    ASSERT_TRUE(fs::exists(gameLog));
    EXPECT_NE(test::ReadAll(gameLog).find("arguments: [" + key + "] [-rompath]"),
              std::string::npos);
    EXPECT_FALSE(fs::exists(dir / "pwned"));
    EXPECT_FALSE(fs::exists(fs::path(options.MamePath) / "pwned"));
}

TEST_F(GameLauncherTest, PlaysAtItsLargestStaysAndTheGameStillStarts) {
    MyClass& game = AddGame("pong.zip", "Pong");
    game.Plays = 32767;
    request.selectedGameKey = "pong.zip";
    ASSERT_EQ(RunGame(request, Services()).outcome, RunOutcome::Started);
    EXPECT_EQ(game.Plays, 32767);
    EXPECT_EQ(game.LastPlayed, regional.GeneralDate(clock.Now()));
    EXPECT_TRUE(watch.Watching());
    EXPECT_TRUE(TickUntilEnd("pong.zip", std::chrono::milliseconds(50)).ended);
}

TEST_F(GameLauncherTest, NothingSelectedOrNotWorkingDoesNothingButDropsTheWatch) {
    MyClass& game = AddGame("pong.zip", "Pong");
    game.Working = false;
    watch.Watch(999999);
    EXPECT_EQ(RunGame(request, Services()).outcome, RunOutcome::NothingSelected);
    EXPECT_FALSE(watch.Watching());

    watch.Watch(999999);
    request.selectedGameKey = "PONG.ZIP";  // keys ignore case
    EXPECT_EQ(RunGame(request, Services()).outcome, RunOutcome::NotWorking);
    EXPECT_FALSE(watch.Watching());
    EXPECT_EQ(game.Plays, 0);
    EXPECT_TRUE(engine.spoken.empty());
    EXPECT_TRUE(prompt.asked.empty());
    EXPECT_FALSE(fs::exists(dir / "logs"));
}

TEST_F(GameLauncherTest, MissingArchiveIsLoggedAndSpokenAndNotStarted) {
    MyClass& game = AddGame("dkong.zip", "Donkey Kong");
    game.Present = false;
    request.selectedGameKey = "dkong.zip";
    EXPECT_EQ(RunGame(request, Services()).outcome, RunOutcome::NotPresent);
    EXPECT_NE(LogText().find("     Failed: dkong.zip does not exist.\r\n"), std::string::npos);
    EXPECT_EQ(LogText().find("Play:"), std::string::npos);
    EXPECT_EQ(engine.spoken, (std::vector<std::string>{"Cannot find required ROM file"}));
    EXPECT_EQ(game.Plays, 0);
    EXPECT_FALSE(watch.Watching());
    EXPECT_FALSE(fs::exists(GameLog("dkong.zip")));
}

TEST_F(GameLauncherTest, EmulatorThatCannotStartIsReported) {
    options.MameExec = "no-such-emulator";
    MyClass& game = AddGame("pong.zip", "Pong");
    request.selectedGameKey = "pong.zip";
    EXPECT_EQ(RunGame(request, Services()).outcome, RunOutcome::StartFailed);
    ASSERT_EQ(prompt.asked.size(), 1u);
    EXPECT_EQ(prompt.asked[0].text, "Error!  Cannot start the game: Pong");
    EXPECT_NE(LogText().find(" *** PlayForm RunGame: Result code = 0, game did not start Error"),
              std::string::npos);
    EXPECT_EQ(game.Plays, 0);
    EXPECT_FALSE(watch.Watching());

    // A name that leads out of the emulator's folder is refused even though the file exists.
    options.MameExec = "../" + fs::path(TEST_EMULATOR_PATH).parent_path().filename().string() +
                       "/" + fs::path(TEST_EMULATOR_PATH).filename().string();
    ASSERT_TRUE(fs::exists(fs::path(options.MamePath) / options.MameExec));
    EXPECT_EQ(RunGame(request, Services()).outcome, RunOutcome::StartFailed);
    EXPECT_FALSE(watch.Watching());
}

TEST_F(GameLauncherTest, KeyWithoutRecordIsAFailureWithTheSafeModeAdvice) {
    request.selectedGameKey = "ghost.zip";
    EXPECT_EQ(RunGame(request, Services()).outcome, RunOutcome::Failed);
    ASSERT_EQ(prompt.asked.size(), 1u);
    EXPECT_EQ(prompt.asked[0].text,
              "If you are running Windows 98, you should turn on \"Safe Mode\" from the file "
              "menu.");
    EXPECT_NE(LogText().find(" *** PlayForm RunGame Error"), std::string::npos);
}

// The watch against a launcher whose processes end when the test says so.
class ScriptedLauncher final : public ProcessLauncher {
public:
    ProcessId Start(const LaunchRequest&) override { return 70000; }
    bool IsRunning(ProcessId id) override {
        asked.push_back(id);
        return running;
    }
    bool running = true;
    std::vector<ProcessId> asked;
};

TEST(GameWatchTest, CreditsTheGameSelectedWhenTheEndIsNoticed) {
    ScriptedLauncher launcher;
    GameWatch watch(launcher);
    MyClass records;
    records.Add("a.zip")->PlaySeconds = 10;
    records.Add("b.zip")->PlaySeconds = 2147483645;

    EXPECT_FALSE(watch.Tick(records, "a.zip").ended);  // idle: nothing asked
    EXPECT_TRUE(launcher.asked.empty());

    watch.Watch(70000);  // above 16 bits, compared in full
    for (int i = 0; i < 3; ++i) EXPECT_FALSE(watch.Tick(records, "a.zip").ended);
    EXPECT_EQ(watch.PlaySecondsCounter(), 3);
    launcher.running = false;
    const GameWatch::TickResult end = watch.Tick(records, "b.zip");
    EXPECT_TRUE(end.ended);
    EXPECT_EQ(end.seconds, 4);
    EXPECT_EQ(records.Item("a.zip")->PlaySeconds, 10);
    EXPECT_EQ(records.Item("b.zip")->PlaySeconds, 2147483647);  // stays at the largest count
    EXPECT_EQ(launcher.asked, std::vector<ProcessId>(4, 70000));

    // An end with no selected record still ends the watch and asks for a refresh.
    watch.Watch(70000);
    const GameWatch::TickResult orphan = watch.Tick(records, "");
    EXPECT_TRUE(orphan.ended);
    EXPECT_FALSE(orphan.credited);
    EXPECT_FALSE(watch.Watching());
}

}  // namespace
}  // namespace qv
