#include "ui/MainMenus.h"

#include <QAction>
#include <QMenu>
#include <QMenuBar>

namespace qv {

namespace {

QAction* Command(QMenu* menu, QObject* owner, const char* name, const char* caption,
                 bool available) {
    auto* action = new QAction(QString::fromUtf8(caption), owner);
    action->setObjectName(QString::fromLatin1(name));
    action->setEnabled(available);
    menu->addAction(action);
    return action;
}

QMenu* Menu(QMenuBar* bar, const char* name, const char* caption) {
    QMenu* menu = bar->addMenu(QString::fromUtf8(caption));
    menu->setObjectName(QString::fromLatin1(name));
    return menu;
}

}  // namespace

MainMenus MainMenus::Build(QMenuBar* bar, QObject* owner) {
    MainMenus m;
    constexpr bool now = true;     // works in this build
    constexpr bool later = false;  // its window or procedure is not built yet

    m.file = Menu(bar, "mFile", "&File");
    m.mSave = Command(m.file, owner, "mSave", "&Save ROM Information", now);
    m.mVoice = Command(m.file, owner, "mVoice", "Use Voice", later);
    m.mVoice->setCheckable(true);
    m.mVoice->setChecked(true);
    m.mConfig = Command(m.file, owner, "mConfig", "Options ...", later);
    m.mUpdate = Command(m.file, owner, "mUpdate", "Internet Update ...", later);
    m.mDownloadSnaps = Command(m.file, owner, "mDownloadSnaps", "Download Screenshots", later);
    m.mMAMEConf = Command(m.file, owner, "mMAMEConf", "Initialize MAME", later);
    m.mSafeMode = Command(m.file, owner, "mSafeMode", "Safe Mode", later);
    m.file->addSeparator();
    m.mExit = Command(m.file, owner, "mExit", "Exit", now);

    m.edit = Menu(bar, "mEdit", "&Edit");
    m.mRefresh = Command(m.edit, owner, "mRefresh", "Refresh", now);
    m.mRename = Command(m.edit, owner, "mRename", "Rename", later);
    m.mDelete = Command(m.edit, owner, "mDelete", "Delete", later);
    m.edit->addSeparator();
    m.mNotes = Command(m.edit, owner, "mNotes", "Edit Game Notes", later);
    m.mHistory = Command(m.edit, owner, "mHistory", "View Game History", later);
    m.mLog = Command(m.edit, owner, "mLog", "View Game Log File", later);
    m.mScreenshot = Command(m.edit, owner, "mScreenshot", "View Game Screenshot", later);
    m.edit->addSeparator();
    m.mInsertInfo = Command(m.edit, owner, "mInsertInfo", "Insert MAME Information", later);
    m.mUpdateAll = Command(m.edit, owner, "mUpdateAll", "Update MAME Info for All ROMs", later);
    m.edit->addSeparator();
    m.mDownloadRoms = Command(m.edit, owner, "mDownloadRoms", "Download ROMs ...", later);

    m.view = Menu(bar, "mView", "&View");
    m.mViewHidden = Command(m.view, owner, "mViewHidden", "View My Hidden ROMs", now);
    m.mViewHidden->setCheckable(true);
    m.mViewWorking = Command(m.view, owner, "mViewWorking", "View My Working ROMs Only", now);
    m.mViewWorking->setCheckable(true);
    m.view->addSeparator();
    m.mViewAll = Command(m.view, owner, "mViewAll", "Add All Emulated Games", now);
    m.view->addSeparator();
    m.mFullScreen = Command(m.view, owner, "mFullScreen", "Full Screen", now);
    m.mNormal = Command(m.view, owner, "mNormal", "Normal", now);
    m.mMinimize = Command(m.view, owner, "mMinimize", "Minimize", now);

    m.help = Menu(bar, "mHelpMenu", "&Help");
    m.mHelp = Command(m.help, owner, "mHelp", "Quorvane Help", now);
    m.mMAMEHelp = Command(m.help, owner, "mMAMEHelp", "MAME Tips", now);
    m.help->addSeparator();
    m.mAbout = Command(m.help, owner, "mAbout", "About Quorvane", now);
    return m;
}

QList<QAction*> MainMenus::EditingCommands() const {
    return {mSave, mConfig, mMAMEConf, mRename, mDelete, mInsertInfo, mUpdateAll};
}

}  // namespace qv
