#include "app/ActivityLog.h"

#include "app/TextFile.h"

namespace qv {

namespace {
const std::string kSeparator(60, '_');
}

ActivityLog::ActivityLog(std::filesystem::path logFile, const Regional& regional,
                         const Clock& clock, EventYield& yield)
    : path_(std::move(logFile)), regional_(regional), clock_(clock), yield_(yield) {}

void ActivityLog::WriteLog(std::string_view text, int raw) {
    if (text.empty()) {
        Append(kSeparator);
    } else if (raw == 0) {
        Append(regional_.LongTime(clock_.Now()) + "     " + std::string(text));
    } else {
        Append(text);
    }
    yield_.Yield();
}

void ActivityLog::LogError(std::string_view where, std::string_view what) {
    if (what.empty()) {
        Append(kSeparator);
    } else {
        Append(regional_.LongTime(clock_.Now()) + " *** " + std::string(where) + " " +
               std::string(what) + " Error");
    }
    yield_.Yield();
}

void ActivityLog::LogError(std::string_view where, std::string_view what,
                           const PendingError& error) {
    if (what.empty() || error.number < 1) {
        LogError(where, what);
        return;
    }
    Append(regional_.LongTime(clock_.Now()) + " *** " + std::string(where) + " " +
           std::string(what) + " Error " + std::to_string(error.number) + ": " +
           error.description + " (" + error.source + ")");
    yield_.Yield();
}

void ActivityLog::Append(std::string_view line) {
    if (!enabled_) return;
    // A log that cannot be written must never stop the program; the line is dropped.
    AppendLine(path_, line);
}

}  // namespace qv
