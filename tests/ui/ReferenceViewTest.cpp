#include <QLineEdit>
#include <QImage>
#include <QMouseEvent>

#include "PlayFormFixture.h"
#include "support/RecordingSpeechEngine.h"
#include "ui/DetailsTextEdit.h"
#include "ui/GameRoadController.h"
#include "ui/ReferenceController.h"

namespace qv::test {
namespace {

class NoLauncher final : public ProcessLauncher {
public:
    ProcessId Start(const LaunchRequest&) override { return 0; }
    bool IsRunning(ProcessId) override { return false; }
};

const char* kHistory =
    "$info=pacman,puckman,\r\n$bio\r\n\r\nPac-Man history.\r\n\r\nSecond line.\r\n$end\r\n"
    "$info=galaga\r\n$bio\r\nGalaga history.\r\n$end\r\n";
const char* kInfo = "$info=pacman\r\n$mame\r\n0.36b1\r\n$end\r\n";

class ReferenceViewTest : public PlayFormFixture {
protected:
    void OpenWindow(bool withDatabases = true) {
        if (withDatabases) {
            program.options.HistoryFile = home.Write("history.dat", kHistory).string();
            program.options.MameInfoFile = home.Write("mameinfo.dat", kInfo).string();
        } else {
            program.options.HistoryFile = (home / "nothere.dat").string();
            program.options.MameInfoFile.clear();
        }
        program.options.Speak = true;
        Open([&](PlayForm& f) {
            road = new GameRoadController(f, program, speech, launcher);
            AttachReference(f, program, *road);
        });
        form->resize(1200, 800);
        QApplication::processEvents();
        speech.spoken.clear();
    }
    DetailsTextEdit* TextArea() { return Control<DetailsTextEdit>("Text2"); }
    QString ShownText() { return TextArea()->toPlainText(); }

