// Reading the game log back: the frame-rate label and the "Log" view.
#include <gtest/gtest.h>

#include "launch/GameLog.h"
#include "support/TempDir.h"

namespace qv {
namespace {

class GameLogTest : public ::testing::Test {
protected:
    FrameRateReport Read(std::string_view bytes) {
        return ReadFrameRate(dir.Write("logs/game.log", bytes), regional);
    }
    test::TempDir dir;
    EnglishRegional regional;
};

TEST_F(GameLogTest, LogFileNamesStayInTheLogsFolder) {
    const HostConventions posix = HostConventions::Posix();
    EXPECT_EQ(GameLogPath("/app", "pacman.zip", posix), "/app/logs/pacman.log");
    EXPECT_EQ(GameLogPath("C:\\APP", "pacman.zip", HostConventions::Windows()),
              "C:\\APP\\logs\\pacman.log");
    EXPECT_EQ(GameLogName("PACMAN.ZIP"), "PACMAN.ZIP");
    EXPECT_EQ(GameLogName("a.zip.zip"), "a.log.log");
    EXPECT_EQ(GameLogName("../../etc/x.zip"), ".._.._etc_x.log");
    EXPECT_EQ(GameLogName(".."), "_..");
}

TEST_F(GameLogTest, AverageFpsLastLineWinsWithThreeDecimals) {
    EXPECT_EQ(Read("banner\r\nAverage FPS: 59.923664 (600 frames)\r\n").text, "FPS: 59.924");
    const FrameRateReport two =
        Read("Average FPS: 30.0 (1 frames)\nAverage FPS: 1234.5\nother line\n");
    EXPECT_EQ(two.text, "FPS: 1,234.500");
    EXPECT_TRUE(two.available);
}

TEST_F(GameLogTest, UnrecognisedOrMalformedSummaryLinesAreNotAvailable) {
    const FrameRateReport lower = Read("average FPS: 59.9\n");
    EXPECT_EQ(lower.text, "FPS: Not available");
    EXPECT_FALSE(lower.available);
    EXPECT_EQ(Read("Average FPS:  59.9\n").text, "FPS: Not available");  // third piece empty
    EXPECT_EQ(Read("Average FPS: fast\n").text, "FPS: Not available");
    EXPECT_EQ(Read("Average FPS:\n").text, "FPS: Not available");
    // A bad later line keeps the good earlier one.
    EXPECT_EQ(Read("Average FPS: 60\nAverage FPS: x\n").text, "FPS: 60.000");
}

TEST_F(GameLogTest, CurrentEmulatorSpeedLineWhenThereIsNoFpsLine) {
    const FrameRateReport speed = Read("MAME v0.251\nAverage speed: 99.99% (12 seconds)\n");
    EXPECT_EQ(speed.text, "Speed: 99.99%");
    EXPECT_TRUE(speed.available);
    EXPECT_EQ(Read("Average speed: 50.00% (1 seconds)\nAverage FPS: 60\n").text, "FPS: 60.000");
    EXPECT_EQ(Read("  Average speed: 50.00%\n").text, "FPS: Not available");
}

TEST_F(GameLogTest, MissingLog) {
    EXPECT_EQ(ReadFrameRate(dir / "logs/none.log", regional).text, "FPS: Not available");
    const LogView view = ReadLogView(dir / "logs/none.log");
    EXPECT_EQ(view.text, "No log available...");
    EXPECT_FALSE(view.found);
}

TEST_F(GameLogTest, LogViewEndsEveryLineWithCrLf) {
    const LogView view = ReadLogView(dir.Write("logs/g.log", "one\ntwo\r\nthree"));
    EXPECT_TRUE(view.found);
    EXPECT_EQ(view.text, "one\r\ntwo\r\nthree\r\n");
}

TEST_F(GameLogTest, SpokenLabel) {
    EXPECT_EQ(SpokenFrameRate("FPS: 59.924"), "Frames per second : 59.924");
    EXPECT_EQ(SpokenFrameRate("Speed: 99.99%"), "Speed: 99.99%");
}

}  // namespace
}  // namespace qv
