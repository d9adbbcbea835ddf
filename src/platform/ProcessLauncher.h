#pragma once
#include <string>
#include <vector>

namespace qv {

// What to start: a program and its arguments, never a shell command line. Standard output and
// standard error go to outputFile (truncated) when it is not empty.
struct LaunchRequest {
    std::string program;
    std::vector<std::string> arguments;
    std::string outputFile;
    std::string workingDirectory;  // empty: the current one
};

using ProcessId = long;  // 0: not started

class ProcessLauncher {
public:
    virtual ~ProcessLauncher() = default;
    // Starts without waiting; returns the process id, or 0 when it could not be started.
    virtual ProcessId Start(const LaunchRequest& request) = 0;
    // True while the process runs. An ended child is reaped here, so it never lingers.
    virtual bool IsRunning(ProcessId id) = 0;
};

}  // namespace qv
