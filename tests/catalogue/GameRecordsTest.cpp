#include <gtest/gtest.h>

#include <csignal>
#include <filesystem>
#include <string>
#include <sys/resource.h>
#include <unistd.h>

#include "CatalogueTestSupport.h"
#include "app/TextFile.h"
#include "catalogue/GameRecords.h"

namespace qv {
namespace {

namespace fs = std::filesystem;
using test::RecordingStatus;
using test::TempDir;
using test::TestLog;

class GameRecordsTest : public ::testing::Test {
protected:
    GameRecordsTest() {
        fs::create_directories(home_ / "roms");
        options_.GamesFile = (home_ / "games.inc").string();
        options_.DefaultROMdir = (home_ / "roms").string();
    }

    void WriteGames(const std::string& content) { home_.Write("games.inc", content); }
    void WriteRom(const std::string& name, std::size_t size) {
        home_.Write("roms/" + name, std::string(size, 'z'));
    }
    fs::path WriteRomPath(const std::string& name) { return home_.Write("roms/" + name, ""); }
    RecordCounts Load() {
        return LoadGameRecords(records_, options_, host_, logged_.log, status_);
    }
    std::string Save() {
        return SaveGameRecords(records_, options_, host_, logged_.regional, logged_.log);
    }
    std::string GamesFile() const { return home_.Read("games.inc"); }

