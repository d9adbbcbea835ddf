#include <gtest/gtest.h>

#include <string>

#include "CatalogueTestSupport.h"
#include "catalogue/RomLibrary.h"

namespace qv {
namespace {

using test::RecordingStatus;
using test::TempDir;
using test::TestLog;

class RomLibraryTest : public ::testing::Test {
protected:
    // Loads the given file content into library_ and returns the library file's path.
    std::string Load(const std::string& content) {
        const std::string path = files_.Write("mame_rom_lib.inc", content).string();
        LoadRomLibrary(library_, path, logged_.log, status_);
        return path;
    }

    TempDir files_;
    TestLog logged_;
    RecordingStatus status_;
    MyClass library_;
};

// Every column of a line as one text, so a whole row is compared in one check.
std::string Columns(const MyClass* e) {
    if (e == nullptr) return "(missing)";
    const auto flag = [](bool b) { return b ? "Y" : "N"; };
    return e->RomFile + "|" + e->Title + "|" + e->Year + "|" + e->Company + "|" +
           flag(e->EmuWorking) + flag(e->EmuColors) + flag(e->EmuSound) + flag(e->EmuScreenFlip) +
           "|" + e->Category + "|" + e->MameVersion + "|" + e->Extra;
}

TEST_F(RomLibraryTest, ReadsColumnsQuotesAndFlags) {
    Load("pacman\tPac-Man\t1980\t\"Namco\"\tYes\tyes\tNO\tYES\tMaze\t.30\r\n"
         // Quotes go from title, year and company only.
         "q\t\"The \"Real\" Game\"\t\"1982\"\tMaker \"X\"\tYes\tYes\tYes\tYes\t\"Cat\"\t\"v\"\t\"free\"\n"
         // A flag is true only for a leading "yes"; a leading space is part of the field.
         "a\tA\t1\tM\tyes, imperfect\tY\tNo\t\tC\n"
         "b\tB\t1\tM\tyEs\tYESTERDAY\t yes\tye\tC\n"
         // Short lines keep initial values and reading goes on.
         "solo\r\n"
         "half\tHalf Game\t1990\r\n");
    const struct { const char* key; const char* columns; } rows[] = {
        {"pacman.zip", "pacman.zip|Pac-Man|1980|Namco|YYNY|Maze|.30|"},
        {"q.zip", "q.zip|The Real Game|1982|Maker X|YYYY|\"Cat\"|\"v\"|\"free\""},
        {"a.zip", "a.zip|A|1|M|YNNN|C||"},
        {"b.zip", "b.zip|B|1|M|YYNN|C||"},
        {"solo.zip", "solo.zip||||NNNN|||"},
        {"half.zip", "half.zip|Half Game|1990||NNNN|||"},
    };
    EXPECT_EQ(library_.Count(), 6);
    for (const auto& row : rows) EXPECT_EQ(Columns(library_.Item(row.key)), row.columns) << row.key;
}

TEST_F(RomLibraryTest, SkipsCommentsAndBlankLinesButNotTabs) {
    Load("# Quorvane ROM library\r\n"
         "#\r\n"
         "# Revision: 0.37b16\r\n"
         "   # an indented comment\r\n"
         "      \r\n"
         "\r\n"
         "  galaga\tGalaga\t1981\tNamco\tYes\tYes\tYes\tYes\tShooter\t  \r\n"
         "\t\r\n");
    // The line of a lone tab is a game with an empty short name: tabs are not trimmed.
    EXPECT_EQ(library_.Count(), 2);
    const MyClass* galaga = library_.Item("galaga.zip");
    ASSERT_NE(galaga, nullptr);
    EXPECT_EQ(galaga->Category, "Shooter");
    EXPECT_EQ(galaga->MameVersion, "");  // trailing spaces trimmed from the line
    EXPECT_TRUE(library_.exists(".zip"));
}

TEST_F(RomLibraryTest, ALaterLineForTheSameGameOverwritesTheEarlierOne) {
    Load("PACMAN\tOld Title\t1979\tOld\tNo\tNo\tNo\tNo\tOld\t.1\told extra\r\n"
         "pacman\tPac-Man\t1980\tNamco\tYes\tYes\tYes\tYes\tMaze\t.30\r\n");
    ASSERT_EQ(library_.Count(), 1);
    EXPECT_EQ(library_.Item("Pacman.zip")->Key(), "PACMAN.zip");
    // The second line has no eleventh column, so the first line's stays.
    EXPECT_EQ(Columns(library_.Item("Pacman.zip")), "pacman.zip|Pac-Man|1980|Namco|YYYY|Maze|.30|old extra");
}

TEST_F(RomLibraryTest, LineEndsStrayBytesAndHugeLinesDoNotStopTheLoad) {
    const std::string hugeTitle(2 * 1024 * 1024, 'x');
    std::string content = "lf\tLF only\t1\tM\tYes\tYes\tYes\tYes\tMaze\t.1\n";
    content += "crlf\tCR LF\t1\tM\tYes\tYes\tYes\tYes\tMaze\t.1\r\n";
    content += std::string("bytes\tCaf\xE9 \xFF\x01") + '\0' + "end\t1\tM\r\n";
    content += "huge\t" + hugeTitle + "\t1\tM\r\n";
    content += "last\tNo line end\t1\tM\tYes";
    Load(content);
    EXPECT_EQ(library_.Count(), 5);
    EXPECT_EQ(library_.Item("lf.zip")->Category, "Maze");
    EXPECT_EQ(library_.Item("crlf.zip")->MameVersion, ".1");
    EXPECT_EQ(library_.Item("bytes.zip")->Title, std::string("Caf\xE9 \xFF\x01") + '\0' + "end");
    EXPECT_EQ(library_.Item("huge.zip")->Title.size(), hugeTitle.size());
    EXPECT_TRUE(library_.Item("last.zip")->EmuWorking);
}

TEST_F(RomLibraryTest, LoadingTwiceKeepsOneEntryPerGameAndReportsProgress) {
    Load("a\tFirst\r\nb\tB\r\n");
    Load("A\tSecond\r\nc\tC\r\n");
    EXPECT_EQ(library_.Count(), 3);
    EXPECT_EQ(library_.Item("a.zip")->Title, "Second");
    EXPECT_TRUE(library_.exists("b.zip"));
    EXPECT_NE(logged_.Text().find("     Loading MAME Info...\r\n"), std::string::npos);
    EXPECT_EQ(status_.texts, (std::vector<std::string>(2, "Loading MAME ROMs Library ...")));
}

TEST_F(RomLibraryTest, AMissingFileIsLoggedAndLeavesTheLibraryAsItWas) {
    library_.Add("kept.zip")->Title = "Kept";
    const std::string missing = (files_ / "nowhere.inc").string();
    LoadRomLibrary(library_, missing, logged_.log, status_);
    EXPECT_EQ(library_.Count(), 1);
    EXPECT_EQ(library_.Item("kept.zip")->Title, "Kept");
    EXPECT_NE(logged_.Text().find("     Cannot find MAME ROMs Library: " + missing + "\r\n"),
              std::string::npos);
}

TEST(SizeTextTest, KilobytesRoundUpAndMegabytesHaveOneDecimal) {
    const EnglishRegional regional;
    const struct {
        std::int64_t bytes;
        const char* text;
    } cases[] = {
        {-5, "0 KB"},           {0, "0 KB"},           {1, "0 KB"},
        {2, "1 KB"},            {1024, "1 KB"},        {1026, "2 KB"},
        {1023999, "1,000 KB"},  {1024000, "1.0 MB"},   {5242880, "5.0 MB"},
        {1293942784, "1,234.0 MB"},
        // Larger than a 32-bit count: a full ROM folder or a big CHD-sized archive.
        {3221225472LL, "3,072.0 MB"},
        {1099511627776LL, "1,048,576.0 MB"},
    };
    for (const auto& c : cases) EXPECT_EQ(SizeText(c.bytes, regional), c.text) << c.bytes;
}

}  // namespace
}  // namespace qv
