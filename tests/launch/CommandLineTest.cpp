// The emulator command: classic texts under Windows conventions, the current argument list.
// The switch conditions (cheats need the file, artwork the folder) are shared by both layouts
// and checked once, on the classic text.
#include <gtest/gtest.h>

#include <algorithm>
#include <set>

#include "app/OptionsFile.h"
#include "launch/CommandLine.h"
#include "launch/GameLog.h"
#include "support/TempDir.h"

namespace qv {
namespace {

class ClassicCommandTest : public ::testing::Test {
protected:
    ClassicCommandTest() {
        SetDefaults(options, "C:\\APP", host, "");
        game.RomFile = "pacman.zip";
    }
    CommandInputs Inputs() {
        return CommandInputs{options, game, switches, resolution, safeMode, "C:\\MAME\\ROMS",
                             GameLogPath("C:\\APP", game.RomFile, host),
                             [this](const std::string& p) { return existing.count(p) > 0; }};
    }
    std::string Text() { return ClassicCommandText(Inputs(), host); }

    HostConventions host = HostConventions::Windows();
    Options options;
    MyClass game;
    RunSwitches switches;
    std::string resolution = "Auto";
    bool safeMode = false;
    std::set<std::string> existing{"C:\\MAME\\CHEAT.DAT"};
};

TEST_F(ClassicCommandTest, FullLayoutWithDefaultsIsTheDocumentedText) {
    EXPECT_EQ(Text(),
              "Cmd.exe /C C:\\MAME\\MAMEPP.EXE pacman.zip -rp C:\\MAME\\ROMS -joy "
              "-ctrlr_directory C:\\MAME -ctrlr DEFAULT.ZIP -hiscore_directory C:\\MAME\\HI "
              "-snapshot_directory C:\\MAME\\SNAP -noart -sp C:\\MAME\\SAMPLES "
              "-history_file C:\\MAME\\HISTORY.DAT -mameinfo_file C:\\MAME\\MAMEINFO.DAT "
              "-state_directory C:\\MAME\\STA -skip_disclaimer -skip_gameinfo  > "
              "\"C:\\APP\\logs\\pacman.log\"");
    options.Windows2000XP = false;
    EXPECT_EQ(Text().rfind("Command.com /C C:\\MAME\\MAMEPP.EXE pacman.zip -rp ", 0), 0u);
}

TEST_F(ClassicCommandTest, EverySwitchOnInFullLayoutOrder) {
    game.Mouse = true;
    options.Sound = false;
    options.SteadyKey = true;
    options.Volume = -12;
    switches = {true, true, true, true};
    resolution = "640 x 480";
    EXPECT_EQ(Text(),
              "Cmd.exe /C C:\\MAME\\MAMEPP.EXE pacman.zip -rp C:\\MAME\\ROMS -mouse -nosound "
              "-cheat_file C:\\MAME\\CHEAT.DAT -c -r 640x480 -joy -ctrlr_directory C:\\MAME "
              "-ctrlr DEFAULT.ZIP -hiscore_directory C:\\MAME\\HI "
              "-snapshot_directory C:\\MAME\\SNAP -artwork_directory C:\\MAME\\ARTWORK -steady "
              "-vol -12 -sp C:\\MAME\\SAMPLES -history_file C:\\MAME\\HISTORY.DAT "
              "-mameinfo_file C:\\MAME\\MAMEINFO.DAT -state_directory C:\\MAME\\STA "
              "-high_priority -w -skip_disclaimer -skip_gameinfo  > \"C:\\APP\\logs\\pacman.log\"");
}

TEST_F(ClassicCommandTest, SafeModeKeepsOnlyTheShortSubset) {
    game.Mouse = true;
    options.Sound = false;
    options.SteadyKey = true;
    options.Volume = -3;
    safeMode = true;
    switches = {true, false, true, true};
    resolution = "800 x 600";
    EXPECT_EQ(Text(), "Cmd.exe /C C:\\MAME\\MAMEPP.EXE pacman.zip -rp C:\\MAME\\ROMS -mouse "
                      "-nosound -cheat_file C:\\MAME\\CHEAT.DAT -c -joy -noart -vol -3 "
                      "-skip_disclaimer -skip_gameinfo  > \"C:\\APP\\logs\\pacman.log\"");
    switches.Artwork = true;
    EXPECT_NE(Text().find(" -artwork_directory C:\\MAME\\ARTWORK -vol -3 "), std::string::npos);
}

TEST_F(ClassicCommandTest, PieceConditions) {
    // Cheats need the switch and the file.
    switches.Cheats = true;
    existing.clear();
    EXPECT_EQ(Text().find("-cheat_file"), std::string::npos);
    // Artwork on: the folder and no "-noart"; artwork on with no folder: neither.
    switches.Artwork = true;
    EXPECT_NE(Text().find("-artwork_directory C:\\MAME\\ARTWORK "), std::string::npos);
    EXPECT_EQ(Text().find("-noart"), std::string::npos);
    options.ArtworkDir.clear();
    EXPECT_EQ(Text().find("-artwork"), std::string::npos);
    // Volume 0 gives no piece; a resolution keeps no blanks.
    EXPECT_EQ(Text().find("-vol"), std::string::npos);
    resolution = " 1024 x 768";
    EXPECT_NE(Text().find(" -r 1024x768 -joy "), std::string::npos);
    // Upper-case archive names keep their name in the log (the replacement is exact-case).
    game.RomFile = "PACMAN.ZIP";
    EXPECT_NE(Text().find("\"C:\\APP\\logs\\PACMAN.ZIP\""), std::string::npos);
}

class CurrentCommandTest : public ::testing::Test {
protected:
    CurrentCommandTest() {
        options.MamePath = "/usr/games/";
        options.MameExec = "mame";
        options.Joystick = false;
        options.Sound = true;
        game.RomFile = "pong.zip";
    }
    EmulatorCommand Command() {
        return CurrentCommand(CommandInputs{options, game, switches, resolution, safeMode,
                                            "/roms", "/app/logs/pong.log", nullptr},
                              HostConventions::Posix());
    }
    using Args = std::vector<std::string>;

