#pragma once
#include <string>
#include <vector>

#include "app/ActivityLog.h"
#include "platform/Clock.h"
#include "platform/EventYield.h"
#include "platform/Regional.h"
#include "platform/StatusDisplay.h"
#include "support/FixedLog.h"
#include "support/TempDir.h"

namespace qv::test {

// A wait window (shown unless told otherwise) that remembers every status text it was given.
class RecordingStatus final : public StatusDisplay {
public:
    bool IsVisible() const override { return visible; }
    void SetStatus(const std::string& text) override { texts.push_back(text); }
    bool visible = true;
    std::vector<std::string> texts;
};

// The shared fixed-time log, read back as one text.
struct TestLog : LogFixture {
    std::string Text() const { return LogText(); }
};

}  // namespace qv::test
