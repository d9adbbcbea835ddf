#include <gtest/gtest.h>

#include <filesystem>

#include "platform/PosixProcessLauncher.h"
#include "platform/Regional.h"
#include "support/ScriptedPrompt.h"
#include "support/TempDir.h"
#include "ui/PlayForm.h"
#include "ui/StartUp.h"
#include "ui/WaitWindow.h"

namespace qv::test {
namespace {

class FixedHostInfo final : public HostInfo {
public:
    std::string GetLocalIP() override { return "10.1.2.3"; }
    std::string GetLocalHostName() override { return "arcade"; }
};

// Starts the program's start-up on a home folder, with the stand-in emulator as the default
// emulator.
class StartUpTest : public ::testing::Test {
protected:
    void SetUp() override {
        home.Write("mame_rom_lib.inc", "# lib\r\n#\r\n# Revision: 7\r\n"
                                       "pong\tPong\t1972\tAtari\tYes\tYes\tYes\tNo\tSports\t\r\n");
        home.Write("games.inc", "pong.zip\tPong\r\n");
        program.appFolder = home.path();
        program.regional = std::make_unique<EnglishRegional>();
        program.clock = std::make_unique<SystemClock>();
        program.yield = std::make_unique<NoEventYield>();
        program.prompt = std::make_unique<ScriptedPrompt>();
        program.OpenLog();
    }

    void WriteConfig() {
        const std::filesystem::path emulator(TEST_EMULATOR_PATH);
        home.Write("config.inc", "# test\r\n    MamePath = " + emulator.parent_path().string() +
                                     "/\r\n    MameExec = " + emulator.filename().string() +
                                     "\r\n    DefaultROMdir = " + (home / "roms").string() +
                                     "\r\n    Speak = No\r\n");
        home.Write("roms/pong.zip", "");
    }

    void Start() {
        BeginRun(program, hostInfo, 1024, 768, home.path().string());
        wait = std::make_unique<WaitWindow>(nullptr);
        form = std::make_unique<PlayForm>(program, wait.get());
        OpenFirstWindow(program, hostInfo, home.path().string(), launcher, *wait, *form);
    }

    // The lines appear in the log in this order (other lines may come between them).
    static ::testing::AssertionResult InOrder(const std::string& log,
                                              const std::vector<std::string>& lines) {
        std::size_t at = 0;
        for (const std::string& line : lines) {
            const std::size_t found = log.find(line, at);
            if (found == std::string::npos)
                return ::testing::AssertionFailure() << "missing in order: " << line << "\n"
                                                     << log;
            at = found + line.size();
        }
        return ::testing::AssertionSuccess();
    }

    TempDir home;
    Program program;
    FixedHostInfo hostInfo;
    PosixProcessLauncher launcher;
    std::unique_ptr<WaitWindow> wait;
    std::unique_ptr<PlayForm> form;
};

TEST_F(StartUpTest, WithSettingsReadsThemAsksTheEmulatorLoadsTheLibraryAndOpensTheWindow) {
    WriteConfig();
    Start();
    const std::string log = home.Read("quorvane.log");
    EXPECT_TRUE(InOrder(log, {"\r\nQuorvane\r\n", "Version 2.25.031704 Build ",
                              "Client IP: 10.1.2.3 (arcade)\r\n", "Screen Size: 1024 x 768\r\n",
                              "Started: ", std::string(60, '_') + "\r\n", "Loading Options...",
                              "Loading MAME Info...", "Loading ROM Info ("}));
    EXPECT_EQ(program.mameVersion, "0.251");
    EXPECT_EQ(program.options.DefaultROMdir, (home / "roms").string());
    EXPECT_EQ(program.romLibrary.Count(), 1);
    EXPECT_TRUE(program.gameRecords.Item("pong.zip")->Present);
    EXPECT_TRUE(form->isVisible());
    EXPECT_FALSE(wait->isVisible());  // closed by the window's load
}

TEST_F(StartUpTest, WithoutSettingsOpensTheWindowOnTheBuiltInDefaults) {
    Start();
    const std::string log = home.Read("quorvane.log");
    EXPECT_TRUE(InOrder(log, {"\r\nQuorvane\r\n", "Screen Size: 1024 x 768\r\n",
                              std::string(60, '_') + "\r\n", "Loading MAME Info..."}));
    EXPECT_EQ(log.find("Loading Options..."), std::string::npos);
    EXPECT_EQ(program.options.MameExec, "mame");
    EXPECT_EQ(program.options.GamesFile, (home / "games.inc").string());
    EXPECT_EQ(program.romLibrary.Count(), 1);
    EXPECT_TRUE(form->isVisible());
    EXPECT_FALSE(wait->isVisible());
}

}  // namespace
}  // namespace qv::test
