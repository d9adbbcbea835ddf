#pragma once
#include <filesystem>
#include <string>
#include <string_view>

#include "platform/Clock.h"
#include "platform/EventYield.h"
#include "platform/Regional.h"

namespace qv {

// A failure being reported: number, the platform's description, and the component that raised
// it ("Quorvane" for the program's own code).
struct PendingError {
    int number = 0;
    std::string description;
    std::string source = "Quorvane";
};

// quorvane.log: an append-only activity log, opened and closed for every line so each line is
// on disk when the call returns. Every call yields once to the event loop.
class ActivityLog {
public:
    ActivityLog(std::filesystem::path logFile, const Regional& regional, const Clock& clock,
                EventYield& yield);

    // Nothing is written until enabled; start-up enables it first thing.
    void SetEnabled(bool enabled) { enabled_ = enabled; }
    bool LogEnabled() const { return enabled_; }

    // raw 0: time stamp + five spaces + text. An empty text is a line of 60 underscores.
    void WriteLog(std::string_view text, int raw = 0);
    // time + " *** " + where + " " + what + " Error" [+ number, description and source].
    void LogError(std::string_view where, std::string_view what);
    void LogError(std::string_view where, std::string_view what, const PendingError& error);

    const std::filesystem::path& Path() const { return path_; }

private:
    void Append(std::string_view line);

    std::filesystem::path path_;
    const Regional& regional_;
    const Clock& clock_;
    EventYield& yield_;
    bool enabled_ = false;
};

}  // namespace qv
