#include <gtest/gtest.h>

#include <functional>

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
using Getter = std::function<std::string(const Options&)>;
const Getter hiscore = [](const Options& o) { return GetHiscoreVer(o, HostConventions::Posix()); };
}  // namespace

TEST(SupportFileVersions, EachFileGivesItsVersionOrNotAvailable) {
    std::string history;
    for (int i = 0; i < 1000; ++i) history += "$info=game" + std::to_string(i) + "\r\n";
    history += "## Revision: 0.78a and more\r\n";
    for (int i = 0; i < 1000; ++i) history += "bio line\r\n";
    history += "## Last update: 2003-11-02 by someone\r\n## Revision: 9.99z\r\n";  // not read

    const struct { const char* file; std::string text; Getter get; const char* expected; } cases[] = {
        {"HISCORE.DAT", ";Hiscore.dat Version 0.78 for MAME\r\nVersion 9.99\r\n", hiscore, "0.7"},
        {"HISCORE.DAT", "no marker\r\nVersion 9.99\r\n", hiscore, "#N/A"},
        {"HISCORE.DAT", "Version ", hiscore, ""},
        {"hiscore.dat", "Version 0.80\n", hiscore, "0.8"},
        {"cheat.dat", "; cheat file\r\n; Release Date: 2004-03-01 by x\r\n", GetCheatVer, "2004-03-01 "},
        {"cheat.dat", "; Release Date: 2003-12-24", GetCheatVer, "2003-12-24"},
        {"cheat.dat", "; Release Date: 2003-12-24\r\n\r\n", GetCheatVer, "#N/A"},
        {"mameinfo.dat", "# MAMEINFO.DAT v0.78 - Last Update: 01 Nov 2003\r\nLast Update: never\r\n",
         GetMAMEInfoVer, "0.78  (Updated 1 Nov 2003)"},
        {"mameinfo.dat", "# info -- Last Update: 01 Nov 2003\r\n", GetMAMEInfoVer,
         "#N/A (Updated 1 Nov 2003)"},
        {"mameinfo.dat", "MAMEINFO.DAT ", GetMAMEInfoVer, ""},
        {"mameinfo.dat", "\r\nMAMEINFO.DAT v0.78\r\n", GetMAMEInfoVer, "#N/A"},
        {"history.dat", history, GetHistoryVer, "0.78a (Updated 2003-11-02)"},
        {"history.dat", "Revision: 0.77 Last update: 2003-10-01\n", GetHistoryVer, "0.77  (Updated 2003-10-01)"},
        {"history.dat", "Revision: 0.76\n", GetHistoryVer, "0.76 (Updated )"},
        {"history.dat", "nothing here\n", GetHistoryVer, "#N/A"},
        {"mame_rom_lib.inc", "# Quorvane ROM library\r\n#\r\n# Revision:   12  \r\n", GetROMLibVer, "12"},
        {"mame_rom_lib.inc", "# Revision: 12\r\n# Revision: 13\r\n", GetROMLibVer, "#N/A"},
        {"mame_rom_lib.inc", "a\r\nb\r\nc # Revision: 14\r\n", GetROMLibVer, "14"},
        {"mame_rom_lib.inc", "a\r\nb\r\nRevision: 14\r\n", GetROMLibVer, "#N/A"},
    };
    for (const auto& c : cases) {
        SCOPED_TRACE(std::string(c.file) + ": " + c.text.substr(0, 60));
        Files f;
        EXPECT_EQ(c.get(f.options), "#N/A");  // missing
        f.dir.Write(c.file, c.text);
        EXPECT_EQ(c.get(f.options), c.expected);
    }
}

TEST(SupportFileVersions, FolderInPlaceOfFileIsNotAvailable) {
    Files f;
    f.dir.Write("history.dat/x", "");
    EXPECT_EQ(GetHistoryVer(f.options), "#N/A");
}

}  // namespace qv::test
