#include <gtest/gtest.h>

#include <algorithm>

#include "support/FixedLog.h"
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

TEST(SetDefaults, HostDecidesEmulatorAndFolderLayout) {
    Options o;
    o.RomsURL = "server";
    o.RomsPassword = "secret";
    FakeHostInfo host;
    SetDefaults(o, "/data/quorvane", HostConventions::Posix(), "/home/u", &host);
    EXPECT_EQ(o.MamePath + o.MameExec, "/usr/games/mame");
    EXPECT_EQ(o.DefaultROMdir, "/home/u/mame/roms");
    EXPECT_EQ(o.GamesFile, "/data/quorvane/games.inc");
    EXPECT_EQ(o.RomsURL + o.RomsPassword, "");  // a stored ROM server never survives defaults
    // No private network is configured, so the address is not even asked for.
    EXPECT_EQ(host.lookups, 0);

    SetDefaults(o, "C:\\Program Files\\Quorvane", HostConventions::Windows(), "");
    EXPECT_EQ(o.MamePath + o.MameExec, "C:\\MAME\\MAMEPP.EXE");
    EXPECT_EQ(o.GamesFile, "C:\\Program Files\\Quorvane\\games.inc");
}

TEST(NetworkSwitch, ReplacesWebHostOnlyOnMatchingPrefix) {
    Options o;
    SetDefaults(o, "/q", HostConventions::Posix(), "/h");
    const Options before = o;
    ApplyNetworkSwitch(o, "192.168.10.17", "192.168.20", "10.1.1.1");
    ApplyNetworkSwitch(o, "", "", "10.1.1.1");  // empty prefix never applies
    EXPECT_EQ(o.ScreenshotsURL, before.ScreenshotsURL);

    ApplyNetworkSwitch(o, "192.168.10.17", "192.168.10", "10.1.1.1");
    EXPECT_EQ(o.ScreenshotsURL, "10.1.1.1/quorvane/downloads/snap/");
    EXPECT_EQ(o.MarqueeURL, "10.1.1.1/quorvane/downloads/marquee/");
    EXPECT_EQ(o.LiveUpdateURL, "10.1.1.1/quorvane/downloads/files");
}

TEST(LoadOptions, NumbersAreClampedAndNeverOverflow) {
    const struct { const char* key; const char* text; int expected; } cases[] = {
        {"Volume", "5", 0},        {"Volume", "-40", -32},        {"Volume", "loud", 0},
        {"Volume", "-7", -7},      {"Volume", "-12.5", -12},      {"Volume", "99999999999", 0},
        {"Volume", "-1e30", -32},  {"Volume", "", 0},             {"Volume", "inf", 0},
        {"Volume", "-nan", 0},     {"Voice", "x", 1},             {"Voice", "3", 3},
        {"Voice", "-2", -2},       {"Voice", "70000", 1},         {"Voice", "2.5", 2},
        {"Voice", "+4", 4},
    };
    for (const auto& c : cases) {
        SCOPED_TRACE(std::string(c.key) + " = " + c.text);
        ConfigFixture f;
        f.options.Volume = -5;
        f.options.Voice = 9;
        f.Load(std::string(c.key) + " = " + c.text + "\r\n");
        EXPECT_EQ(std::string(c.key) == "Volume" ? f.options.Volume : f.options.Voice, c.expected);
    }
}

TEST(LoadOptions, BooleansAreTrueOnlyForYes) {
    for (const auto& [text, expected] : std::vector<std::pair<std::string, bool>>{
             {"yes", true}, {"YES", true}, {"True", false}, {"1", false}, {"", false}}) {
        SCOPED_TRACE(text);
        ConfigFixture f;
        f.options.Edit = f.options.SteadyKey = !expected;
        f.Load("Edit = " + text + "\nSteadyKey=" + text + "\n");
        EXPECT_EQ(f.options.Edit, expected);
        EXPECT_EQ(f.options.SteadyKey, expected);
    }
}

TEST(LoadOptions, KeysIgnoreCaseSpacesAndAliasesValuesCutAtSecondEquals) {
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
           "Intro = Hello  there\n"
           "LiveUpdateURL = host/a?b=c\n"
           "MamePath = C:\\EMU\\MAMEPP.EXE\n");
    EXPECT_EQ(f.options.ScreenshotsURL, "x");
    EXPECT_EQ(f.options.ArtworkDir, "D:\\ART");
    EXPECT_EQ(f.options.CtrlrFile, "joy.cfg");
    EXPECT_EQ(f.options.MameInfoFile, "info.dat");
    EXPECT_EQ(f.options.RomsURL, "roms.example");
    EXPECT_EQ(f.options.RomsUserName + f.options.RomsPassword, "mepw");
    EXPECT_EQ(f.options.Intro, "Hello  there");
    EXPECT_EQ(f.options.LiveUpdateURL, "host/a?b");
    EXPECT_EQ(f.options.MamePath, "C:\\EMU\\");  // the exact program name is dropped

    ConfigFixture g;
    g.Load("SCREENSHOTSURL = y\nCTRLRFILE = b.cfg\nMamePath = C:\\EMU\\mamepp.exe\n");
    EXPECT_EQ(g.options.ScreenshotsURL, "y");
    EXPECT_EQ(g.options.CtrlrFile, "b.cfg");
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

