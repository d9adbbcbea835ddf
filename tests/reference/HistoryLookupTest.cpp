#include <gtest/gtest.h>

#include <filesystem>
#include <random>
#include <string>
#include <thread>

#include "reference/GameNotes.h"
#include "reference/ReferenceIndex.h"
#include "reference/ReferenceScan.h"
#include "reference/ReferenceViews.h"
#include "support/FixedLog.h"

namespace qv {
namespace {

std::string Crlf(std::string text) {
    std::string out;
    for (char c : text) {
        if (c == '\n') out += '\r';
        out += c;
    }
    return out;
}

// A history file in the published layout: several names per entry, a section header, blank
// lines, comments, an upper-case directive and a trailing comma.
const char* kHistory =
    "# history.dat revision 1.00\n"
    "$info=pacman,puckman,\n"
    "$bio\n"
    "\n"
    "  Line one  \n"
    "# a comment inside the entry\n"
    "\n"
    "Line two\n"
    "$end\n"
    "$info=galaga, galagao\n"
    "$bio\n"
    "Galaga text\n"
    "$End\n"
    "still galaga\n"
    "$end\n"
    "$INFO=dkong\n"
    "$bio\n"
    "Hidden by upper case\n"
    "$end\n"
    "$info=mspacman\n"
    "$bio\n"
    "Ms. Pac-Man rises\n"
    "$end\n"
    "$info=empty\n"
    "$end\n"
    "$info=unclosed\n"
    "$bio\n"
    "\n"
    "Runs to the end\n";

struct Views : test::LogFixture {
    Options options;
    MyClass records;
    GameNotes notes{records, options};
    ReferenceViews views{options, notes, log};
    DetailsText area;

