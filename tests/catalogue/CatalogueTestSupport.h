#pragma once
#include <string>
#include <vector>

#include "app/ActivityLog.h"
#include "platform/Clock.h"
#include "platform/EventYield.h"
#include "platform/Regional.h"
#include "platform/StatusDisplay.h"
#include "support/TempDir.h"

namespace qv::test {

class FixedClock final : public Clock {
public:
    std::time_t Now() const override { return 1079537400; }
};

// A wait window (shown unless told otherwise) that remembers every status text it was given.
class RecordingStatus final : public StatusDisplay {
public:
    bool IsVisible() const override { return visible; }
    void SetStatus(const std::string& text) override { texts.push_back(text); }
    bool visible = true;
    std::vector<std::string> texts;
};

// A real activity log in a temporary folder, enabled, with English formats.
struct TestLog {
    TempDir logDir;
    EnglishRegional regional;
    FixedClock clock;
    NoEventYield yield;
    ActivityLog log{logDir / "quorvane.log", regional, clock, yield};
    TestLog() { log.SetEnabled(true); }
    std::string Text() const { return logDir.Read("quorvane.log"); }
};

}  // namespace qv::test