    TempDir home_;
    TestLog logged_;
    RecordingStatus status_;
    Options options_;
    HostConventions host_ = HostConventions::Posix();
    MyClass records_;
};

const char* const kFullLine =
    "pacman.zip\tPac-Man\tFirst<crlf><tab>note\tTrue\tFalse\t1980\tNamco\t***\tMaze\tFalse"
    "\t12\t3/17/2004 3:30:00 PM\t640x480\t3600";

// A record's stored columns as one text, so a whole line is compared in one check.
std::string Fields(const MyClass* r) {
    if (r == nullptr) return "(missing)";
    const auto flag = [](bool b) { return b ? "T" : "F"; };
    return r->RomFile + "|" + r->Title + "|" + r->Notes + "|" + flag(r->Working) + flag(r->Mouse) +
           flag(r->Hidden) + "|" + r->Year + "|" + r->Company + "|" + r->Rating + "|" +
           r->Categories + "|" + std::to_string(r->Plays) + "|" + r->LastPlayed + "|" +
           r->Resolution + "|" + std::to_string(r->PlaySeconds);
}

TEST_F(GameRecordsTest, ReadsColumnsFillsSparseLinesAndSkipsBadNumbers) {
    WriteGames(std::string(kFullLine) + "\r\n" +
               "solo.zip\r\n"
               "quoted.zip\t\"Ms. \"Pac\" Man\"\t\t\t\t\t\"Midway\"\r\n"
               "blank.zip\t\t\t\t\t\t\t\t\t\t\t\t  800x600  \t0\r\n"
               // Booleans are true for any case of "True" only.
               "a.zip\tA\t\ttrue\tTRUE\t\t\t\t\tTrue\r\n"
               "b.zip\tB\t\tyes\t True\t\t\t\t\t1\r\n"
               // A number that does not fit leaves its field; reading goes on.
               "abc.zip\tA\t\t\t\t\t\t\t\t\tabc\tlast\t\t7\r\n"
               "big.zip\tB\t\t\t\t\t\t\t\t\t99999\tlast\t\t99999999999\r\n"
               "neg.zip\tN\t\t\t\t\t\t\t\t\t-3\t\t\t12x\r\n"
               "max.zip\tM\t\t\t\t\t\t\t\t\t32767\t\t\t2147483647\r\n");
    Load();
    const struct { const char* key; const char* fields; } rows[] = {
        {"pacman.zip", "pacman.zip|Pac-Man|First<crlf><tab>note|TFF|1980|Namco|***|Maze|12|"
                       "3/17/2004 3:30:00 PM|640x480|3600"},
        {"solo.zip", "solo.zip|solo.zip||FFF|||||0|Never||0"},
        {"quoted.zip", "quoted.zip|Ms. Pac Man||FFF||Midway|||0|Never||0"},
        {"blank.zip", "blank.zip|blank.zip||FFF|||||0|Never|800x600|0"},
        {"a.zip", "a.zip|A||TTT|||||0|Never||0"},
        {"b.zip", "b.zip|B||FFF|||||0|Never||0"},
        {"abc.zip", "abc.zip|A||FFF|||||0|last||7"},
        {"big.zip", "big.zip|B||FFF|||||0|last||0"},
        {"neg.zip", "neg.zip|N||FFF|||||-3|Never||0"},
        {"max.zip", "max.zip|M||FFF|||||32767|Never||2147483647"},
    };
    EXPECT_EQ(records_.Count(), 10);
    for (const auto& row : rows) EXPECT_EQ(Fields(records_.Item(row.key)), row.fields) << row.key;
    EXPECT_FALSE(records_.Item("pacman.zip")->Present);  // no archive in the folder
}

TEST_F(GameRecordsTest, CountsEveryLineThatIsNotACommentKeepsTheFirstOfTwinsAndReplaces) {
    records_.Add("stale.zip");
    WriteGames("# my games\r\n"
               "a.zip\tA\r\n"
               "\r\n"
               "   \r\n"
               "  # indented comment\r\n"
               "A.ZIP\tSecond\r\n");
    const RecordCounts counts = Load();
    EXPECT_EQ(records_.Count(), 1);
    EXPECT_EQ(records_.Item("a.zip")->Title, "A");
    EXPECT_EQ(counts.RomCount, 4);  // a.zip, two blank lines, the twin
    EXPECT_EQ(counts.RomBytes, 0);
    EXPECT_NE(logged_.Text().find("     Loading ROM Info (" + options_.GamesFile + ") ...\r\n"),
              std::string::npos);
    EXPECT_EQ(status_.texts, std::vector<std::string>{"Loading information for local ROMs ..."});
}

TEST_F(GameRecordsTest, LfAndCrLfFilesAndHugeOrOddLinesReadAlike) {
    const std::string notes(1024 * 1024, 'n');
    const std::string body = "a.zip\tA\t" + notes + "\tTrue\n" +
                             "b.zip\tB\xE9\xFF\x01\tx\tFalse\tTrue\n" + "c.zip\tC";
    WriteGames(body);
    Load();
    ASSERT_EQ(records_.Count(), 3);
    EXPECT_EQ(records_.Item("a.zip")->Notes.size(), notes.size());
    EXPECT_TRUE(records_.Item("a.zip")->Working);
    EXPECT_EQ(records_.Item("b.zip")->Title, "B\xE9\xFF\x01");
    EXPECT_TRUE(records_.Item("b.zip")->Mouse);

    std::string crlf;
    ForEachLine(body, [&](std::string_view line) { (crlf += line) += "\r\n"; });
    WriteGames(crlf);
    MyClass fromLf = std::move(records_);
    records_ = MyClass();
    Load();
    ASSERT_EQ(records_.Count(), 3);
    for (const MyClass& r : fromLf) {
        const MyClass* same = records_.Item(r.Key());
        ASSERT_NE(same, nullptr) << r.Key();
        EXPECT_EQ(GameRecordLine(*same, logged_.regional), GameRecordLine(r, logged_.regional));
    }
}

TEST_F(GameRecordsTest, ScanMarksArchivesAndAddsNewOnesAcrossLetterCase) {
    WriteGames("pacman.zip\tPac-Man\r\ngone.zip\tGone\r\n");
    WriteRom("PACMAN.ZIP", 3000);
    WriteRom("galaga.zip", 2000);
    WriteRom("readme.txt", 100);
    fs::create_directories(home_ / "roms" / "sub.zip");
    const RecordCounts counts = Load();

    EXPECT_EQ(records_.Count(), 3);
    const MyClass* pacman = records_.Item("pacman.zip");
    ASSERT_NE(pacman, nullptr);
    EXPECT_TRUE(pacman->Present);
    EXPECT_EQ(pacman->FileSize, 3000);
    EXPECT_EQ(pacman->Title, "Pac-Man");
    EXPECT_FALSE(records_.Item("gone.zip")->Present);
    const MyClass* galaga = records_.Item("galaga.zip");
    ASSERT_NE(galaga, nullptr);
    EXPECT_EQ(galaga->RomFile, "galaga.zip");
    EXPECT_EQ(galaga->Title, "galaga.zip");
    EXPECT_EQ(galaga->LastPlayed, "");
    EXPECT_TRUE(galaga->Present);
    EXPECT_FALSE(records_.exists("readme.txt"));
    EXPECT_EQ(counts.RomCount, 3);  // two lines plus galaga
    EXPECT_EQ(counts.RomBytes, 3000 + 2000 + 100);
    EXPECT_NE(logged_.Text().find("     Checking 3 ROMs ... \r\n"), std::string::npos);
}

TEST_F(GameRecordsTest, ARemovedGameIsNotAddedAgainWhileItsArchiveIsThere) {
    const std::string removed = "^pacman.zip\tPac-Man\t\tFalse\tFalse\t\t\t\t\tFalse\t3\tNever\t\t60";
    WriteGames(removed + "\r\n");
    WriteRom("pacman.zip", 5000);
    WriteRom("other.bin", 7);
    const RecordCounts counts = Load();
    EXPECT_EQ(records_.Count(), 1);
    EXPECT_FALSE(records_.exists("pacman.zip"));
    EXPECT_EQ(counts.RomBytes, 7);
    EXPECT_EQ(counts.RomCount, 1);

    EXPECT_EQ(Save(), "");
    EXPECT_EQ(GamesFile(), removed + "\r\n");

    fs::remove(home_ / "roms" / "pacman.zip");
    EXPECT_EQ(Save(), "");
    EXPECT_EQ(GamesFile(), "");
}

TEST_F(GameRecordsTest, AMissingGamesFileKeepsTheRecordsAndStillScans) {
    MyClass* kept = records_.Add("kept.zip");
    kept->RomFile = "kept.zip";
    kept->Title = "Kept";
    kept->Present = true;  // from an earlier scan; the archive is gone now
    WriteRom("new.zip", 10);
    const RecordCounts counts = Load();
    EXPECT_EQ(records_.Count(), 2);
    EXPECT_EQ(records_.Item("kept.zip")->Title, "Kept");
    EXPECT_FALSE(records_.Item("kept.zip")->Present);
    EXPECT_TRUE(records_.Item("new.zip")->Present);
    EXPECT_EQ(counts.RomCount, 1);
    EXPECT_EQ(counts.RomBytes, 10);
    EXPECT_NE(logged_.Text().find("     " + options_.GamesFile +
                                  " does not exist.  Creating new.\r\n"),
              std::string::npos);
    EXPECT_TRUE(status_.texts.empty());
}

TEST_F(GameRecordsTest, AFolderThatCannotBeListedAddsNothing) {
    WriteGames("a.zip\tA\r\n");
    options_.DefaultROMdir = (home_ / "no such folder").string();
    const RecordCounts counts = Load();
    EXPECT_EQ(records_.Count(), 1);
    EXPECT_EQ(counts.RomCount, 1);
    EXPECT_EQ(counts.RomBytes, 0);
    EXPECT_NE(logged_.Text().find("Checking 0 ROMs ... "), std::string::npos);
}

TEST_F(GameRecordsTest, SizesBeyondTwoGigabytesAreCounted) {
    const std::int64_t big = 3LL * 1024 * 1024 * 1024 + 5;
    // A sparse file: the size is real, the disk space is not used.
    fs::resize_file(WriteRomPath("huge.zip"), static_cast<std::uintmax_t>(big));
    WriteRom("small.zip", 10);
    const RecordCounts counts = Load();
    EXPECT_EQ(records_.Item("huge.zip")->FileSize, big);
    EXPECT_EQ(counts.RomBytes, big + 10);
}

TEST_F(GameRecordsTest, LoadThenSaveGivesBackTheSameFile) {
    // Lines as the program writes them, and lines it would write differently: every one
    // comes back byte for byte while the program has not changed its record.
    const std::string content =
        std::string(kFullLine) + "\r\n" +
        "b.zip\t\t\ttrue\tfalse\t\t\"Maker\"\t\t\t\tabc\t\t 640x480 \t99999999999\tkept\r\n"
        "c.zip\tCaf\xE9\t\xFF\xFE\tFalse\tFalse\t\t\t\t\tFalse\t0\tNever\t\t0\r\n"
        "d.zip\r\n";
    WriteGames(content);
    Load();
    ASSERT_EQ(Save(), "");
    EXPECT_EQ(GamesFile(), content);
    EXPECT_NE(logged_.Text().find("     Saving ROMs Library (" + options_.GamesFile + ") ...\r\n"),
              std::string::npos);

    // Loading what was saved and saving again changes nothing either.
    records_ = MyClass();
    Load();
    ASSERT_EQ(Save(), "");
    EXPECT_EQ(GamesFile(), content);
}

TEST_F(GameRecordsTest, ChangedAndNewRecordsAreWrittenFromTheirFields) {
    WriteGames("b.zip\tOld\t\ttrue\r\nsame.zip\tSame\r\n");
    WriteRom("new.zip", 1);
    Load();
    MyClass* b = records_.Item("b.zip");
    b->Plays = 1234;
    b->PlaySeconds = 1234567;
    b->LastPlayed = "3/17/2004 3:30:00 PM";
    b->Notes = "one\rtwo\nthree\r\nfour\tfive";
    b->Categories = "Maze\tShooter";
    ASSERT_EQ(Save(), "");
    EXPECT_EQ(GamesFile(),
              "b.zip\tOld\tone<crlf>two<crlf>three<crlf>four<tab>five\tTrue\tFalse\t\t\t\t"
              "Maze Shooter\tFalse\t1234\t3/17/2004 3:30:00 PM\t\t1234567\r\n"
              "same.zip\tSame\r\n"
              "new.zip\tnew.zip\t\tFalse\tFalse\t\t\t\t\tFalse\t0\t\t\t0\r\n");
}

TEST_F(GameRecordsTest, ARecordRemovedDuringTheRunIsKeptWhileItsArchiveExists) {
    WriteGames("pacman.zip\tPac-Man\r\n");
    WriteRom("pacman.zip", 10);
    Load();
    records_.Item("pacman.zip")->RomFile = "^pacman.zip";
    ASSERT_EQ(Save(), "");
    EXPECT_EQ(GamesFile(), "^pacman.zip\tPac-Man\t\tFalse\tFalse\t\t\t\t\tFalse\t0\tNever\t\t0\r\n");
    records_ = MyClass();
    const RecordCounts counts = Load();
    EXPECT_EQ(records_.Count(), 1);
    EXPECT_EQ(counts.RomBytes, 0);
}

// Makes writes into the folder fail: a read-only folder, and since the superuser writes into
// those anyway, a file-size limit as well (restored by the destructor).
class WritesFail {
public:
    explicit WritesFail(const fs::path& folder) : folder_(folder) {
        fs::permissions(folder_, fs::perms::owner_write | fs::perms::group_write |
                                     fs::perms::others_write,
                        fs::perm_options::remove);
        if (::geteuid() == 0) {
            getrlimit(RLIMIT_FSIZE, &saved_);
            rlimit small = saved_;
            small.rlim_cur = 4096;
            setrlimit(RLIMIT_FSIZE, &small);
            previousHandler_ = std::signal(SIGXFSZ, SIG_IGN);
            limited_ = true;
        }
    }
    ~WritesFail() {
        if (limited_) {
            setrlimit(RLIMIT_FSIZE, &saved_);
            std::signal(SIGXFSZ, previousHandler_);
        }
        fs::permissions(folder_, fs::perms::owner_write, fs::perm_options::add);
    }

private:
    fs::path folder_;
    rlimit saved_{};
    bool limited_ = false;
    void (*previousHandler_)(int) = SIG_DFL;
};

TEST_F(GameRecordsTest, AFailedSaveKeepsThePreviousFileAndReportsTheError) {
    const std::string previous = "old.zip\tOld\r\n";
    WriteGames(previous);
    for (int i = 0; i < 200; ++i) {
        MyClass* r = records_.Add("game" + std::to_string(i) + ".zip");
        r->RomFile = r->Key();
        r->Title = "A title long enough to pass the file size limit " + std::to_string(i);
    }
    std::string error;
    {
        const WritesFail failing(home_.path());
        error = Save();
    }
    EXPECT_FALSE(error.empty());
    EXPECT_EQ(GamesFile(), previous);
    EXPECT_NE(logged_.Text().find(" *** PlayForm SaveGameRecords Error 75: " + error),
              std::string::npos);
    // Nothing is left behind beside games.inc.
    int entries = 0;
    for ([[maybe_unused]] const auto& entry : fs::directory_iterator(home_.path())) ++entries;
    EXPECT_EQ(entries, 2);  // games.inc and roms
}

}  // namespace
}  // namespace qv
