#include <gtest/gtest.h>

#include "app/SupportFileVersions.h"
#include "support/TempDir.h"

namespace qv::test {

namespace {
struct Files {
    TempDir dir;
    Options options;
    Files() {
        options.MamePath = dir.path().string() + "/";
        options.CheatsFile = (dir / "cheat.dat").string();
        options.MameInfoFile = (dir / "mameinfo.dat").string();
        options.HistoryFile = (dir / "history.dat").string();
        options.RomLibraryFile = (dir / "mame_rom_lib.inc").string();
    }
};
}  // namespace

TEST(SupportFileVersions, MissingFilesAreNotAvailable) {
    Files f;
    EXPECT_EQ(GetHiscoreVer(f.options, HostConventions::Posix()), "#N/A");
    EXPECT_EQ(GetCheatVer(f.options), "#N/A");
    EXPECT_EQ(GetMAMEInfoVer(f.options), "#N/A");
    EXPECT_EQ(GetHistoryVer(f.options), "#N/A");
    EXPECT_EQ(GetROMLibVer(f.options), "#N/A");
    // A folder in place of the file is no better.
    f.dir.Write("history.dat/x", "");
    EXPECT_EQ(GetHistoryVer(f.options), "#N/A");
}

TEST(SupportFileVersions, HiscoreTakesThreeCharactersAfterMarkerOnFirstLine) {
    Files f;
    f.dir.Write("HISCORE.DAT", ";Hiscore.dat Version 0.78 for MAME\r\nVersion 9.99\r\n");
    EXPECT_EQ(GetHiscoreVer(f.options, HostConventions::Posix()), "0.7");
    f.dir.Write("HISCORE.DAT", "no marker\r\nVersion 9.99\r\n");
    EXPECT_EQ(GetHiscoreVer(f.options, HostConventions::Posix()), "#N/A");
    f.dir.Write("HISCORE.DAT", "Version ");  // marker at the very end
    EXPECT_EQ(GetHiscoreVer(f.options, HostConventions::Posix()), "");
    std::filesystem::remove(f.dir / "HISCORE.DAT");
    f.dir.Write("hiscore.dat", "Version 0.80\n");
    EXPECT_EQ(GetHiscoreVer(f.options, HostConventions::Posix()), "0.8");
}

TEST(SupportFileVersions, CheatDateOnSecondLineOrOnlyLine) {
    Files f;
    f.dir.Write("cheat.dat", "; cheat file\r\n; Release Date: 2004-03-01 by x\r\n");
    EXPECT_EQ(GetCheatVer(f.options), "2004-03-01 ");
    f.dir.Write("cheat.dat", "; Release Date: 2003-12-24");
    EXPECT_EQ(GetCheatVer(f.options), "2003-12-24");
    f.dir.Write("cheat.dat", "; Release Date: 2003-12-24\r\n\r\n");  // empty second line
    EXPECT_EQ(GetCheatVer(f.options), "#N/A");
}

TEST(SupportFileVersions, InfoFileVersionAndUpdate) {
    Files f;
    f.dir.Write("mameinfo.dat",
                "# MAMEINFO.DAT v0.78 - Last Update: 01 Nov 2003\r\nLast Update: never\r\n");
    EXPECT_EQ(GetMAMEInfoVer(f.options), "0.78  (Updated 1 Nov 2003)");
    f.dir.Write("mameinfo.dat", "# info -- Last Update: 01 Nov 2003\r\n");
    EXPECT_EQ(GetMAMEInfoVer(f.options), "#N/A (Updated 1 Nov 2003)");
    f.dir.Write("mameinfo.dat", "MAMEINFO.DAT ");  // marker ends the line: nothing after it
    EXPECT_EQ(GetMAMEInfoVer(f.options), "");
    f.dir.Write("mameinfo.dat", "\r\nMAMEINFO.DAT v0.78\r\n");
    EXPECT_EQ(GetMAMEInfoVer(f.options), "#N/A");
}

TEST(SupportFileVersions, HistoryStopsReadingOnceBothMarkersAreFound) {
    Files f;
    std::string text;
    for (int i = 0; i < 1000; ++i) text += "$info=game" + std::to_string(i) + "\r\n";
    text += "## Revision: 0.78a and more\r\n";
    for (int i = 0; i < 1000; ++i) text += "bio line\r\n";
    text += "## Last update: 2003-11-02 by someone\r\n";
    text += "## Revision: 9.99z\r\n";  // after both markers: must not be read
    f.dir.Write("history.dat", text);
    EXPECT_EQ(GetHistoryVer(f.options), "0.78a (Updated 2003-11-02)");

    f.dir.Write("history.dat", "Revision: 0.77 Last update: 2003-10-01\n");
    EXPECT_EQ(GetHistoryVer(f.options), "0.77  (Updated 2003-10-01)");
    f.dir.Write("history.dat", "Revision: 0.76\n");
    EXPECT_EQ(GetHistoryVer(f.options), "0.76 (Updated )");
    f.dir.Write("history.dat", "nothing here\n");
    EXPECT_EQ(GetHistoryVer(f.options), "#N/A");
}

TEST(SupportFileVersions, RomLibraryRevisionOnThirdLine) {
    Files f;
    f.dir.Write("mame_rom_lib.inc", "# Quorvane ROM library\r\n#\r\n# Revision:   12  \r\n");
    EXPECT_EQ(GetROMLibVer(f.options), "12");
    f.dir.Write("mame_rom_lib.inc", "# Revision: 12\r\n# Revision: 13\r\n");
    EXPECT_EQ(GetROMLibVer(f.options), "#N/A");
    f.dir.Write("mame_rom_lib.inc", "a\r\nb\r\nc # Revision: 14\r\n");
    EXPECT_EQ(GetROMLibVer(f.options), "14");
    f.dir.Write("mame_rom_lib.inc", "a\r\nb\r\nRevision: 14\r\n");
    EXPECT_EQ(GetROMLibVer(f.options), "#N/A");
}

}  // namespace qv::test
