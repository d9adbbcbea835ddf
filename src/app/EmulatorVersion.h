#pragma once
#include <chrono>
#include <filesystem>
#include <string>
#include <string_view>

#include "app/ActivityLog.h"
#include "app/HostConventions.h"
#include "app/Options.h"
#include "app/SupportFileVersions.h"
#include "platform/EventYield.h"
#include "platform/ProcessLauncher.h"

namespace qv {

// An emulator version: the text shown everywhere ("0.78", "0.251" or "#N/A") and whether the
// emulator is of the current generation (banner "MAME v...") rather than the classic one.
struct EmulatorVersion {
    std::string text = kNotAvailable;
    bool current = false;
};

// The version in the first line of the emulator's output. Classic: the line contains
// "Multiple Arcade Machine Emulator" and characters 11 to 14 are the version. Current: the line
// starts with "MAME v" and the version runs to the next space.
EmulatorVersion VersionFromBanner(std::string_view firstLine);

// Runs an emulator build with "-help", its output going to logs/<NAME>.log in the application
// folder, and reads the version from the first line of that log.
class EmulatorVersionCheck {
public:
    EmulatorVersionCheck(const Options& options, std::filesystem::path appFolder,
                         HostConventions host, ActivityLog& log, ProcessLauncher& launcher,
                         EventYield& yield,
                         std::chrono::milliseconds maxWait = std::chrono::seconds(10));

    // refresh false reuses an existing version log without starting anything.
    EmulatorVersion Detect(const std::string& name, bool refresh);
    std::string GetMAMEVer(const std::string& name, bool refresh) {
        return Detect(name, refresh).text;
    }

    // logs/ + the name upper-cased (without ".EXE" under Windows conventions) + ".log".
    std::filesystem::path VersionLogPath(const std::string& name) const;

private:
    bool WaitForEnd(ProcessId id);

    const Options& options_;
    std::filesystem::path appFolder_;
    HostConventions host_;
    ActivityLog& log_;
    ProcessLauncher& launcher_;
    EventYield& yield_;
    std::chrono::milliseconds maxWait_;
};

}  // namespace qv
