#pragma once
#include <ctime>
#include <string>
#include <vector>

#include "app/ActivityLog.h"
#include "app/TextFile.h"
#include "platform/Clock.h"
#include "platform/EventYield.h"
#include "platform/Regional.h"
#include "support/TempDir.h"

namespace qv::test {

// Every log line carries the same time, so tests can compare whole lines.
struct FixedClock final : Clock {
    std::time_t Now() const override { return now; }
    std::time_t now = 1079537400;  // March 2004
};

// A real, enabled activity log in a fresh temporary folder.
struct LogFixture {
    TempDir dir;
    EnglishRegional regional;
    FixedClock clock;
    NoEventYield yield;
    ActivityLog log{dir / "quorvane.log", regional, clock, yield};
    LogFixture() { log.SetEnabled(true); }
    std::string LogText() const { return dir.Read("quorvane.log"); }
    std::vector<std::string> Lines() const { return SplitLines(LogText()); }
    // The time stamp every line of this log carries.
    std::string Time() const { return regional.LongTime(clock.now); }
};

}  // namespace qv::test
