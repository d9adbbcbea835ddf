#pragma once
#include <ctime>
#include <filesystem>
#include <string>
#include <vector>

#include "app/ActivityLog.h"
#include "app/TextFile.h"
#include "platform/Clock.h"
#include "platform/EventYield.h"
#include "platform/Regional.h"
#include "support/TempDir.h"

namespace qv::test {

class FixedClock final : public Clock {
public:
    std::time_t Now() const override { return now; }
    std::time_t now = 1079537400;  // March 2004
};

// An enabled activity log in a temporary folder, with its lines readable back.
struct LogFixture {
    TempDir dir;
    EnglishRegional regional;
    FixedClock clock;
    NoEventYield yield;
    ActivityLog log{dir / "quorvane.log", regional, clock, yield};

    LogFixture() { log.SetEnabled(true); }
    std::vector<std::string> Lines() const { return SplitLines(dir.Read("quorvane.log")); }
    std::string Time() const { return regional.LongTime(clock.now); }
};

}  // namespace qv::test