    explicit Views(const std::string& history = kHistory, const std::string& info = kHistory) {
        options.HistoryFile = dir.Write("history.dat", history).string();
        options.MameInfoFile = dir.Write("mameinfo.dat", info).string();
    }
};

TEST(HistoryLookup, ShowsEntryTextForEveryListedNameWithSpecifiedTrimmingAndSkipping) {
    for (const std::string& bytes : {std::string(kHistory), Crlf(kHistory)}) {
        Views v(bytes, bytes);
        const std::string expected = "Line one\r\n\r\nLine two\r\n";
        for (const char* name : {"pacman.zip", "puckman.zip", "PACMAN.zip", "PacMan.ZIP", "pacman"}) {
            v.views.ShowHistory(v.area, name);
            EXPECT_EQ(v.area.Text, expected) << name;
            EXPECT_EQ(v.area.Colour, textcolours::Shown);
            EXPECT_EQ(v.area.Marker, "Hist");
            EXPECT_TRUE(v.area.ReadOnly);
        }
        // Information keeps the blank after the section header after "MAME ".
        v.views.ShowMameInfo(v.area, "pacman.zip");
        EXPECT_EQ(v.area.Text, "MAME \r\nLine one\r\n\r\nLine two\r\n");
        EXPECT_EQ(v.area.Marker, "Info");
        v.views.ShowMameInfo(v.area, "mspacman.zip");
        EXPECT_EQ(v.area.Text, "MAME Ms. Pac-Man rises\r\n");
    }
}

TEST(HistoryLookup, ItemsAndDirectivesAreComparedExactly) {
    Views v;
    // " galagao" keeps its leading space; "$End" closes nothing.
    v.views.ShowHistory(v.area, "galagao.zip");
    EXPECT_EQ(v.area.Text, "No history data found for galagao.zip.");
    EXPECT_EQ(v.area.Colour, textcolours::Failure);
    v.views.ShowHistory(v.area, "galaga.zip");
    EXPECT_EQ(v.area.Text, "Galaga text\r\nstill galaga\r\n");
    // "$INFO=" opens nothing.
    v.views.ShowHistory(v.area, "dkong.zip");
    EXPECT_EQ(v.area.Text, "No history data found for dkong.zip.");
    v.views.ShowMameInfo(v.area, "dkong.zip");
    EXPECT_EQ(v.area.Text, "No MAME info data found for dkong.zip.");
    EXPECT_EQ(v.area.Colour, textcolours::Failure);
    // The empty item after a trailing comma never matches, not even a name that is only ".zip".
    v.views.ShowHistory(v.area, ".zip");
    EXPECT_EQ(v.area.Text, "No history data found for .zip.");
}

TEST(HistoryLookup, EmptyClosedEntryAndUnclosedEntry) {
    Views v;
    v.views.ShowHistory(v.area, "empty.zip");
    EXPECT_EQ(v.area.Text, "");
    EXPECT_EQ(v.area.Colour, textcolours::Shown);
    v.views.ShowMameInfo(v.area, "empty.zip");
    EXPECT_EQ(v.area.Text, "MAME ");
    EXPECT_EQ(v.area.Colour, textcolours::Searching);
    // Matched but never closed: what was collected is shown, not the searching message.
    v.views.ShowHistory(v.area, "unclosed.zip");
    EXPECT_EQ(v.area.Text, "Runs to the end\r\n");
    EXPECT_EQ(v.area.Colour, textcolours::Shown);
    v.views.ShowMameInfo(v.area, "unclosed.zip");
    EXPECT_EQ(v.area.Text, "MAME \r\nRuns to the end\r\n");
}

TEST(HistoryLookup, MissingFileAndMissingNameMessages) {
    Views v;
    v.options.HistoryFile = (v.dir / "nothere.dat").string();
    v.area.ReadOnly = false;
    v.views.ShowHistory(v.area, "pacman.zip");
    EXPECT_EQ(v.area.Text, "History.dat not found:\r\n" + v.options.HistoryFile);
    EXPECT_EQ(v.area.Colour, textcolours::Failure);
    EXPECT_TRUE(v.area.ReadOnly);
    v.options.MameInfoFile = "";
    v.views.ShowMameInfo(v.area, "pacman.zip");
    EXPECT_EQ(v.area.Text, "MAMEInfo.dat not found:\r\n");

    Views w;
    w.area.Text = "before";
    w.views.ShowHistory(w.area, "");
    w.views.ShowMameInfo(w.area, "");
    EXPECT_EQ(w.area.Text, "before");
    EXPECT_EQ(w.area.Marker, "Info");
    const std::string logText = w.LogText();
    EXPECT_NE(logText.find("History: No game specified."), std::string::npos);
    EXPECT_NE(logText.find("MAMEInfo: No game specified."), std::string::npos);
    w.views.ShowHistory(w.area, "pacman.zip");
    EXPECT_NE(w.LogText().find("HISTORY: pacman.zip"), std::string::npos);
    EXPECT_EQ(UnavailableMessage(ReferenceKind::History, "x"), "Cannot find history file.");
    EXPECT_EQ(UnavailableMessage(ReferenceKind::Info, ""), "No MAME Info file identified.");
}

TEST(HistoryLookup, StoresPendingNotesBeforeOverwritingTheArea) {
    Views v;
    v.records.Add("pacman.zip")->RomFile = "pacman.zip";
    v.notes.ShowNotes(v.area, "pacman.zip");
    v.area.Text = "typed\tnote";
    v.views.ShowHistory(v.area, "pacman.zip");
    EXPECT_EQ(v.records.Item("pacman.zip")->Notes, "typed<tab>note");
    EXPECT_TRUE(v.notes.NotesOwnerKey().empty());
}

TEST(HistoryIndex, RebuildsWhenTheFileChangesAndReadsOnlyOnceOtherwise) {
    test::TempDir dir;
    const auto file = dir.Write("h.dat", "$info=a\nA1\n$end\n$info=b\nB1\n$end\n");
    ReferenceIndex index(ReferenceKind::History);
    EXPECT_EQ(index.Find(file, "a")->text, "A1\r\n");
    EXPECT_EQ(index.Find(file, "b")->text, "B1\r\n");
    EXPECT_EQ(index.Find(file, "c")->matched, false);
    EXPECT_EQ(index.Builds(), 1);
    // Same size, new content and time: the index must notice.
    dir.Write("h.dat", "$info=b\nB2\n$end\n$info=a\nA2\n$end\n");
    std::filesystem::last_write_time(
        file, std::filesystem::last_write_time(file) + std::chrono::seconds(5));
    EXPECT_EQ(index.Find(file, "a")->text, "A2\r\n");
    EXPECT_EQ(index.Builds(), 2);
    dir.Write("h.dat", "$info=a\nA3 longer\n$end\n");
    EXPECT_EQ(index.Find(file, "a")->text, "A3 longer\r\n");
    std::filesystem::remove(file);
    EXPECT_FALSE(index.Find(file, "a").has_value());
}

// Random files built from the pieces that matter; the indexed answer must equal the scan.
std::string RandomDatabase(std::mt19937& random, int entries) {
    const char* names[] = {"pacman", "puckman", "galaga", "dkong", "a", "b", "mspacman", "x"};
    const char* lines[] = {"text", "  padded  ", "", "# comment", "$bio", "$end", "$End",
                           "$INFO=pacman", "   $end  ", "$info=", "tab\there", "\r", "$mame"};
    auto pick = [&](int n) { return static_cast<int>(random() % static_cast<unsigned>(n)); };
    std::string out;
    const std::string eol = pick(2) ? "\r\n" : "\n";
    for (int e = 0; e < entries; ++e) {
        std::string line = std::string(pick(3) == 0 ? "  " : "") + "$info=";
        const int count = 1 + pick(3);
        for (int n = 0; n < count; ++n) {
            if (n) line += pick(4) ? "," : ", ";
            line += names[pick(8)];
        }
        if (pick(4) == 0) line += ",";
        out += line + eol;
        const int body = pick(6);
        for (int l = 0; l < body; ++l) out += std::string(lines[pick(13)]) + eol;
        if (pick(5) != 0) out += "$end" + eol;
    }
    if (pick(2)) out += "last line without end";
    return out;
}

TEST(HistoryIndex, IndexedAnswerEqualsTheScanOnVariedFiles) {
    test::TempDir dir;
    std::mt19937 random(20040317);
    const char* keys[] = {"pacman", "puckman", "galaga", "dkong", "a", "b", "mspacman", "x", "",
                          "nothere"};
    int matched = 0, unclosed = 0;
    for (int round = 0; round < 60; ++round) {
        const std::string bytes = RandomDatabase(random, 1 + round % 12);
        const auto file = dir.Write("db" + std::to_string(round) + ".dat", bytes);
        for (ReferenceKind kind : {ReferenceKind::History, ReferenceKind::Info}) {
            ReferenceIndex index(kind);
            for (int pass = 0; pass < 2; ++pass) {  // fresh build, then from the positions
                for (const char* key : keys) {
                    const EntryText scanned = ScanReference(bytes, key, kind);
                    const std::optional<EntryText> indexed = index.Find(file, key);
                    ASSERT_TRUE(indexed.has_value());
                    EXPECT_EQ(indexed->text, scanned.text) << "round " << round << " key " << key;
                    EXPECT_EQ(indexed->matched, scanned.matched);
                    EXPECT_EQ(indexed->closed, scanned.closed);
                    matched += scanned.matched;
                    unclosed += scanned.matched && !scanned.closed;
                }
            }
            EXPECT_EQ(index.Builds(), 1);
        }
    }
    // The generated files really exercise found and unclosed entries.
    EXPECT_GT(matched, 200);
    EXPECT_GT(unclosed, 8);
}

TEST(HistoryIndex, EntryLongerThanOneReadChunkIsCollectedWhole) {
    test::TempDir dir;
    std::string body;
    for (int i = 0; i < 20000; ++i) body += "line " + std::to_string(i) + "\r\n";
    const std::string bytes = "$info=first\r\nx\r\n$end\r\n$info=big\r\n" + body + "$end\r\n";
    const auto file = dir.Write("big.dat", bytes);
    ReferenceIndex index(ReferenceKind::History);
    index.Find(file, "first");
    EXPECT_EQ(index.Find(file, "big")->text, body);
}

}  // namespace
}  // namespace qv
