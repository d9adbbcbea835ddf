#include "app/EmulatorVersion.h"

#include <fstream>
#include <thread>

#include "app/TextFile.h"

namespace qv {

namespace {

constexpr std::string_view kClassicMarker = "Multiple Arcade Machine Emulator";
constexpr std::string_view kCurrentPrefix = "MAME v";

// A bare file name: anything with a folder in it could run a program outside the emulator
// folder and write its log outside the logs folder.
bool IsBareName(const std::string& name) {
    return !name.empty() && name != "." && name != ".." &&
           name.find_first_of("/\\") == std::string::npos;
}

bool EndsWith(std::string_view text, std::string_view end) {
    return text.size() >= end.size() && text.substr(text.size() - end.size()) == end;
}

std::string FirstLineOf(const std::filesystem::path& path) {
    std::ifstream in(path, std::ios::binary);
    std::string line;
    if (!in || !std::getline(in, line)) return {};
    if (!line.empty() && line.back() == '\r') line.pop_back();
    return line;
}

}  // namespace

EmulatorVersion VersionFromBanner(std::string_view firstLine) {
    EmulatorVersion version;
    if (firstLine.find(kClassicMarker) != std::string_view::npos) {
        version.text = std::string(firstLine.substr(10, 4));
    } else if (firstLine.substr(0, kCurrentPrefix.size()) == kCurrentPrefix) {
        std::string_view number = firstLine.substr(kCurrentPrefix.size());
        number = number.substr(0, number.find(' '));
        if (!number.empty()) {
            version.text = std::string(number);
            version.current = true;
        }
    }
    return version;
}

EmulatorVersionCheck::EmulatorVersionCheck(const Options& options,
                                           std::filesystem::path appFolder, HostConventions host,
                                           ActivityLog& log, ProcessLauncher& launcher,
                                           EventYield& yield, std::chrono::milliseconds maxWait)
    : options_(options),
      appFolder_(std::move(appFolder)),
      host_(host),
      log_(log),
      launcher_(launcher),
      yield_(yield),
      maxWait_(maxWait) {}

std::filesystem::path EmulatorVersionCheck::VersionLogPath(const std::string& name) const {
    std::string base = UpperAscii(name);
    if (host_.executablesHaveExtension)
        for (auto at = base.find(".EXE"); at != std::string::npos; at = base.find(".EXE", at))
            base.erase(at, 4);
    return appFolder_ / "logs" / (base + ".log");
}

bool EmulatorVersionCheck::WaitForEnd(ProcessId id) {
    const auto deadline = std::chrono::steady_clock::now() + maxWait_;
    while (launcher_.IsRunning(id)) {
        if (std::chrono::steady_clock::now() >= deadline) return false;
        yield_.Yield();
        std::this_thread::sleep_for(std::chrono::milliseconds(10));
    }
    return true;
}

EmulatorVersion EmulatorVersionCheck::Detect(const std::string& name, bool refresh) {
    const std::string program = host_.Join(options_.MamePath, name);
    EmulatorVersion version;
    std::string firstLine;

    const bool runnable = IsBareName(name) &&
                          (!host_.executablesHaveExtension || EndsWith(UpperAscii(name), ".EXE"));
    if (runnable) {
        const auto logPath = VersionLogPath(name);
        bool readLog = true;
        if (refresh || !FileExists(logPath)) {
            std::error_code error;
            std::filesystem::create_directories(logPath.parent_path(), error);
            if (error) {
                log_.LogError("Globals", "GetMAMEVer",
                              PendingError{76, "Cannot create " + logPath.parent_path().string() +
                                                   ": " + error.message()});
                return version;
            }
            std::string command = program + " -help > \"" + logPath.string() + "\"";
            if (host_.startThroughShell)
                command = (options_.Windows2000XP ? "Cmd.exe /C " : "Command.com /C ") + command;
            const ProcessId id = launcher_.Start({program, {"-help"}, logPath.string(), ""});
            if (id == 0) {
                log_.WriteLog("Failed to run " + command);
                // Whatever the log holds now is not this emulator's answer.
                readLog = false;
            } else {
                WaitForEnd(id);
            }
        }
        if (readLog) firstLine = FirstLineOf(logPath);
        version = VersionFromBanner(firstLine);
    }
    log_.WriteLog("Version of " + program + ": " + version.text + " -- " + firstLine);
    return version;
}

}  // namespace qv
