// End to end with the installed emulator: pong needs no ROM files, so an empty archive is
// enough. The emulator reads video/sound/run time from the mame.ini in its own HOME.
#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <optional>

#include "app/EmulatorVersion.h"
#include "launch/GameLog.h"
#include "launch/LaunchFixture.h"

namespace qv {
namespace {

namespace fs = std::filesystem;

// HOME for the emulator while the test runs; the earlier value comes back afterwards.
class ScopedHome {
public:
    explicit ScopedHome(const fs::path& home) {
        if (const char* old = std::getenv("HOME")) old_ = old;
        setenv("HOME", home.c_str(), 1);
    }
    ~ScopedHome() {
        if (old_) setenv("HOME", old_->c_str(), 1);
        else unsetenv("HOME");
    }

private:
    std::optional<std::string> old_;
};

// A valid zip archive with no entries: just the end-of-central-directory record.
const std::string kEmptyZip("PK\x05\x06" + std::string(18, '\0'));

TEST(RealEmulatorTest, PongRunsThroughRunGameAndIsCountedAndReported) {
    if (!fs::exists("/usr/games/mame")) GTEST_SKIP() << "no emulator at /usr/games/mame";

    test::LaunchFixture f;
    f.dir.Write("roms/pong.zip", kEmptyZip);
    f.dir.Write("home/.mame/mame.ini", "video none\nsound none\nseconds_to_run 2\n");
    ScopedHome home(f.dir / "home");
    f.UseEmulator("/usr/games/mame");

    EmulatorVersionCheck check(f.options, f.dir.path(), HostConventions::Posix(), f.log,
                               f.launcher, f.yield);
    const EmulatorVersion version = check.Detect(f.options.MameExec, true);
    EXPECT_EQ(version.text, "0.251");
    EXPECT_TRUE(version.current);

    // Every option of the current layout, so the emulator has to accept each of them.
    const std::string d = f.dir.path().string();
    f.dir.Write("mame/cheat.dat", "");
    f.dir.Write("mame/ctrlr/pad.cfg",
                "<?xml version=\"1.0\"?>\n<mameconfig version=\"10\">\n"
                "<system name=\"default\">\n</system>\n</mameconfig>\n");
    for (const char* folder : {"mame/snap", "mame/artwork", "mame/samples", "mame/sta"})
        fs::create_directories(f.dir / folder);
    f.options.CheatsFile = d + "/mame/cheat.dat";
    f.options.CtrlrDir = d + "/mame/ctrlr";
    f.options.CtrlrFile = "pad.zip";
    f.options.SnapDir = d + "/mame/snap";
    f.options.ArtworkDir = d + "/mame/artwork";
    f.options.SamplesDir = d + "/mame/samples";
    f.options.StateDir = d + "/mame/sta";
    f.options.Volume = -12;
    f.options.Sound = false;
    f.options.Joystick = true;

    MyClass& game = f.AddGame("pong.zip", "Pong");
    game.Mouse = true;
    RunRequest request;
    request.switches = {true, true, true, true};
    request.resolution = "640 x 480";
    request.selectedGameKey = "pong.zip";
    request.romFolder = (f.dir / "roms").string();
    request.currentEmulator = version.current;
    const RunResult result = RunGame(request, f.Services());
    ASSERT_EQ(result.outcome, RunOutcome::Started) << f.LogText();
    EXPECT_NE(result.commandText.find(" -ctrlr pad -snapshot_directory "), std::string::npos)
        << result.commandText;
    EXPECT_EQ(game.Plays, 1);

    // The window's cadence: one tick a second.
    const GameWatch::TickResult end = f.TickUntilEnd("pong.zip", std::chrono::seconds(1));
    ASSERT_TRUE(end.ended) << "the emulator did not end within 30 s";
    EXPECT_GE(end.seconds, 2);
    EXPECT_EQ(game.PlaySeconds, end.seconds);

    const fs::path gameLog = f.dir / "logs" / "pong.log";
    const std::string output = test::ReadAll(gameLog);
    EXPECT_NE(output.find("Average speed: "), std::string::npos) << output;
    EXPECT_EQ(output.find("Error: unknown option"), std::string::npos) << output;
    const FrameRateReport rate = ReadFrameRate(gameLog, f.regional);
    EXPECT_EQ(rate.text.rfind("Speed: ", 0), 0u) << rate.text;
    EXPECT_EQ(rate.text.back(), '%');
    EXPECT_TRUE(rate.available);
}

}  // namespace
}  // namespace qv
