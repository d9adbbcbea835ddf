#include <gtest/gtest.h>

#include <algorithm>

#include "AppTestSupport.h"
#include "app/NetworkSwitch.h"
#include "app/OptionsFile.h"

namespace qv::test {

namespace {

class FakeHostInfo final : public HostInfo {
public:
    std::string GetLocalIP() override { ++lookups; return ip; }
    std::string GetLocalHostName() override { return "box"; }
    std::string ip = "192.168.10.17";
    int lookups = 0;
};

struct ConfigFixture : LogFixture {
    Options options;
    NoStatusDisplay status;

    ConfigFixture() { SetDefaults(options, dir.path(), HostConventions::Posix(), "/home/u"); }

    void Load(std::string_view text) {
        dir.Write("config.inc", text);
        LoadOptions(options, dir / "config.inc", log, status);
    }
};

class RecordingStatus final : public StatusDisplay {
public:
    bool IsVisible() const override { return visible; }
    void SetStatus(const std::string& text) override { shown.push_back(text); }
    bool visible = true;
    std::vector<std::string> shown;
};

}  // namespace

TEST(SetDefaults, PosixHostUsesHomeFoldersAndSystemEmulator) {
    Options o;
    FakeHostInfo host;
    SetDefaults(o, "/data/quorvane", HostConventions::Posix(), "/home/u", &host);
    EXPECT_EQ(o.MamePath, "/usr/games/");
    EXPECT_EQ(o.MameExec, "mame");
    EXPECT_EQ(o.DefaultROMdir, "/home/u/mame/roms");
    EXPECT_EQ(o.CheatsFile, "/home/u/mame/cheat.dat");
    EXPECT_EQ(o.CtrlrDir, "/home/u/mame/ctrlr");
    EXPECT_EQ(o.SnapDir, "/home/u/mame/snap");
    EXPECT_EQ(o.HighDir, "/home/u/mame/hi");
    EXPECT_EQ(o.ArtworkDir, "/home/u/mame/artwork");
    EXPECT_EQ(o.StateDir, "/home/u/mame/sta");
    EXPECT_EQ(o.MarqueeDir, "/home/u/mame/marquee");
    EXPECT_EQ(o.SamplesDir, "/home/u/mame/samples");
    EXPECT_EQ(o.HistoryFile, "/home/u/mame/history.dat");
    EXPECT_EQ(o.MameInfoFile, "/home/u/mame/mameinfo.dat");
    EXPECT_EQ(o.GamesFile, "/data/quorvane/games.inc");
    EXPECT_EQ(o.RomLibraryFile, "/data/quorvane/mame_rom_lib.inc");
    EXPECT_EQ(o.Intro, "Hey you!  Would you like to play a game?");
    EXPECT_EQ(o.Rate5, "This game rocks!");
    EXPECT_EQ(o.ScreenshotsURL, "downloads.quorvane.org/quorvane/downloads/snap/");
    EXPECT_EQ(o.LiveUpdateURL, "downloads.quorvane.org/quorvane/downloads/files");
    EXPECT_EQ(o.MarqueeURL, "downloads.quorvane.org/quorvane/downloads/marquee/");
    EXPECT_EQ(o.Resolutions, "320 x 240, 640 x 480, 800 x 600, 1024 x 768");
    EXPECT_TRUE(o.Edit && o.LogGameOutput && o.Joystick && o.Sound && o.SaveOnExit && o.Speak);
    EXPECT_FALSE(o.ShowHidden || o.ShowWorking || o.SteadyKey);
    EXPECT_EQ(o.Volume, 0);
    EXPECT_EQ(o.Voice, 1);
    // No private network is configured, so the address is not even asked for.
    EXPECT_EQ(host.lookups, 0);
}

TEST(SetDefaults, WindowsConventionsGiveClassicLayoutAndClearRomServer) {
    Options o;
    o.RomsURL = "server";
    o.RomsPassword = "secret";
    SetDefaults(o, "C:\\Program Files\\Quorvane", HostConventions::Windows(), "");
    EXPECT_EQ(o.MamePath, "C:\\MAME\\");
    EXPECT_EQ(o.MameExec, "MAMEPP.EXE");
    EXPECT_EQ(o.DefaultROMdir, "C:\\MAME\\ROMS");
    EXPECT_EQ(o.CheatsFile, "C:\\MAME\\CHEAT.DAT");
    EXPECT_EQ(o.CtrlrFile, "DEFAULT.ZIP");
    EXPECT_EQ(o.CtrlrDir, "C:\\MAME");
    EXPECT_EQ(o.MameInfoFile, "C:\\MAME\\MAMEINFO.DAT");
    EXPECT_EQ(o.MarqueeDir, "C:\\MAME\\MARQUEE");
    EXPECT_EQ(o.GamesFile, "C:\\Program Files\\Quorvane\\games.inc");
    EXPECT_EQ(o.RomsURL, "");
    EXPECT_EQ(o.RomsPassword, "");
}

TEST(NetworkSwitch, ReplacesWebHostOnlyOnMatchingPrefix) {
    Options o;
    SetDefaults(o, "/q", HostConventions::Posix(), "/h");
    Options other = o;
    ApplyNetworkSwitch(other, "192.168.10.17", "192.168.20", "10.1.1.1");
    EXPECT_EQ(other.ScreenshotsURL, o.ScreenshotsURL);
    ApplyNetworkSwitch(o, "", "", "10.1.1.1");  // empty prefix never applies
    EXPECT_EQ(o.ScreenshotsURL, other.ScreenshotsURL);

    ApplyNetworkSwitch(o, "192.168.10.17", "192.168.10", "10.1.1.1");
    EXPECT_EQ(o.ScreenshotsURL, "10.1.1.1/quorvane/downloads/snap/");
    EXPECT_EQ(o.MarqueeURL, "10.1.1.1/quorvane/downloads/marquee/");
    EXPECT_EQ(o.LiveUpdateURL, "10.1.1.1/quorvane/downloads/files");
}

TEST(LoadOptions, NumbersAreClampedAndNeverOverflow) {
    const std::vector<std::pair<std::string, int>> volumes = {
        {"5", 0}, {"-40", -32}, {"loud", 0}, {"-7", -7}, {"-12.5", -12}, {"99999999999", 0},
        {"-1e30", -32}, {"", 0}, {"inf", 0}, {"-nan", 0}};
    for (const auto& [text, expected] : volumes) {
        ConfigFixture f;
        f.options.Volume = -5;
        f.Load("Volume = " + text + "\r\n");
        EXPECT_EQ(f.options.Volume, expected) << text;
    }
    const std::vector<std::pair<std::string, int>> voices = {
        {"x", 1}, {"3", 3}, {"-2", -2}, {"70000", 1}, {"2.5", 2}, {"+4", 4}};
    for (const auto& [text, expected] : voices) {
        ConfigFixture f;
        f.options.Voice = 9;
        f.Load("Voice = " + text + "\r\n");
        EXPECT_EQ(f.options.Voice, expected) << text;
    }
}

TEST(LoadOptions, BooleansAreTrueOnlyForYes) {
    for (const auto& [text, expected] :
         std::vector<std::pair<std::string, bool>>{
             {"yes", true}, {"YES", true}, {"Yes", true}, {"True", false}, {"1", false}, {"", false}}) {
        ConfigFixture f;
        f.options.Edit = !expected;
        f.options.SteadyKey = !expected;
        f.Load("Edit = " + text + "\nSteadyKey=" + text + "\n");
        EXPECT_EQ(f.options.Edit, expected) << text;
        EXPECT_EQ(f.options.SteadyKey, expected) << text;
    }
}

TEST(LoadOptions, KeysIgnoreCaseSpacesAndAliases) {
    ConfigFixture f;
    f.Load("  Screenshots URL = x  \r\n"
           "ArtDir = D:\\ART\n"
           "ctrlr = joy.cfg\n"
           "mame info = info.dat\n"
           "ROMURL = roms.example\n"
           "RomUserName = me\n"
           "ROMPASSWORD = pw\n"
           "Unknown Key = whatever\n"
           "# Intro = commented out\n"
           "\n"
           "Intro = Hello  there\n");
    EXPECT_EQ(f.options.ScreenshotsURL, "x");
    EXPECT_EQ(f.options.ArtworkDir, "D:\\ART");
    EXPECT_EQ(f.options.CtrlrFile, "joy.cfg");
    EXPECT_EQ(f.options.MameInfoFile, "info.dat");
    EXPECT_EQ(f.options.RomsURL, "roms.example");
    EXPECT_EQ(f.options.RomsUserName, "me");
    EXPECT_EQ(f.options.RomsPassword, "pw");
    EXPECT_EQ(f.options.Intro, "Hello  there");

    ConfigFixture g;
    g.Load("SCREENSHOTSURL = y\nArtworkDir = E:\\ART\nCTRLRFILE = b.cfg\n");
    EXPECT_EQ(g.options.ScreenshotsURL, "y");
    EXPECT_EQ(g.options.ArtworkDir, "E:\\ART");
    EXPECT_EQ(g.options.CtrlrFile, "b.cfg");
}

TEST(LoadOptions, ValuesAreCutAtSecondEqualsAndMamePathDropsExactExeName) {
    ConfigFixture f;
    f.Load("LiveUpdateURL = host/a?b=c\nMamePath = C:\\EMU\\MAMEPP.EXE\nGameType = A , B\n");
    EXPECT_EQ(f.options.LiveUpdateURL, "host/a?b");
    EXPECT_EQ(f.options.MamePath, "C:\\EMU\\");
    EXPECT_EQ(f.options.GameType, "A , B");

    ConfigFixture g;
    g.Load("MamePath = C:\\EMU\\mamepp.exe\n");
    EXPECT_EQ(g.options.MamePath, "C:\\EMU\\mamepp.exe");
}

TEST(LoadOptions, StrayLineStopsReadingAndIsLogged) {
    ConfigFixture f;
    f.Load("Sound = No\r\nthis line is stray\r\nJoystick = No\r\n");
    EXPECT_FALSE(f.options.Sound);
    EXPECT_TRUE(f.options.Joystick);
    const auto lines = f.Lines();
    ASSERT_EQ(lines.size(), 2u);
    EXPECT_EQ(lines[0], f.Time() + "     Loading Options...");
    EXPECT_EQ(lines[1].rfind(f.Time() + " *** Globals LoadOptions Error 9: ", 0), 0u) << lines[1];
}

TEST(LoadOptions, MissingFileKeepsValuesAndShowsProgress) {
    ConfigFixture f;
    f.options.Intro = "mine";
    RecordingStatus status;
    LoadOptions(f.options, f.dir / "config.inc", f.log, status);
    EXPECT_EQ(f.options.Intro, "mine");
    EXPECT_EQ(status.shown, (std::vector<std::string>{"Loading Options ..."}));
    EXPECT_EQ(f.Lines(), (std::vector<std::string>{f.Time() + "     Loading Options..."}));
}

TEST(WriteOptions, PosixLayoutKeepsPathCase) {
    ConfigFixture f;
    f.options.GameType = "Shooter,Maze";
    f.options.Volume = -12;
    f.options.Voice = 3;
    f.options.ShowHidden = true;
    ASSERT_EQ(WriteOptions(f.options, f.dir / "config.inc", HostConventions::Posix(), f.regional,
                           f.clock, f.log),
              "");
    const std::string bytes = f.dir.Read("config.inc");
    const auto lines = SplitLines(bytes);
    ASSERT_EQ(lines.size(), 70u);
    // CR LF after every line, the last one included.
    EXPECT_EQ(std::count(bytes.begin(), bytes.end(), '\n'), 70);
    std::size_t crlf = 0;
    for (auto at = bytes.find("\r\n"); at != std::string::npos; at = bytes.find("\r\n", at + 2)) ++crlf;
    EXPECT_EQ(crlf, 70u);
    EXPECT_EQ(lines[0], "# Quorvane Configuration File");
    EXPECT_EQ(lines[1], "# Updated: " + f.regional.GeneralDate(f.clock.now));
    EXPECT_EQ(lines[3], " ### MAME Path, Files information");
    EXPECT_EQ(lines[4], "    MamePath = /usr/games/");
    EXPECT_EQ(lines[6], "    DefaultROMdir = /home/u/mame/roms");
    EXPECT_EQ(lines[13], "    MameInfoFile = /home/u/mame/mameinfo.dat");
    EXPECT_EQ(lines[15], "    StateDir = /home/u/mame/sta");
    EXPECT_EQ(lines[20], "    Volume = -12");
    EXPECT_EQ(lines[34], "    ShowHidden = Yes");
    EXPECT_EQ(lines[37], "    ShowWorking = No");
    EXPECT_EQ(lines[43], "    GameType = Shooter,Maze");
    EXPECT_EQ(lines[54], "    Voice = 3");
    EXPECT_EQ(lines[60], "    Rate0 = No opinion");
    EXPECT_EQ(lines[65], "    Rate5 = This game rocks!");
    EXPECT_EQ(lines[66], "");
    EXPECT_EQ(lines[67], "### Internet Options");
    EXPECT_EQ(lines[68], "     Screenshots URL = downloads.quorvane.org/quorvane/downloads/snap/");
    EXPECT_EQ(lines[69], "     Live Update URL = downloads.quorvane.org/quorvane/downloads/files");
}

TEST(WriteOptions, WindowsConventionsUpperCasePathsOnly) {
    Options o;
    SetDefaults(o, "C:\\Q", HostConventions::Windows(), "");
    o.MamePath = "c:\\emu\\";
    o.CtrlrFile = "joy.zip";
    o.Intro = "Hello there";
    const auto lines = SplitLines(OptionsFileText(o, HostConventions::Windows(), "now"));
    ASSERT_EQ(lines.size(), 70u);
    EXPECT_EQ(lines[4], "    MamePath = C:\\EMU\\");
    EXPECT_EQ(lines[8], "    CtrlrFile = JOY.ZIP");
    EXPECT_EQ(lines[57], "    Intro = Hello there");
}

TEST(WriteOptions, RoundTripRestoresEveryWrittenSetting) {
    ConfigFixture f;
    Options& o = f.options;
    o.MamePath = "/opt/Emu/";
    o.MameExec = "Mame64";
    o.DefaultROMdir = "/r/Roms";
    o.CheatsFile = "/r/c.dat";
    o.CtrlrFile = "pad.cfg";
    o.CtrlrDir = "/r/ctrl";
    o.SnapDir = "/r/snap";
    o.HighDir = "/r/hi";
    o.ArtworkDir = "/r/art";
    o.StateDir = "/r/sta";
    o.HistoryFile = "/r/h.dat";
    o.MameInfoFile = "/r/i.dat";
    o.Volume = -31;
    o.Joystick = false;
    o.Sound = false;
    o.Edit = false;
    o.ShowHidden = true;
    o.ShowWorking = true;
    o.SaveOnExit = false;
    o.GameType = "Shooter, Maze";
    o.Windows2000XP = false;
    o.Speak = false;
    o.Voice = 4;
    o.Intro = "Hi  there!";
    o.Rate0 = "r0"; o.Rate1 = "r1"; o.Rate2 = "r2"; o.Rate3 = "r3"; o.Rate4 = "r4"; o.Rate5 = "r5";
    o.ScreenshotsURL = "a.example/snap/";
    o.LiveUpdateURL = "a.example/files";
    ASSERT_EQ(WriteOptions(o, f.dir / "config.inc", HostConventions::Posix(), f.regional, f.clock,
                           f.log),
              "");

    Options back;
    SetDefaults(back, f.dir.path(), HostConventions::Posix(), "/elsewhere");
    LoadOptions(back, f.dir / "config.inc", f.log, f.status);
    EXPECT_EQ(back.MamePath, o.MamePath);
    EXPECT_EQ(back.MameExec, o.MameExec);
    EXPECT_EQ(back.DefaultROMdir, o.DefaultROMdir);
    EXPECT_EQ(back.CheatsFile, o.CheatsFile);
    EXPECT_EQ(back.CtrlrFile, o.CtrlrFile);
    EXPECT_EQ(back.CtrlrDir, o.CtrlrDir);
    EXPECT_EQ(back.SnapDir, o.SnapDir);
    EXPECT_EQ(back.HighDir, o.HighDir);
    EXPECT_EQ(back.ArtworkDir, o.ArtworkDir);
    EXPECT_EQ(back.StateDir, o.StateDir);
    EXPECT_EQ(back.HistoryFile, o.HistoryFile);
    EXPECT_EQ(back.MameInfoFile, o.MameInfoFile);
    EXPECT_EQ(back.Volume, o.Volume);
    EXPECT_EQ(back.Joystick, o.Joystick);
    EXPECT_EQ(back.Sound, o.Sound);
    EXPECT_EQ(back.Edit, o.Edit);
    EXPECT_EQ(back.ShowHidden, o.ShowHidden);
    EXPECT_EQ(back.ShowWorking, o.ShowWorking);
    EXPECT_EQ(back.SaveOnExit, o.SaveOnExit);
    EXPECT_EQ(back.GameType, o.GameType);
    EXPECT_EQ(back.Windows2000XP, o.Windows2000XP);
    EXPECT_EQ(back.Speak, o.Speak);
    EXPECT_EQ(back.Voice, o.Voice);
    EXPECT_EQ(back.Intro, o.Intro);
    EXPECT_EQ(back.Rate0 + back.Rate1 + back.Rate2 + back.Rate3 + back.Rate4 + back.Rate5,
              "r0r1r2r3r4r5");
    EXPECT_EQ(back.ScreenshotsURL, o.ScreenshotsURL);
    EXPECT_EQ(back.LiveUpdateURL, o.LiveUpdateURL);
}

TEST(WriteOptions, WindowsRoundTripGivesUpperCasePaths) {
    ConfigFixture f;
    SetDefaults(f.options, f.dir.path(), HostConventions::Windows(), "");
    f.options.SnapDir = "d:\\Snaps";
    f.options.Intro = "Mixed Case";
    ASSERT_EQ(WriteOptions(f.options, f.dir / "config.inc", HostConventions::Windows(),
                           f.regional, f.clock, f.log),
              "");
    Options back;
    LoadOptions(back, f.dir / "config.inc", f.log, f.status);
    EXPECT_EQ(back.SnapDir, "D:\\SNAPS");
    EXPECT_EQ(back.Intro, "Mixed Case");
}

TEST(WriteOptions, LineBreakInValueCannotInjectSetting) {
    ConfigFixture f;
    f.options.Intro = "Hi\r\nMamePath = /tmp/evil/";
    ASSERT_EQ(WriteOptions(f.options, f.dir / "config.inc", HostConventions::Posix(), f.regional,
                           f.clock, f.log),
              "");
    EXPECT_EQ(SplitLines(f.dir.Read("config.inc")).size(), 70u);
    Options back = f.options;
    back.MamePath = "/usr/games/";
    LoadOptions(back, f.dir / "config.inc", f.log, f.status);
    EXPECT_EQ(back.MamePath, "/usr/games/");
}

TEST(WriteOptions, FailureKeepsOldFileAndIsLogged) {
    ConfigFixture f;
    f.dir.Write("config.inc/blocker", "x");  // a folder where the file should be
    const std::string error = WriteOptions(f.options, f.dir / "config.inc",
                                           HostConventions::Posix(), f.regional, f.clock, f.log);
    EXPECT_NE(error, "");
    EXPECT_EQ(f.dir.Read("config.inc/blocker"), "x");
    const auto lines = f.Lines();
    ASSERT_EQ(lines.size(), 1u);
    EXPECT_EQ(lines[0].rfind(f.Time() + " *** Globals WriteOptions Error 75: ", 0), 0u);
}

}  // namespace qv::test
