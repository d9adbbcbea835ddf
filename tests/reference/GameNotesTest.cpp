#include <gtest/gtest.h>

#include "reference/GameNotes.h"

namespace qv {
namespace {

TEST(NotesEscaping, TabsAndLineBreaksRoundTripAndLoneBreaksStay) {
    const std::string typed = "first line\r\n\tindented rest";
    EXPECT_EQ(EscapeNotes(typed), "first line<crlf><tab>indented rest");
    EXPECT_EQ(UnescapeNotes(EscapeNotes(typed)), typed);
    EXPECT_EQ(EscapeNotes("a\rb\nc"), "a\rb\nc");
    // The escape words typed literally come back as the characters they stand for.
    EXPECT_EQ(UnescapeNotes(EscapeNotes("x<tab>y<crlf>z")), "x\ty\r\nz");
    EXPECT_EQ(EscapeNotes("\t\r\n"), "<tab><crlf>");
    EXPECT_EQ(UnescapeNotes("<TAB>"), "<TAB>");
}

struct NotesView : ::testing::Test {
    Options options;
    MyClass records;
    GameNotes notes{records, options};
    DetailsText area;
    void SetUp() override {
        records.Add("pacman.zip")->Notes = "High score<crlf><tab>3,333,360";
        records.Add("galaga.zip")->Notes = "";
    }
};

TEST_F(NotesView, ShowsUnescapedNotesEditableWhenEditIsOn) {
    notes.ShowNotes(area, "PACMAN.ZIP");
    EXPECT_EQ(area.Text, "High score\r\n\t3,333,360");
    EXPECT_EQ(area.Marker, "Notes");
    EXPECT_EQ(area.Colour, textcolours::Shown);
    EXPECT_FALSE(area.ReadOnly);
    EXPECT_EQ(notes.NotesOwnerKey(), "PACMAN.ZIP");

    area.Text = "Edited\r\n\tagain";
    notes.ShowNotes(area, "galaga.zip");
    EXPECT_EQ(records.Item("pacman.zip")->Notes, "Edited<crlf><tab>again");
    EXPECT_EQ(notes.NotesOwnerKey(), "galaga.zip");
}

TEST_F(NotesView, ReadOnlyNotesAreStoredBackUnchangedAndSavedOnce) {
    options.Edit = false;
    notes.ShowNotes(area, "pacman.zip");
    EXPECT_TRUE(area.ReadOnly);
    notes.SaveNotes(area);
    EXPECT_EQ(records.Item("pacman.zip")->Notes, "High score<crlf><tab>3,333,360");
    area.Text = "changed after saving";
    notes.SaveNotes(area);  // nothing owns the area any more
    EXPECT_EQ(records.Item("pacman.zip")->Notes, "High score<crlf><tab>3,333,360");
}

TEST_F(NotesView, GameWithoutRecordShowsNoDetailsAndOwnsNothing) {
    area.ReadOnly = true;
    notes.ShowNotes(area, "dkong.zip");
    EXPECT_EQ(area.Text, "No details ...");
    EXPECT_EQ(area.Colour, textcolours::NoNotesRecord);
    EXPECT_TRUE(area.ReadOnly);
    EXPECT_TRUE(notes.NotesOwnerKey().empty());
    notes.ShowNotes(area, "");
    EXPECT_EQ(area.Text, "No details ...");
}

TEST_F(NotesView, RecordDeletedWhileShownIsNotAnError) {
    notes.ShowNotes(area, "galaga.zip");
    records.Delete("galaga.zip");
    area.Text = "orphan";
    notes.SaveNotes(area);
    EXPECT_TRUE(notes.NotesOwnerKey().empty());
    EXPECT_EQ(records.Count(), 1);
}

}  // namespace
}  // namespace qv
