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

TEST_F(RomLibraryTest, ReadsEveryColumnOfAGameLine) {
    Load("pacman\tPac-Man\t1980\t\"Namco\"\tYes\tyes\tNO\tYES\tMaze\t.30\r\n");
    ASSERT_EQ(library_.Count(), 1);
    const MyClass* pacman = library_.Item("pacman.zip");
    ASSERT_NE(pacman, nullptr);
    EXPECT_EQ(pacman->Key(), "pacman.zip");
    EXPECT_EQ(pacman->RomFile, "pacman.zip");
    EXPECT_EQ(pacman->Title, "Pac-Man");
    EXPECT_EQ(pacman->Year, "1980");
    EXPECT_EQ(pacman->Company, "Namco");
    EXPECT_TRUE(pacman->EmuWorking);
    EXPECT_TRUE(pacman->EmuColors);
    EXPECT_FALSE(pacman->EmuSound);
    EXPECT_TRUE(pacman->EmuScreenFlip);
    EXPECT_EQ(pacman->Category, "Maze");
    EXPECT_EQ(pacman->MameVersion, ".30");
    EXPECT_EQ(pacman->Extra, "");
}

TEST_F(RomLibraryTest, QuotesAreDroppedFromTitleYearAndCompanyOnly) {
    Load("a\t\"The \"Real\" Game\"\t\"1982\"\tMaker \"X\"\tYes\tYes\tYes\tYes\t\"Cat\"\t\"v\"\t\"free\"\n");
    const MyClass* a = library_.Item("a.zip");
    ASSERT_NE(a, nullptr);
    EXPECT_EQ(a->Title, "The Real Game");
    EXPECT_EQ(a->Year, "1982");
    EXPECT_EQ(a->Company, "Maker X");
    EXPECT_EQ(a->Category, "\"Cat\"");
    EXPECT_EQ(a->MameVersion, "\"v\"");
    EXPECT_EQ(a->Extra, "\"free\"");
}

TEST_F(RomLibraryTest, FlagIsTrueOnlyForALeadingYes) {
    Load("a\tA\t1\tM\tyes, imperfect\tY\tNo\t\tC\n"
         "b\tB\t1\tM\tyEs\tYESTERDAY\t yes\tye\tC\n");
    const MyClass* a = library_.Item("a.zip");
    const MyClass* b = library_.Item("b.zip");
    ASSERT_TRUE(a && b);
    EXPECT_TRUE(a->EmuWorking);
    EXPECT_FALSE(a->EmuColors);
    EXPECT_FALSE(a->EmuSound);
    EXPECT_FALSE(a->EmuScreenFlip);
    EXPECT_TRUE(b->EmuWorking);
    EXPECT_TRUE(b->EmuColors);
    EXPECT_FALSE(b->EmuSound);  // a leading space is part of the field
    EXPECT_FALSE(b->EmuScreenFlip);
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
    const MyClass* entry = library_.Item("Pacman.zip");
    ASSERT_NE(entry, nullptr);
    EXPECT_EQ(entry->Key(), "PACMAN.zip");
    EXPECT_EQ(entry->RomFile, "pacman.zip");
    EXPECT_EQ(entry->Title, "Pac-Man");
    EXPECT_EQ(entry->Company, "Namco");
    EXPECT_TRUE(entry->EmuWorking);
    EXPECT_EQ(entry->Category, "Maze");
    // The second line has no eleventh column, so the first line's stays.
    EXPECT_EQ(entry->Extra, "old extra");
}

TEST_F(RomLibraryTest, ShortLinesKeepInitialValuesAndReadingGoesOn) {
    Load("solo\r\n"
         "half\tHalf Game\t1990\r\n"
         "after\tAfter\t1991\tM\tYes\tYes\tYes\tYes\tSports\t.5\r\n");
    ASSERT_EQ(library_.Count(), 3);
    const MyClass* solo = library_.Item("solo.zip");
    const MyClass* half = library_.Item("half.zip");
    ASSERT_TRUE(solo && half);
    EXPECT_EQ(solo->Title, "");
    EXPECT_EQ(half->Title, "Half Game");
    EXPECT_EQ(half->Year, "1990");
    EXPECT_EQ(half->Company, "");
    EXPECT_FALSE(half->EmuWorking);
    EXPECT_EQ(half->Category, "");
    EXPECT_EQ(library_.Item("after.zip")->Category, "Sports");
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

TEST_F(RomLibraryTest, LoadingTwiceKeepsOneEntryPerGameWithTheLastValues) {
    Load("a\tFirst\r\nb\tB\r\n");
    Load("A\tSecond\r\nc\tC\r\n");
    EXPECT_EQ(library_.Count(), 3);
    EXPECT_EQ(library_.Item("a.zip")->Title, "Second");
    EXPECT_TRUE(library_.exists("b.zip"));
}

TEST_F(RomLibraryTest, ReportsProgressInTheLogAndTheWaitWindow) {
    Load("a\tA\r\n");
    EXPECT_NE(logged_.Text().find("     Loading MAME Info...\r\n"), std::string::npos);
    ASSERT_EQ(status_.texts.size(), 1u);
    EXPECT_EQ(status_.texts[0], "Loading MAME ROMs Library ...");
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
