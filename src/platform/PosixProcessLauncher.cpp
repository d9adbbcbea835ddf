#include "platform/PosixProcessLauncher.h"

#include <cerrno>
#include <fcntl.h>
#include <filesystem>
#include <signal.h>
#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>
#include <vector>

extern char** environ;

namespace qv {

namespace {

// The output file is opened here, before the start, so it is truncated even when the program
// cannot be started and an old output never passes for a new one.
int OpenOutput(const std::string& outputFile) {
    std::error_code ignored;
    const std::filesystem::path path(outputFile);
    if (path.has_parent_path()) std::filesystem::create_directories(path.parent_path(), ignored);
    return ::open(outputFile.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, 0644);
}

}  // namespace

ProcessId PosixProcessLauncher::Start(const LaunchRequest& request) {
    if (request.program.empty()) return 0;

    int output = -1;
    if (!request.outputFile.empty()) {
        output = OpenOutput(request.outputFile);
        if (output < 0) return 0;
    }

    posix_spawn_file_actions_t actions;
    posix_spawn_file_actions_init(&actions);
    bool ready = true;
    if (output >= 0) {
        ready = posix_spawn_file_actions_adddup2(&actions, output, STDOUT_FILENO) == 0 &&
                posix_spawn_file_actions_adddup2(&actions, output, STDERR_FILENO) == 0;
    }
    if (ready && !request.workingDirectory.empty())
        ready = posix_spawn_file_actions_addchdir_np(&actions,
                                                     request.workingDirectory.c_str()) == 0;

    std::vector<std::string> args;
    args.reserve(request.arguments.size() + 1);
    args.push_back(request.program);
    args.insert(args.end(), request.arguments.begin(), request.arguments.end());
    std::vector<char*> argv;
    for (auto& arg : args) argv.push_back(arg.data());
    argv.push_back(nullptr);

    pid_t pid = 0;
    int failed = ready ? posix_spawn(&pid, request.program.c_str(), &actions, nullptr,
                                     argv.data(), environ)
                       : EINVAL;
    posix_spawn_file_actions_destroy(&actions);
    if (output >= 0) ::close(output);
    if (failed != 0) return 0;
    return static_cast<ProcessId>(pid);
}

bool PosixProcessLauncher::IsRunning(ProcessId id) {
    if (id <= 0) return false;
    int status = 0;
    const pid_t result = ::waitpid(static_cast<pid_t>(id), &status, WNOHANG);
    if (result == 0) return true;  // our child, still running
    if (result == static_cast<pid_t>(id)) return false;  // ended, now reaped
    // Not our child (or already reaped): ask whether such a process exists at all.
    return errno == ECHILD && ::kill(static_cast<pid_t>(id), 0) == 0;
}

}  // namespace qv
