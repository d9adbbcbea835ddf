// Reading the game log back: the frame-rate label and the "Log" view.
#include <gtest/gtest.h>

#include "launch/GameLog.h"
#include "support/TempDir.h"

namespace qv {
namespace {

TEST(GameLogTest, LogFileNamesStayInTheLogsFolder) {
    EXPECT_EQ(GameLogPath("/app", "pacman.zip", HostConventions::Posix()), "/app/logs/pacman.log");
    EXPECT_EQ(GameLogPath("C:\\APP", "pacman.zip", HostConventions::Windows()),
              "C:\\APP\\logs\\pacman.log");
    EXPECT_EQ(GameLogName("PACMAN.ZIP"), "PACMAN.ZIP");
    EXPECT_EQ(GameLogName("a.zip.zip"), "a.log.log");
    EXPECT_EQ(GameLogName("../../etc/x.zip"), ".._.._etc_x.log");
    EXPECT_EQ(GameLogName(".."), "_..");
}

TEST(GameLogTest, FrameRateLabelFromTheSummaryLines) {
    const struct {
        const char* log;
        const char* label;
    } rows[] = {
        {"banner\r\nAverage FPS: 59.923664 (600 frames)\r\n", "FPS: 59.924"},
        {"Average FPS: 30.0 (1 frames)\nAverage FPS: 1234.5\nother line\n", "FPS: 1,234.500"},
        {"MAME v0.251\nAverage speed: 99.99% (12 seconds)\n", "Speed: 99.99%"},
        {"Average speed: 50.00% (1 seconds)\nAverage FPS: 60\n", "FPS: 60.000"},
        {"Average FPS: 60\nAverage FPS: x\n", "FPS: 60.000"},  // a bad later line keeps it
        {"average FPS: 59.9\n", "FPS: Not available"},
        {"Average FPS:  59.9\n", "FPS: Not available"},  // third piece empty
        {"Average FPS: fast\n", "FPS: Not available"},
        {"Average FPS:\n", "FPS: Not available"},
        {"  Average speed: 50.00%\n", "FPS: Not available"},
    };
    test::TempDir dir;
    EnglishRegional regional;
    for (const auto& row : rows) {
        SCOPED_TRACE(row.log);
        const FrameRateReport report = ReadFrameRate(dir.Write("logs/g.log", row.log), regional);
        EXPECT_EQ(report.text, row.label);
        EXPECT_EQ(report.available, std::string(row.label) != "FPS: Not available");
    }
    EXPECT_EQ(ReadFrameRate(dir / "logs/none.log", regional).text, "FPS: Not available");
    EXPECT_EQ(SpokenFrameRate("FPS: 59.924"), "Frames per second : 59.924");
    EXPECT_EQ(SpokenFrameRate("Speed: 99.99%"), "Speed: 99.99%");
}

TEST(GameLogTest, LogViewEndsEveryLineWithCrLfOrSaysThereIsNone) {
    test::TempDir dir;
    const LogView view = ReadLogView(dir.Write("logs/g.log", "one\ntwo\r\nthree"));
    EXPECT_TRUE(view.found);
    EXPECT_EQ(view.text, "one\r\ntwo\r\nthree\r\n");
    const LogView none = ReadLogView(dir / "logs/none.log");
    EXPECT_EQ(none.text, "No log available...");
    EXPECT_FALSE(none.found);
}

}  // namespace
}  // namespace qv
