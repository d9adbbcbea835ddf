#pragma once
#include "platform/ProcessLauncher.h"

namespace qv {

// Starts programs with posix_spawn: an argument list, never a shell, so no argument is ever
// interpreted. Ended children are reaped by IsRunning.
class PosixProcessLauncher final : public ProcessLauncher {
public:
    ProcessId Start(const LaunchRequest& request) override;
    bool IsRunning(ProcessId id) override;
};

}  // namespace qv