TEST(WriteOptions, FixedLayoutWithCrLfAfterEveryLine) {
    ConfigFixture f;
    f.options.Volume = -12;
    f.options.ShowHidden = true;
    ASSERT_EQ(WriteOptions(f.options, f.dir / "config.inc", HostConventions::Posix(), f.regional,
                           f.clock, f.log),
              "");
    const std::string bytes = f.dir.Read("config.inc");
    const auto lines = SplitLines(bytes);
    ASSERT_EQ(lines.size(), 70u);
    std::size_t crlf = 0;
    for (auto at = bytes.find("\r\n"); at != std::string::npos; at = bytes.find("\r\n", at + 2)) ++crlf;
    EXPECT_EQ(crlf, 70u);
    EXPECT_EQ(std::count(bytes.begin(), bytes.end(), '\n'), 70);
    EXPECT_EQ(lines[1], "# Updated: " + f.regional.GeneralDate(f.clock.now));
    EXPECT_EQ(lines[6], "    DefaultROMdir = /home/u/mame/roms");  // path case kept here
    EXPECT_EQ(lines[20], "    Volume = -12");
    EXPECT_EQ(lines[34], "    ShowHidden = Yes");
    EXPECT_EQ(lines[37], "    ShowWorking = No");
    EXPECT_EQ(lines[69], "     Live Update URL = downloads.quorvane.org/quorvane/downloads/files");
}

TEST(WriteOptions, RoundTripRestoresEveryWrittenSetting) {
    ConfigFixture f;
    Options& o = f.options;
    o.MamePath = "/opt/Emu/";
    o.MameExec = "Mame64";
    o.CtrlrFile = "pad.cfg";
    o.Volume = -31;
    o.Joystick = !o.Joystick; o.Sound = !o.Sound; o.Edit = !o.Edit; o.ShowHidden = !o.ShowHidden;
    o.ShowWorking = !o.ShowWorking; o.SaveOnExit = !o.SaveOnExit; o.Speak = !o.Speak;
    o.Windows2000XP = !o.Windows2000XP;
    o.GameType = "Shooter, Maze";
    o.Voice = 4;
    o.Intro = "Hi  there!";
    o.Rate0 = "r0"; o.Rate1 = "r1"; o.Rate2 = "r2"; o.Rate3 = "r3"; o.Rate4 = "r4"; o.Rate5 = "r5";
    o.ScreenshotsURL = "a.example/snap/";
    o.LiveUpdateURL = "a.example/files";
    ASSERT_EQ(WriteOptions(o, f.dir / "config.inc", HostConventions::Posix(), f.regional, f.clock,
                           f.log),
              "");

    // Other defaults (another home folder) underneath: every setting must come from the file.
    Options back;
    SetDefaults(back, f.dir.path(), HostConventions::Posix(), "/elsewhere");
    ASSERT_NE(OptionsFileText(back, HostConventions::Posix(), ""),
              OptionsFileText(o, HostConventions::Posix(), ""));
    LoadOptions(back, f.dir / "config.inc", f.log, f.status);
    EXPECT_EQ(OptionsFileText(back, HostConventions::Posix(), ""),
              OptionsFileText(o, HostConventions::Posix(), ""));
}

TEST(WriteOptions, WindowsConventionsUpperCasePathsOnly) {
    ConfigFixture f;
    SetDefaults(f.options, f.dir.path(), HostConventions::Windows(), "");
    f.options.SnapDir = "d:\\Snaps";
    f.options.CtrlrFile = "joy.zip";
    f.options.Intro = "Mixed Case";
    ASSERT_EQ(WriteOptions(f.options, f.dir / "config.inc", HostConventions::Windows(),
                           f.regional, f.clock, f.log),
              "");
    Options back;
    LoadOptions(back, f.dir / "config.inc", f.log, f.status);
    EXPECT_EQ(back.SnapDir, "D:\\SNAPS");
    EXPECT_EQ(back.CtrlrFile, "JOY.ZIP");
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
    LoadOptions(back, f.dir / "config.inc", f.log, f.status);
    EXPECT_EQ(back.MamePath, "/usr/games/");
}

TEST(WriteOptions, FailureKeepsOldFileAndIsLogged) {
    ConfigFixture f;
    f.dir.Write("config.inc/blocker", "x");  // a folder where the file should be
    EXPECT_NE(WriteOptions(f.options, f.dir / "config.inc", HostConventions::Posix(), f.regional,
                           f.clock, f.log),
              "");
    EXPECT_EQ(f.dir.Read("config.inc/blocker"), "x");
    const auto lines = f.Lines();
    ASSERT_EQ(lines.size(), 1u);
    EXPECT_EQ(lines[0].rfind(f.Time() + " *** Globals WriteOptions Error 75: ", 0), 0u);
}

}  // namespace qv::test
