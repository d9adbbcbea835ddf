#pragma once
#include <QList>

class QAction;
class QMenu;
class QMenuBar;
class QObject;

namespace qv {

// The main window's four menus with their commands, in their fixed order. Commands whose work
// is not built yet are created disabled so that nothing pretends to work.
struct MainMenus {
    QMenu* file = nullptr;
    QMenu* edit = nullptr;
    QMenu* view = nullptr;
    QMenu* help = nullptr;

    // &File
    QAction* mSave = nullptr;
    QAction* mVoice = nullptr;
    QAction* mConfig = nullptr;
    QAction* mUpdate = nullptr;
    QAction* mDownloadSnaps = nullptr;
    QAction* mMAMEConf = nullptr;
    QAction* mSafeMode = nullptr;
    QAction* mExit = nullptr;
    // &Edit
    QAction* mRefresh = nullptr;
    QAction* mRename = nullptr;
    QAction* mDelete = nullptr;
    QAction* mNotes = nullptr;
    QAction* mHistory = nullptr;
    QAction* mLog = nullptr;
    QAction* mScreenshot = nullptr;
    QAction* mInsertInfo = nullptr;
    QAction* mUpdateAll = nullptr;
    QAction* mDownloadRoms = nullptr;
    // &View
    QAction* mViewHidden = nullptr;
    QAction* mViewWorking = nullptr;
    QAction* mViewAll = nullptr;
    QAction* mFullScreen = nullptr;
    QAction* mNormal = nullptr;
    QAction* mMinimize = nullptr;
    // &Help
    QAction* mHelp = nullptr;
    QAction* mMAMEHelp = nullptr;
    QAction* mAbout = nullptr;

    // Creates the menus in the bar; actions are children of owner.
    static MainMenus Build(QMenuBar* bar, QObject* owner);

    // The commands that editing switched off (Edit = No) makes unavailable.
    QList<QAction*> EditingCommands() const;
};

}  // namespace qv
