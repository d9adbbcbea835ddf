#include <gtest/gtest.h>

#include "support/FixedLog.h"

namespace qv::test {

TEST(ActivityLog, LineFormsSeparatorsAndErrors) {
    LogFixture f;
    f.dir.Write("quorvane.log", "old line\r\n");  // appended to, never replaced
    f.log.WriteLog("", 1);                         // empty text: a separator whatever raw is
    f.log.WriteLog("abc", 0);
    f.log.WriteLog("abc", -3);
    f.log.LogError("Globals", "WriteOptions");
    f.log.LogError("Globals", "LoadOptions", PendingError{53, "File not found", "Quorvane"});
    f.log.LogError("Globals", "LoadOptions", PendingError{0, "ignored"});
    f.log.LogError("Globals", "");
    const std::string separator(60, '_');
    EXPECT_EQ(f.Lines(), (std::vector<std::string>{
                             "old line", separator, f.Time() + "     abc", "abc",
                             f.Time() + " *** Globals WriteOptions Error",
                             f.Time() + " *** Globals LoadOptions Error 53: File not found (Quorvane)",
                             f.Time() + " *** Globals LoadOptions Error", separator}));
    EXPECT_EQ(f.dir.Read("quorvane.log").substr(0, 10 + 62), "old line\r\n" + separator + "\r\n");
}

TEST(ActivityLog, DisabledOrUnwritableLogWritesNothingButStillYields) {
    LogFixture f;
    f.log.SetEnabled(false);
    f.log.WriteLog("abc");
    f.log.LogError("Globals", "LoadOptions", PendingError{5, "x"});
    EXPECT_FALSE(FileExists(f.dir / "quorvane.log"));
    EXPECT_EQ(f.yield.yields, 2);

    ActivityLog nowhere(f.dir / "missing-folder" / "quorvane.log", f.regional, f.clock, f.yield);
    nowhere.SetEnabled(true);
    nowhere.WriteLog("lost");  // must not throw
    EXPECT_EQ(f.yield.yields, 3);
}

}  // namespace qv::test
