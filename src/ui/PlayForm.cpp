#include "ui/PlayForm.h"

#include <QAction>
#include <QApplication>
#include <QCloseEvent>
#include <QFrame>
#include <QHBoxLayout>
#include <QLabel>
#include <QMenuBar>
#include <QScreen>
#include <QTreeView>
#include <QVBoxLayout>

#include "app/AppVersion.h"
#include "catalogue/GameTreeBuilder.h"
#include "catalogue/RomLibrary.h"
#include "ui/AboutWindow.h"
#include "ui/BusyCursor.h"
#include "ui/ClickLabel.h"
#include "ui/HelpWindow.h"
#include "ui/PlayFormStyle.h"
#include "ui/TitleArea.h"
#include "ui/TreePane.h"
#include "ui/WaitWindow.h"

namespace qv {

PlayForm::PlayForm(Program& program, WaitWindow* wait, QWidget* parent)
    : QMainWindow(parent), program_(program), wait_(wait) {
    setObjectName(QStringLiteral("PlayForm"));
    setWindowTitle(QString::fromLatin1(app_version::ProgramName));
    setWindowIcon(icons_.Icon("logo"));
    setStyleSheet(PlayFormStyleSheet());
    resize(1200, 800);
    menus_ = MainMenus::Build(menuBar(), this);
    BuildLayout();
    ConnectCommands();
}

PlayForm::~PlayForm() = default;

void PlayForm::BuildLayout() {
    auto* central = new QWidget(this);
    central->setObjectName(QStringLiteral("PlayFormBody"));
    title_ = new TitleArea(icons_, central);
    pane_ = new TreePane(tree_, icons_, central);
    pane_->setMinimumWidth(320);

    auto* details = new QFrame(central);
    details->setObjectName(QStringLiteral("DetailsHost"));
    details->setFrameShape(QFrame::StyledPanel);
    detailsLayout_ = new QVBoxLayout(details);
    detailsLayout_->setContentsMargins(12, 12, 12, 12);
    detailsLayout_->setSpacing(8);

    auto* body = new QHBoxLayout;
    body->setContentsMargins(10, 0, 10, 10);
    body->setSpacing(10);
    body->addWidget(pane_, 2);
    body->addWidget(details, 3);

    auto* column = new QVBoxLayout(central);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(8);
    column->addWidget(title_);
    column->addLayout(body, 1);
    setCentralWidget(central);
}

void PlayForm::ConnectCommands() {
    const MainMenus& m = menus_;
    connect(m.mSave, &QAction::triggered, this, [this] { SaveRomInformation(); });
    connect(m.mExit, &QAction::triggered, this, [this] { close(); });
    connect(m.mRefresh, &QAction::triggered, this, [this] { Refresh(); });
    connect(m.mViewHidden, &QAction::triggered, this, [this](bool on) { SetShowHidden(on); });
    connect(m.mViewWorking, &QAction::triggered, this, [this](bool on) { SetShowWorking(on); });
    connect(m.mViewAll, &QAction::triggered, this, [this] { AddAllEmulatedGames(); });
    connect(m.mFullScreen, &QAction::triggered, this, [this] { FullScreen(); });
    connect(m.mNormal, &QAction::triggered, this, [this] { MinimizeWindow(); });
    connect(m.mMinimize, &QAction::triggered, this, [this] { MinimizeWindow(); });
    connect(m.mHelp, &QAction::triggered, this, [this] { ShowHelp("QUORVANE"); });
    connect(m.mMAMEHelp, &QAction::triggered, this, [this] { ShowHelp("MAME"); });
    connect(m.mAbout, &QAction::triggered, this, [this] { ShowAbout(); });

    connect(title_->Logo(), &ClickLabel::clicked, this, [this] { ShowMenuBar(!menuBarShown_); });
    connect(title_->Logo(), &ClickLabel::doubleClicked, this, [this] {
        Speak(std::string(app_version::ProgramName) + "! Version " + app_version::Version);
    });
    connect(title_->Banner(), &ClickLabel::doubleClicked, this, [this] {
        if (menus_.mInsertInfo->isEnabled()) menus_.mInsertInfo->trigger();
    });
    connect(title_->Banner(), &ClickLabel::rightReleased, this, [this] { close(); });
    connect(title_->MinimizeImage(), &ClickLabel::clicked, this, [this] { MinimizeWindow(); });
    connect(title_->ExitImage(), &ClickLabel::clicked, this, [this] { close(); });

    ClickLabel* count = pane_->CountLabel();
    connect(count, &ClickLabel::clicked, this, [this, count] { Speak(count->text().toStdString()); });
    connect(count, &ClickLabel::rightPressed, this, [this] { pane_->SwapTreeAndFileList(); });

    connect(pane_, &TreePane::nodeSelected, this, [this](NodeId node) {
        if (hooks_.nodeSelected) hooks_.nodeSelected(node);
    });
    connect(pane_, &TreePane::gameActivated, this, [this](NodeId node) {
        if (hooks_.runGame) hooks_.runGame(node);
    });
}

void PlayForm::Load() {
    Options& options = program_.options;
    speechReady_ = false;
    ShowMenuBar(false);

    counts_ = LoadGameRecords(program_.gameRecords, options, program_.host, *program_.log, Status());
    pane_->FillFileList(options.DefaultROMdir);

    menus_.mViewHidden->setChecked(options.ShowHidden);
    menus_.mViewWorking->setChecked(options.ShowWorking);
    if (!options.Speak) menus_.mVoice->setChecked(false);
    if (!options.Edit) {
        for (QAction* action : menus_.EditingCommands()) action->setEnabled(false);
        menus_.mNotes->setText(QStringLiteral("View Game Notes"));
    }

    RebuildTree();
    speechReady_ = true;
    if (hooks_.checkVoice) hooks_.checkVoice();
    ShowCount();
    // Without a window manager a maximise request is not honoured; fill the screen anyway.
    if (const QScreen* screen = this->screen()) setGeometry(screen->availableGeometry());
    showMaximized();
    Speak(options.Intro);
    CloseWait();
}

void PlayForm::ShowMenuBar(bool visible) {
    menuBarShown_ = visible;
    for (QMenu* menu : {menus_.file, menus_.edit, menus_.view, menus_.help})
        menu->menuAction()->setVisible(visible);
    menuBar()->setVisible(visible);
}

void PlayForm::SaveRomInformation() {
    const std::string error = SaveGameRecords(program_.gameRecords, program_.options, program_.host,
                                              *program_.regional, *program_.log);
    if (!error.empty())
        program_.prompt->Inform("The ROM information could not be saved.\n\n" + error,
                                PromptIcon::Critical, app_version::ProgramName);
}

void PlayForm::SetShowHidden(bool show) {
    program_.options.ShowHidden = show;
    menus_.mViewHidden->setChecked(show);
    RebuildTree();
}

void PlayForm::SetShowWorking(bool show) {
    program_.options.ShowWorking = show;
    menus_.mViewWorking->setChecked(show);
    RebuildTree();
}

void PlayForm::RebuildTree() {
    const SnapshotIndex snapshots(program_.options.SnapDir);
    pane_->ChangeTree([&] {
        qv::BuildGameTree(tree_, program_.gameRecords, program_.romLibrary, program_.options,
                          snapshots);
    }, false);
}

void PlayForm::AddAllEmulatedGames() {
    if (tree_.Find("MAME.ROMS") != NoNode) return;
    BusyCursor busy;
    ShowWait("Adding all MAME ROMs ... 0%");
    const SnapshotIndex snapshots(program_.options.SnapDir);
    pane_->ChangeTree([&] {
        qv::AddAllEmulatedGames(tree_, program_.romLibrary, program_.gameRecords, snapshots,
                                Status(), *program_.yield);
    }, true);
    CloseWait();
}

void PlayForm::Refresh() {
    pane_->FillFileList(program_.options.DefaultROMdir);
    ShowWait("Loading ...");
    counts_ = LoadGameRecords(program_.gameRecords, program_.options, program_.host,
                              *program_.log, Status());
    RebuildTree();
    ShowCount();
    CloseWait();
}

void PlayForm::FullScreen() {
    ShowMenuBar(false);
    if (const QScreen* screen = this->screen()) setGeometry(screen->availableGeometry());
    showMaximized();
}

void PlayForm::MinimizeWindow() { showMinimized(); }

void PlayForm::ShowHelp(const std::string& topic) {
    helpTopic_ = topic;
    if (!help_) {
        help_ = new HelpWindow(program_.appFolder, this);
        help_->setObjectName(QStringLiteral("Help"));
        connect(help_, &HelpWindow::closed, this, [this] { show(); });
    }
    hide();
    help_->ShowTopic(topic);
    help_->show();
    help_->raise();
}

void PlayForm::ShowAbout() {
    hide();
    AboutWindow about([this](const std::string& text) { Speak(text); }, this);
    about.setObjectName(QStringLiteral("About"));
    about.exec();
    FullScreen();
}

std::string PlayForm::CountCaption() const {
    return std::to_string(counts_.RomCount) + " ROMS (" +
           SizeText(counts_.RomBytes, *program_.regional) + ")";
}

void PlayForm::ShowCount() {
    pane_->CountLabel()->setText(QString::fromStdString(CountCaption()));
}

void PlayForm::ShowWait(const std::string& status) {
    if (!wait_) return;
    wait_->show();
    wait_->raise();
    wait_->SetStatus(status);
}

void PlayForm::CloseWait() {
    if (wait_ && wait_->isVisible()) wait_->hide();
}

StatusDisplay& PlayForm::Status() {
    if (wait_) return *wait_;
    return noStatus_;
}

void PlayForm::Speak(const std::string& text) {
    if (hooks_.speak) hooks_.speak(text);
}

bool PlayForm::ConfirmQuit() {
    Prompt& prompt = *program_.prompt;
    if (prompt.Ask(app_version::ProgramName, "Are you sure you want to quit?",
                   PromptButtons::YesNo, PromptIcon::Question) != PromptAnswer::Yes)
        return false;
    if (program_.options.SaveOnExit) {
        const std::string error = SaveGameRecords(program_.gameRecords, program_.options,
                                                  program_.host, *program_.regional,
                                                  *program_.log);
        // A failed save must not end the program silently: the user's changes would be gone.
        if (!error.empty() &&
            prompt.Ask(app_version::ProgramName,
                       "The ROM information could not be saved.\n\n" + error +
                           "\n\nQuit without saving?",
                       PromptButtons::YesNo, PromptIcon::Exclamation) != PromptAnswer::Yes)
            return false;
    }
    program_.log->WriteLog("", 1);
    return true;
}

void PlayForm::closeEvent(QCloseEvent* event) {
    if (quitting_) {
        event->accept();
        return;
    }
    if (!ConfirmQuit()) {
        event->ignore();
        return;
    }
    quitting_ = true;
    event->accept();
    emit quitConfirmed();
}

}  // namespace qv
