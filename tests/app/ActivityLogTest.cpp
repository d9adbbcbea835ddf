#include <gtest/gtest.h>

#include "AppTestSupport.h"

namespace qv::test {

TEST(ActivityLog, EmptyTextIsSeparatorWhateverRaw) {
    LogFixture f;
    f.log.WriteLog("", 0);
    f.log.WriteLog("", 1);
    const std::string separator(60, '_');
    EXPECT_EQ(f.Lines(), (std::vector<std::string>{separator, separator}));
    EXPECT_EQ(f.dir.Read("quorvane.log"), separator + "\r\n" + separator + "\r\n");
}

TEST(ActivityLog, RawZeroStampsTimeRawOtherwiseVerbatim) {
    LogFixture f;
    f.log.WriteLog("abc", 0);
    f.log.WriteLog("abc", 1);
    f.log.WriteLog("abc", -3);
    EXPECT_EQ(f.Lines(), (std::vector<std::string>{f.Time() + "     abc", "abc", "abc"}));
}

TEST(ActivityLog, ErrorLineForms) {
    LogFixture f;
    f.log.LogError("Globals", "WriteOptions");
    f.log.LogError("Globals", "LoadOptions", PendingError{53, "File not found", "Quorvane"});
    f.log.LogError("Globals", "LoadOptions", PendingError{0, "ignored"});
    f.log.LogError("Globals", "");
    EXPECT_EQ(f.Lines(), (std::vector<std::string>{
                             f.Time() + " *** Globals WriteOptions Error",
                             f.Time() + " *** Globals LoadOptions Error 53: File not found (Quorvane)",
                             f.Time() + " *** Globals LoadOptions Error",
                             std::string(60, '_')}));
}

TEST(ActivityLog, DisabledLogWritesNothingButStillYields) {
    LogFixture f;
    f.log.SetEnabled(false);
    f.log.WriteLog("abc");
    f.log.LogError("Globals", "LoadOptions");
    f.log.LogError("Globals", "LoadOptions", PendingError{5, "x"});
    EXPECT_FALSE(FileExists(f.dir / "quorvane.log"));
    EXPECT_EQ(f.yield.yields, 3);
}

TEST(ActivityLog, AppendsToExistingFileAndSurvivesUnwritableLog) {
    LogFixture f;
    f.dir.Write("quorvane.log", "old line\r\n");
    f.log.WriteLog("new", 1);
    EXPECT_EQ(f.Lines(), (std::vector<std::string>{"old line", "new"}));

    EnglishRegional regional;
    FixedClock clock;
    NoEventYield yield;
    ActivityLog nowhere(f.dir / "missing-folder" / "quorvane.log", regional, clock, yield);
    nowhere.SetEnabled(true);
    nowhere.WriteLog("lost");  // must not throw
    EXPECT_EQ(yield.yields, 1);
}

}  // namespace qv::test
