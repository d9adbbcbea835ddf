#pragma once
#include <ctime>
#include <string>

#include "app/ActivityLog.h"
#include "platform/Clock.h"
#include "platform/EventYield.h"
#include "platform/Regional.h"
#include "support/TempDir.h"

namespace qv::test {

// Every log line carries the same time, so tests can compare whole lines.
struct FixedClock final : Clock {
    std::time_t Now() const override { return 1079537400; }
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
};

}  // namespace qv::test
