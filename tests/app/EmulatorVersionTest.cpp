#include <gtest/gtest.h>

#include "support/FixedLog.h"
#include "app/EmulatorVersion.h"
#include "platform/PosixProcessLauncher.h"

namespace qv::test {

namespace {

// The real launcher, counting what it is asked to start.
class CountingLauncher final : public ProcessLauncher {
public:
    ProcessId Start(const LaunchRequest& request) override {
        requests.push_back(request);
        return real.Start(request);
    }
    bool IsRunning(ProcessId id) override { return real.IsRunning(id); }
    PosixProcessLauncher real;
    std::vector<LaunchRequest> requests;
};

struct VersionFixture : LogFixture {
    Options options;
    CountingLauncher launcher;
    TempDir emulators;

    VersionFixture() { options.MamePath = emulators.path().string() + "/"; }

    // An emulator build in the emulator folder: the test emulator with a fixed banner.
    void AddEmulator(const std::string& name, const std::string& banner) {
        const auto path = emulators.Write(
            name, "#!/bin/sh\nexec '" + std::string(TEST_EMULATOR_PATH) + "' " + banner +
                      " \"$@\"\n");
        std::filesystem::permissions(path, std::filesystem::perms::owner_all);
    }

    EmulatorVersionCheck Check(HostConventions host = HostConventions::Posix()) {
        return EmulatorVersionCheck(options, dir.path(), host, log, launcher, yield);
    }
};

}  // namespace

TEST(VersionFromBanner, ClassicAndCurrentBanners) {
    const struct { const char* banner; const char* text; bool current; } cases[] = {
        {"M.A.M.E. v0.78 (Nov  1 2003) - Multiple Arcade Machine Emulator", "0.78", false},
        {"M.A.M.E. v0.100 (Oct 2005) - Multiple Arcade Machine Emulator", "0.10", false},
        {"MAME v0.251 (unknown)", "0.251", true},
        {"MAME v", "#N/A", false},
        {"0.251 (unknown)", "#N/A", false},
        {"multiple arcade machine emulator 0.78", "#N/A", false},
        {"", "#N/A", false},
    };
    for (const auto& c : cases) {
        SCOPED_TRACE(c.banner);
        const auto version = VersionFromBanner(c.banner);
        EXPECT_EQ(version.text, c.text);
        if (version.text != "#N/A") {
            EXPECT_EQ(version.current, c.current);
        }
    }
}

TEST(EmulatorVersionCheck, RunsEmulatorWithHelpAndReadsBothGenerations) {
    VersionFixture f;
    f.AddEmulator("mame", "--current");
    f.AddEmulator("oldmame", "--classic");
    auto check = f.Check();

    const auto current = check.Detect("mame", true);
    EXPECT_EQ(current.text, "0.251");
    EXPECT_TRUE(current.current);
    ASSERT_EQ(f.launcher.requests.size(), 1u);
    EXPECT_EQ(f.launcher.requests[0].program, f.options.MamePath + "mame");
    EXPECT_EQ(f.launcher.requests[0].arguments, std::vector<std::string>{"-help"});
    // The logs folder did not exist; it is created and the log stays there.
    EXPECT_EQ(f.dir.Read("logs/MAME.log").rfind("MAME v0.251 (unknown)\n", 0), 0u);

    EXPECT_EQ(check.GetMAMEVer("oldmame", true), "0.78");
    const auto lines = f.Lines();
    ASSERT_EQ(lines.size(), 2u);
    EXPECT_EQ(lines[1], f.Time() + "     Version of " + f.options.MamePath +
                            "oldmame: 0.78 -- M.A.M.E. v0.78 (Nov  1 2003) - Multiple Arcade "
                            "Machine Emulator");
}

TEST(EmulatorVersionCheck, RefreshFalseReusesStaleLog) {
    VersionFixture f;
    f.AddEmulator("mame", "--current");
    f.dir.Write("logs/MAME.log", "M.A.M.E. v0.37 (Jul 2000) - Multiple Arcade Machine Emulator\r\n");
    auto check = f.Check();
    EXPECT_EQ(check.GetMAMEVer("mame", false), "0.37");
    EXPECT_TRUE(f.launcher.requests.empty());
    EXPECT_EQ(check.GetMAMEVer("mame", true), "0.251");
    EXPECT_EQ(f.launcher.requests.size(), 1u);
    // Without a log, refresh false still runs the emulator.
    EXPECT_EQ(check.GetMAMEVer("mame2", false), "#N/A");
    EXPECT_EQ(f.launcher.requests.size(), 2u);
}

TEST(EmulatorVersionCheck, MissingEmulatorGivesNotAvailableEvenWithOldLog) {
    VersionFixture f;
    f.dir.Write("logs/GHOST.log", "MAME v0.200 (old)\n");
    auto check = f.Check();
    EXPECT_EQ(check.GetMAMEVer("ghost", true), "#N/A");
    const auto lines = f.Lines();
    ASSERT_EQ(lines.size(), 2u);
    EXPECT_EQ(lines[0], f.Time() + "     Failed to run " + f.options.MamePath + "ghost -help > \"" +
                            (f.dir / "logs" / "GHOST.log").string() + "\"");
    EXPECT_EQ(lines[1], f.Time() + "     Version of " + f.options.MamePath + "ghost: #N/A -- ");
}

TEST(EmulatorVersionCheck, NamesWithFoldersStartNothing) {
    VersionFixture f;
    auto check = f.Check();
    for (const std::string name : {"../mame", "sub/mame", "", ".."})
        EXPECT_EQ(check.GetMAMEVer(name, true), "#N/A") << name;
    EXPECT_TRUE(f.launcher.requests.empty());
    EXPECT_FALSE(std::filesystem::exists(f.dir / "logs"));
    EXPECT_EQ(f.Lines().size(), 4u);
}

TEST(EmulatorVersionCheck, WindowsConventionsNeedExeAndDropItFromLogName) {
    VersionFixture f;
    f.options.MamePath = "C:\\EMU\\";
    auto check = f.Check(HostConventions::Windows());
    EXPECT_EQ(check.VersionLogPath("mamepp.exe"), f.dir / "logs" / "MAMEPP.log");
    EXPECT_EQ(f.Check().VersionLogPath("mame.exe"), f.dir / "logs" / "MAME.EXE.log");

    EXPECT_EQ(check.GetMAMEVer("mamepp", true), "#N/A");
    EXPECT_TRUE(f.launcher.requests.empty());
    ASSERT_EQ(f.Lines().size(), 1u);
    EXPECT_EQ(f.Lines()[0], f.Time() + "     Version of " + f.options.MamePath + "mamepp: #N/A -- ");

    // With the extension the (stale) log is read as usual.
    f.dir.Write("logs/MAMEPP.log",
                "M.A.M.E. v0.78 (Nov  1 2003) - Multiple Arcade Machine Emulator\r\n");
    EXPECT_EQ(check.GetMAMEVer("MamePP.Exe", false), "0.78");
}

TEST(EmulatorVersionCheck, UncreatableLogsFolderIsLoggedAsError) {
    VersionFixture f;
    f.dir.Write("logs", "a file, not a folder");
    auto check = f.Check();
    EXPECT_EQ(check.GetMAMEVer("mame", true), "#N/A");
    EXPECT_TRUE(f.launcher.requests.empty());
    const auto lines = f.Lines();
    ASSERT_EQ(lines.size(), 1u);
    EXPECT_EQ(lines[0].rfind(f.Time() + " *** Globals GetMAMEVer Error 76: ", 0), 0u);
}

}  // namespace qv::test