    RecordingSpeechEngine speech;
    NoLauncher launcher;
    GameRoadController* road = nullptr;
};

TEST_F(ReferenceViewTest, HistoryAndInfoTabsShowEntriesAndFollowTheSelection) {
    OpenWindow();
    Select("alpha_pacman.zip");
    Click("IHistory");
    EXPECT_TRUE(Shown("IHistory2"));
    EXPECT_FALSE(Shown("IHistory"));
    EXPECT_EQ(ShownText(), "Pac-Man history.\n\nSecond line.\n");
    EXPECT_TRUE(TextArea()->isReadOnly());
    Select("alpha_galaga.zip");  // the chosen view is repeated for the new game
    EXPECT_EQ(ShownText(), "Galaga history.\n");

    Select("alpha_pacman.zip");
    Click("IMAMEInfo");
    EXPECT_TRUE(Shown("IHistory"));
    EXPECT_EQ(ShownText(), "MAME 0.36b1\n");
    Command("mHistory")->trigger();  // "View Game History" runs the history tab's handler
    EXPECT_EQ(TextArea()->Marker(), "Hist");

    speech.spoken.clear();
    QTest::mouseDClick(TextArea()->viewport(), Qt::LeftButton);
    EXPECT_EQ(speech.Last(), "Pac-Man history.\r\n\r\nSecond line.\r\n");
}

TEST_F(ReferenceViewTest, MissingDatabasesAreMarkedAndOnlySpoken) {
    OpenWindow(false);
    EXPECT_EQ(Control("IHistory")->toolTip(), "Not found");
    Select("alpha_pacman.zip");
    speech.spoken.clear();
    Click("IHistory");
    EXPECT_EQ(speech.Last(), "Cannot find history file.");
    EXPECT_TRUE(TextArea()->Marker().isEmpty());
}

TEST_F(ReferenceViewTest, NotesAreEditedStoredEscapedAndReachGamesInc) {
    OpenWindow();
    EXPECT_EQ(Command("mNotes")->text(), "Edit Game Notes");
    Select("alpha_pacman.zip");
    Click("INotes");
    EXPECT_TRUE(Shown("INotes2"));
    EXPECT_EQ(TextArea()->Marker(), "Notes");
    EXPECT_FALSE(TextArea()->isReadOnly());
    TextArea()->setFocus();
    QTest::keyClicks(TextArea(), "Best: 3,333,360");
    QTest::keyClick(TextArea(), Qt::Key_Return);
    QTest::keyClick(TextArea(), Qt::Key_Tab);
    QTest::keyClicks(TextArea(), "perfect");
    Select("alpha_galaga.zip");  // the area changes content: the notes are stored
    EXPECT_EQ(program.gameRecords.Item("pacman.zip")->Notes, "Best: 3,333,360<crlf><tab>perfect");
    EXPECT_EQ(ShownText(), "");
    Select("alpha_pacman.zip");
    EXPECT_EQ(ShownText(), "Best: 3,333,360\n\tperfect");

    Command("mSave")->trigger();
    EXPECT_NE(home.Read("games.inc").find("Best: 3,333,360<crlf><tab>perfect"), std::string::npos);

    // Double-clicking the notes tab shows the game log instead.
    home.Write("logs/pacman.log", "Average FPS: 60.0\n");
    QTest::mouseDClick(Control("INotes2"), Qt::LeftButton);
    EXPECT_EQ(TextArea()->Marker(), "Log");
    EXPECT_EQ(ShownText(), "Average FPS: 60.0\n");
    Command("mLog")->trigger();
    EXPECT_EQ(ShownText(), "Average FPS: 60.0\n");
}

TEST_F(ReferenceViewTest, NotesAreReadOnlyWhenEditingIsOff) {
    program.options.Edit = false;
    program.gameRecords.Clear();
    OpenWindow();
    program.gameRecords.Item("pacman.zip")->Notes = "Kept<tab>as is";
    Select("alpha_pacman.zip");
    Command("mNotes")->trigger();
    EXPECT_TRUE(TextArea()->isReadOnly());
    EXPECT_EQ(ShownText(), "Kept\tas is");
    Click("IHistory");
    EXPECT_EQ(program.gameRecords.Item("pacman.zip")->Notes, "Kept<tab>as is");
}

TEST_F(ReferenceViewTest, RenameInPlaceChangesTitleNodesAndSpeaksIt) {
    OpenWindow();
    Select("alpha_pacman.zip");
    Command("mRename")->trigger();
    auto* editor = form->findChild<QLineEdit*>("TreeLabelEdit");
    ASSERT_NE(editor, nullptr);
    EXPECT_EQ(editor->text(), "Pac-Man");
    editor->setText("Puck Man & Co");
    speech.spoken.clear();
    QTest::keyClick(editor, Qt::Key_Return);
    EXPECT_EQ(program.gameRecords.Item("pacman.zip")->Title, "Puck Man & Co");
    EXPECT_EQ(TextOf("Maze_pacman.zip"), "Puck Man & Co");
    EXPECT_EQ(Control<QLabel>("Label1")->toolTip(), "Puck Man & Co");
    EXPECT_EQ(speech.Last(), "Puck Man & Co");
}

// The rules are the editing core's; here one click each reaches them and the tree follows.
TEST_F(ReferenceViewTest, DeleteInsertAndUpdateAllThroughTheEditMenu) {
    OpenWindow();
    Select("alpha_galaga.zip");
    prompt->Answer(PromptAnswer::Yes);
    prompt->Answer(PromptAnswer::No);  // keep the archive
    Command("mDelete")->trigger();
    EXPECT_EQ(program.gameRecords.Item("galaga.zip")->RomFile, "^galaga.zip");
    EXPECT_FALSE(NodeIndex("Shooter_galaga.zip").isValid());

    Select("alpha_digdug.zip");
    program.gameRecords.Item("digdug.zip")->Title = "My Dig Dug";
    QTest::mouseDClick(Control("Image1"), Qt::LeftButton);  // same as Insert MAME Information
    EXPECT_EQ(Control<QLabel>("Label3")->text(), "(C) 1982, Namco");

    program.gameRecords.Item("dkong.zip")->Title = "dkong.zip";
    prompt->Answer(PromptAnswer::No);
    Command("mUpdateAll")->trigger();
    EXPECT_EQ(TextOf("alpha_dkong.zip"), "Donkey Kong");
    EXPECT_EQ(prompt->unexpected, 0);
}

QImage Picture(int width, int height, QColor colour) {
    QImage image(width, height, QImage::Format_RGB32);
    image.fill(colour);
    return image;
}

void SendMouse(QWidget* widget, QEvent::Type type, QPoint at, Qt::MouseButton button,
               Qt::MouseButtons buttons) {
    QMouseEvent event(type, QPointF(at), widget->mapToGlobal(QPointF(at)), button, buttons,
                      Qt::NoModifier);
    QApplication::sendEvent(widget, &event);
}

TEST_F(ReferenceViewTest, PicturesAreLaidOutDraggedAndPutBack) {
    program.options.MarqueeDir = (home / "marquee").string();
    std::filesystem::create_directories(program.options.MarqueeDir);
    ASSERT_TRUE(Picture(256, 224, Qt::blue).save(QString::fromStdString((home / "snap" / "pacman.png").string())));
    ASSERT_TRUE(Picture(300, 60, Qt::yellow).save(QString::fromStdString((home / "marquee" / "pacman.png").string())));
    OpenWindow();
    Select("alpha_pacman.zip");
    Command("mScreenshot")->trigger();
    EXPECT_TRUE(Shown("IScreen2"));
    auto* shot = Control("Picture2");
    EXPECT_EQ(Control("Picture1")->geometry(), QRect(90, 0, 300, 60));
    EXPECT_EQ(shot->geometry(), QRect(112, 60, 256, 224));

    // Drag the screenshot with the left button (which buttons drag is the layout core's rule).
    SendMouse(shot, QEvent::MouseButtonPress, {10, 10}, Qt::LeftButton, Qt::LeftButton);
    SendMouse(shot, QEvent::MouseMove, {30, 25}, Qt::NoButton, Qt::LeftButton);
    EXPECT_EQ(shot->pos(), QPoint(132, 75));
    SendMouse(shot, QEvent::MouseButtonRelease, {30, 25}, Qt::LeftButton, Qt::NoButton);
    QTest::mouseDClick(shot, Qt::LeftButton);
    EXPECT_EQ(shot->pos(), QPoint(112, 60));

    Select("alpha_digdug.zip");
    EXPECT_FALSE(shot->isVisibleTo(form.get()));
    EXPECT_EQ(Control<QLabel>("LabelNoScreenshot")->text(), "No screenshot available.");
}

TEST_F(ReferenceViewTest, MalformedPictureIsLoggedAndNeverEndsTheProgram) {
    home.Write("snap/pacman.png", std::string("\x89PNG\r\n\x1a\n", 8) + std::string(40, '\xff'));
    OpenWindow();
    Select("alpha_pacman.zip");
    Click("IScreen");
    EXPECT_FALSE(Control("Picture2")->isVisibleTo(form.get()));
    EXPECT_TRUE(Shown("LabelNoScreenshot"));
    EXPECT_NE(home.Read("quorvane.log").find("PlayForm ShowPNG Error"), std::string::npos);
}

}  // namespace
}  // namespace qv::test