    test::TempDir dir;
    Options options;
    MyClass game;
    RunSwitches switches;
    std::string resolution = "Auto";
    bool safeMode = false;
};

TEST_F(CurrentCommandTest, BareCommandIsArchiveRomPathAndFixedSwitch) {
    const EmulatorCommand command = Command();
    EXPECT_EQ(command.program, "/usr/games/mame");
    EXPECT_EQ(command.arguments, (Args{"pong.zip", "-rompath", "/roms", "-skip_gameinfo"}));
    options.MamePath = "/opt/mame";  // a folder without its trailing separator still joins
    EXPECT_EQ(Command().program, "/opt/mame/mame");
}

TEST_F(CurrentCommandTest, EverythingOnInOrder) {
    const std::string d = dir.path().string();
    dir.Write("ctrlr/gamepad.cfg", "<mameconfig/>");
    dir.Write("cheat.dat", "");
    options.CheatsFile = d + "/cheat.dat";
    options.CtrlrDir = d + "/ctrlr";
    options.CtrlrFile = "gamepad.zip";
    options.SnapDir = "/s";
    options.ArtworkDir = "/a";
    options.SamplesDir = "/sa";
    options.StateDir = "/st";
    options.HighDir = "/hi";  // no current form
    options.HistoryFile = "/h.dat";
    options.MameInfoFile = "/i.dat";
    options.SteadyKey = true;
    options.Sound = false;
    options.Joystick = true;
    options.Volume = -12;
    game.Mouse = true;
    switches = {true, true, true, true};
    resolution = "640 x 480";
    EXPECT_EQ(Command().arguments,
              (Args{"pong.zip", "-rompath", "/roms", "-mouse", "-sound", "none", "-cheat",
                    "-cheatpath", d, "-resolution", "640x480", "-joystick", "-ctrlrpath",
                    d + "/ctrlr", "-ctrlr", "gamepad", "-snapshot_directory", "/s", "-artpath",
                    "/a", "-volume", "-12", "-samplepath", "/sa", "-state_directory", "/st",
                    "-window", "-skip_gameinfo"}));

    safeMode = true;
    EXPECT_EQ(Command().arguments,
              (Args{"pong.zip", "-rompath", "/roms", "-mouse", "-sound", "none", "-cheat",
                    "-cheatpath", d, "-joystick", "-artpath", "/a", "-volume", "-12",
                    "-skip_gameinfo"}));
}

TEST_F(CurrentCommandTest, ControllerFileOnlyWhenItsCfgExists) {
    options.CtrlrDir = dir.path().string();
    options.CtrlrFile = "DEFAULT.ZIP";
    Args args = Command().arguments;
    EXPECT_EQ(std::count(args.begin(), args.end(), "-ctrlr"), 0);
    EXPECT_EQ(std::count(args.begin(), args.end(), "-ctrlrpath"), 1);

    dir.Write("DEFAULT.cfg", "<mameconfig/>");
    args = Command().arguments;
    auto at = std::find(args.begin(), args.end(), "-ctrlr");
    ASSERT_NE(at, args.end());
    EXPECT_EQ(*(at + 1), "DEFAULT");
}

TEST_F(CurrentCommandTest, UnsafeArchiveNameStaysOneArgumentAndLogTextQuotesIt) {
    game.RomFile = "a;b $(x).zip";
    const EmulatorCommand command = Command();
    EXPECT_EQ(command.arguments.front(), "a;b $(x).zip");
    EXPECT_EQ(CommandText(command, "/app/logs/a;b $(x).log"),
              "/usr/games/mame \"a;b $(x).zip\" -rompath /roms -skip_gameinfo > "
              "\"/app/logs/a;b $(x).log\"");
}

}  // namespace
}  // namespace qv
