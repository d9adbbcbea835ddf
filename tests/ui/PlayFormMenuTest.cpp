#include <QListWidget>
#include <QMenu>
#include <QMenuBar>
#include <QTimer>

#include "PlayFormFixture.h"
#include "ui/HelpPages.h"
#include "ui/HelpWindow.h"

namespace qv::test {
namespace {

using PlayFormMenuTest = PlayFormFixture;

// Captions of a menu in order; "-" for a separator, "(off)" after a command that cannot be
// chosen.
QStringList Captions(const QMenu* menu) {
    QStringList captions;
    for (const QAction* action : menu->actions()) {
        if (action->isSeparator()) captions << "-";
        else captions << action->text() + (action->isEnabled() ? "" : " (off)");
    }
    return captions;
}

const QMenu* MenuNamed(const PlayForm& window, const QString& title) {
    for (const QAction* action : window.menuBar()->actions())
        if (action->text() == title) return action->menu();
    return nullptr;
}

TEST_F(PlayFormMenuTest, MenusHaveTheirCommandsInOrderAndUnbuiltOnesAreOff) {
    PlayForm& window = Open();
    QStringList titles;
    for (const QAction* action : window.menuBar()->actions()) titles << action->text();
    EXPECT_EQ(titles, (QStringList{"&File", "&Edit", "&View", "&Help"}));

    EXPECT_EQ(Captions(MenuNamed(window, "&File")),
              (QStringList{"&Save ROM Information", "Use Voice (off)", "Options ... (off)",
                           "Internet Update ... (off)", "Download Screenshots (off)",
                           "Initialize MAME (off)", "Safe Mode (off)", "-", "Exit"}));
    EXPECT_EQ(Captions(MenuNamed(window, "&Edit")),
              (QStringList{"Refresh", "Rename (off)", "Delete (off)", "-",
                           "Edit Game Notes (off)", "View Game History (off)",
                           "View Game Log File (off)", "View Game Screenshot (off)", "-",
                           "Insert MAME Information (off)",
                           "Update MAME Info for All ROMs (off)", "-",
                           "Download ROMs ... (off)"}));
    EXPECT_EQ(Captions(MenuNamed(window, "&View")),
              (QStringList{"View My Hidden ROMs", "View My Working ROMs Only", "-",
                           "Add All Emulated Games", "-", "Full Screen", "Normal",
                           "Minimize"}));
    EXPECT_EQ(Captions(MenuNamed(window, "&Help")),
              (QStringList{"Quorvane Help", "MAME Tips", "-", "About Quorvane"}));

    for (const char* name : {"mSave", "mVoice", "mConfig", "mUpdate", "mDownloadSnaps",
                             "mMAMEConf", "mSafeMode", "mExit", "mRefresh", "mRename",
                             "mDelete", "mNotes", "mHistory", "mLog", "mScreenshot",
                             "mInsertInfo", "mUpdateAll", "mDownloadRoms", "mViewHidden",
                             "mViewWorking", "mViewAll", "mFullScreen", "mNormal",
                             "mMinimize", "mHelp", "mMAMEHelp", "mAbout"})
        EXPECT_NE(Command(name), nullptr);
}

TEST_F(PlayFormMenuTest, WithoutEditingTheEditingCommandsAreOffAndNotesAreOnlyViewed) {
    program.options.Edit = false;
    program.options.Speak = false;
    Open();
    for (const char* off : {"mSave", "mDelete", "mRename"})
        EXPECT_FALSE(Command(off)->isEnabled()) << off;
    EXPECT_EQ(Command("mNotes")->text(), "View Game Notes");
    EXPECT_TRUE(Command("mRefresh")->isEnabled());
    EXPECT_FALSE(Command("mVoice")->isChecked());  // speech is off
}

TEST_F(PlayFormMenuTest, LogoClicksShowAndHideTheMenuBarAndDoubleClicksSpeak) {
    PlayForm& window = Open();
    EXPECT_TRUE(window.menuBar()->isHidden());
    Click("Image3");
    EXPECT_TRUE(window.MenuBarShown());
    EXPECT_FALSE(window.menuBar()->isHidden());
    Click("Image3");
    EXPECT_TRUE(window.menuBar()->isHidden());

    std::vector<std::string> spoken;
    window.Hooks().speak = [&](const std::string& text) { spoken.push_back(text); };
    QTest::mouseDClick(Control("Image3"), Qt::LeftButton);
    Click("Label15");
    EXPECT_EQ(spoken, (std::vector<std::string>{"Quorvane! Version 2.25", "8 ROMS (13 KB)"}));
}

TEST_F(PlayFormMenuTest, RightButtonOnTheCountLabelSwapsTreeAndFileList) {
    Open();
    auto* tree = Control<QTreeView>("TreeView1");
    auto* files = Control<QListWidget>("File1");
    ASSERT_NE(files, nullptr);
    EXPECT_FALSE(tree->isHidden());
    EXPECT_TRUE(files->isHidden());

    QTest::mousePress(Control("Label15"), Qt::RightButton);
    EXPECT_TRUE(tree->isHidden());
    EXPECT_FALSE(files->isHidden());
    QStringList names;
    for (int row = 0; row < files->count(); ++row) names << files->item(row)->text();
    EXPECT_EQ(names, (QStringList{"digdug.zip", "dkong.zip", "galaga.zip", "joust.zip",
                                  "mystery.zip", "pacman.zip", "qbert.zip", "readme.txt"}));

    QTest::mousePress(Control("Label15"), Qt::RightButton);
    EXPECT_FALSE(tree->isHidden());
    EXPECT_TRUE(files->isHidden());
}

TEST_F(PlayFormMenuTest, FullScreenHidesTheMenusAndMinimizeMinimizes) {
    PlayForm& window = Open();
    window.ShowMenuBar(true);
    Command("mFullScreen")->trigger();
    EXPECT_FALSE(window.MenuBarShown());
    Command("mMinimize")->trigger();
    EXPECT_TRUE(window.windowState() & Qt::WindowMinimized);
}

TEST_F(PlayFormMenuTest, HelpReplacesTheMainWindowUntilItCloses) {
    EnsureHelpPages(home.path());
    PlayForm& window = Open();
    Command("mMAMEHelp")->trigger();
    ASSERT_NE(window.Help(), nullptr);
    EXPECT_TRUE(window.isHidden());
    EXPECT_TRUE(window.Help()->CurrentPage().endsWith("help/mame.html"));
    window.Help()->close();
    EXPECT_FALSE(window.isHidden());
    Command("mHelp")->trigger();
    EXPECT_TRUE(window.Help()->CurrentPage().endsWith("help/quorvane.html"));
    window.Help()->close();
}

TEST_F(PlayFormMenuTest, AboutHidesTheMainWindowAndReturnsToFullScreen) {
    PlayForm& window = Open();
    window.ShowMenuBar(true);
    bool hiddenWhileOpen = false;
    QTimer::singleShot(0, [&] {
        hiddenWhileOpen = window.isHidden();
        if (QWidget* about = QApplication::activeModalWidget()) about->close();
    });
    Command("mAbout")->trigger();
    EXPECT_TRUE(hiddenWhileOpen);
    EXPECT_FALSE(window.isHidden());
    EXPECT_FALSE(window.MenuBarShown());
}

}  // namespace
}  // namespace qv::test
