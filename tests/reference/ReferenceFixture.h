#pragma once
#include <ctime>
#include <memory>

#include "app/ActivityLog.h"
#include "platform/Clock.h"
#include "platform/EventYield.h"
#include "platform/Regional.h"
#include "support/TempDir.h"

namespace qv::test {

// A real activity log in a temporary folder, for the reference tests.
struct LogFixture {
    struct FixedClock final : Clock {
        std::time_t Now() const override { return 1079537400; }
    };
    TempDir dir;
    EnglishRegional regional;
    FixedClock clock;
    NoEventYield yield;
    ActivityLog log{dir / "quorvane.log", regional, clock, yield};
    LogFixture() { log.SetEnabled(true); }
    std::string LogText() const { return dir.Read("quorvane.log"); }
};

}  // namespace qv::test
