#include <gtest/gtest.h>

#include <chrono>
#include <thread>

#include "platform/PosixProcessLauncher.h"
#include "support/TempDir.h"

namespace qv::test {

namespace {
// Waits (bounded) for the process to end; true when it did.
bool WaitForEnd(PosixProcessLauncher& launcher, ProcessId id, int seconds = 10) {
    const auto deadline = std::chrono::steady_clock::now() + std::chrono::seconds(seconds);
    while (launcher.IsRunning(id)) {
        if (std::chrono::steady_clock::now() > deadline) return false;
        std::this_thread::sleep_for(std::chrono::milliseconds(10));
    }
    return true;
}
}  // namespace

TEST(PosixProcessLauncher, ArgumentsArriveVerbatimOutputIsRedirectedAndEndedProcessIsReaped) {
    TempDir dir;
    PosixProcessLauncher launcher;
    const auto log = dir / "logs" / "game.log";  // the folder does not exist yet
    const ProcessId id = launcher.Start({TEST_EMULATOR_PATH,
                                         {"--classic", "--seconds", "0.5", "a;b $(x).zip", "`id`", "*"},
                                         log.string(), ""});
    ASSERT_GT(id, 0);
    EXPECT_TRUE(launcher.IsRunning(id));
    ASSERT_TRUE(WaitForEnd(launcher, id));
    // Reaped: the id no longer names a process (not even a zombie).
    EXPECT_FALSE(std::filesystem::exists("/proc/" + std::to_string(id)));
    EXPECT_FALSE(launcher.IsRunning(0));
    const std::string output = ReadAll(log);
    EXPECT_EQ(output.rfind("M.A.M.E. v0.78", 0), 0u) << output;
    EXPECT_NE(output.find("arguments: [--classic] [--seconds] [0.5] [a;b $(x).zip] [`id`] [*]"), std::string::npos)
        << output;
}

TEST(PosixProcessLauncher, OutputIsTruncatedAndWorkingDirectoryApplies) {
    TempDir dir;
    PosixProcessLauncher launcher;
    const auto log = dir.Write("out.log", std::string(10000, 'x'));
    dir.Write("work/marker", "");
    // A relative program path resolves against the working directory given.
    std::filesystem::copy_file(TEST_EMULATOR_PATH, dir / "work" / "emu");
    const ProcessId id = launcher.Start(
        {"./emu", {"--fps", "59.94"}, log.string(), (dir / "work").string()});
    ASSERT_GT(id, 0);
    ASSERT_TRUE(WaitForEnd(launcher, id));
    const std::string output = ReadAll(log);
    EXPECT_EQ(output.find('x'), std::string::npos);
    EXPECT_NE(output.find("Average FPS: 59.94"), std::string::npos) << output;
}

TEST(PosixProcessLauncher, MissingProgramOrUnwritableOutputStartsNothing) {
    TempDir dir;
    PosixProcessLauncher launcher;
    const auto log = dir.Write("old.log", "stale output\n");
    EXPECT_EQ(launcher.Start({(dir / "no-such-emulator").string(), {}, log.string(), ""}), 0);
    EXPECT_EQ(ReadAll(log), "");  // an old output never passes for a new one
    dir.Write("blocked", "a file where a folder should be");
    EXPECT_EQ(launcher.Start({TEST_EMULATOR_PATH, {}, (dir / "blocked" / "x.log").string(), ""}),
              0);
    EXPECT_EQ(launcher.Start({"", {}, "", ""}), 0);
}

}  // namespace qv::test
