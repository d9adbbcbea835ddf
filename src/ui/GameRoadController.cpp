#include "ui/GameRoadController.h"

#include <QAction>
#include <QApplication>
#include <QLineEdit>
#include <QToolButton>
#include <QTreeView>
#include <QVBoxLayout>

#include "app/EmulatorVersion.h"
#include "launch/DetailsSelection.h"
#include "launch/ExecutableCycle.h"
#include "launch/GameLauncher.h"
#include "launch/GameLog.h"
#include "launch/PanelSpeech.h"
#include "reference/MakeSpeakable.h"
#include "reference/VoiceToggle.h"
#include "ui/BusyCursor.h"
#include "ui/DetailsPanel.h"
#include "ui/PlayForm.h"
#include "ui/Program.h"
#include "ui/TreePane.h"

namespace qv {

GameRoadController::GameRoadController(PlayForm& form, Program& program, SpeechEngine& engine,
                                       ProcessLauncher& launcher)
    : QObject(&form),
      form_(form),
      program_(program),
      launcher_(launcher),
      panel_(new DetailsPanel),
      switches_(state_, program.gameRecords, program.options),
      speaker_(engine, program.options, *program.log),
      watch_(launcher) {
    form.DetailsLayout()->insertWidget(0, panel_, 0, Qt::AlignTop);

    PlayFormHooks& hooks = form.Hooks();
    hooks.speak = [this](const std::string& text) { Speak(text); };
    hooks.checkVoice = [this] { FinishLoad(); };
    hooks.nodeSelected = [this](NodeId node) { SelectNode(node); };
    hooks.runGame = [this](NodeId) { RunSelectedGame(); };

    connect(panel_, &DetailsPanel::switchClicked, this, &GameRoadController::ClickSwitch);
    connect(panel_, &DetailsPanel::ratingClicked, this, [this] {
        const std::string text = switches_.ClickRating();
        Render();
        Speak(text);
    });
    connect(panel_, &DetailsPanel::labelClicked, this,
            [this](PanelLabel label) { Speak(SpokenLabelText(label, state_)); });
    connect(panel_, &DetailsPanel::playClicked, this, [this] {
        RestorePlay(state_);
        Render();
        RunSelectedGame();
    });
    connect(panel_, &DetailsPanel::playHovered, this, [this] {
        HoverPlay(state_);
        Render();
    });
    connect(panel_, &DetailsPanel::backgroundHovered, this, [this] {
        if (state_.play != PlayImage::Active) return;
        RestorePlay(state_);
        Render();
    });
    connect(panel_, &DetailsPanel::executableClicked, this, [this] {
        Options& options = program_.options;
        options.MameExec = NextExecutable(options.MameExec, program_.host);
        RefreshExecutable();
    });
    connect(panel_, &DetailsPanel::versionDoubleClicked, this, &GameRoadController::RefreshVersion);
    connect(panel_, &DetailsPanel::resolutionClicked, this, &GameRoadController::NextResolution);

    const MainMenus& menus = form.Menus();
    menus.mSafeMode->setCheckable(true);
    menus.mSafeMode->setEnabled(true);
    connect(menus.mSafeMode, &QAction::triggered, this, [this](bool checked) {
        safeMode_ = checked;
    });
    menus.mVoice->setEnabled(true);
    connect(menus.mVoice, &QAction::triggered, this, [this](bool checked) {
        // The action has already flipped its mark; the command reads the mark it had before.
        form_.Menus().mVoice->setChecked(ToggleVoice(program_.options, !checked));
    });

    TreePane& pane = form.Pane();
    pane.SearchBox()->setEnabled(true);
    pane.SearchButton()->setEnabled(true);
    connect(pane.SearchBox(), &QLineEdit::returnPressed, this, &GameRoadController::SearchTree);
    connect(pane.SearchButton(), &QToolButton::clicked, this, &GameRoadController::SearchTree);

    watchTimer_.setInterval(1000);
    connect(&watchTimer_, &QTimer::timeout, this, &GameRoadController::WatchTick);
    watchTimer_.start();
    Render();
}

void GameRoadController::Speak(const std::string& text) {
    // Texts asked for while the window is still loading are dropped.
    speaker_.SetReady(form_.SpeechReady() && !quiet_);
    speaker_.Speak(text);
}

void GameRoadController::FinishLoad() {
    // Runs where the window's load checks the voice. The steps before it (executable, resolution
    // cycle, sound and joystick) belong to a load whose speech is not ready yet, so what they
    // would say is not said.
    Options& options = program_.options;
    quiet_ = true;
    RefreshExecutable();
    resolutions_.Build(options.Resolutions);
    state_.resolution = ResolutionCycle::kAuto;
    GameTree& tree = form_.Tree();
    if (options.Sound && !state_.sound.on) switches_.Click(PanelSwitch::Sound, tree, NoNode);
    if (options.Joystick && !state_.joystick.on)
        switches_.Click(PanelSwitch::Joystick, tree, NoNode);
    safeMode_ = InitialSafeMode(options);
    // The mark shows the flag from the start, so the first click turns it the other way.
    form_.Menus().mSafeMode->setChecked(safeMode_);
    quiet_ = false;

    speaker_.SetReady(form_.SpeechReady());
    speaker_.CheckVoice();
    if (!options.Speak) form_.Menus().mVoice->setChecked(false);
    Render();
}

void GameRoadController::Render() { panel_->Render(state_); }

NodeId GameRoadController::CurrentNode() const {
    TreePane& pane = form_.Pane();
    return pane.Model().NodeOf(pane.View()->currentIndex());
}

void GameRoadController::NodeChanged(NodeId node) {
    GameTreeModel& model = form_.Pane().Model();
    const QModelIndex index = model.IndexOf(node);
    if (index.isValid()) emit model.dataChanged(index, index);
}

void GameRoadController::SelectNode(NodeId node) {
    selectedNode_ = node;
    const std::string appFolder = program_.appFolder.string();
    SelectionSources sources{
        program_.gameRecords, program_.romLibrary, program_.options, program_.host,
        *program_.regional,
        [this, appFolder](const std::string& key) {
            return ReadFrameRate(GameLogPath(appFolder, key, program_.host), *program_.regional)
                .text;
        },
        state_.executable.colour != colours::Red};
    const SelectionResult result = qv::SelectNode(state_, form_.Tree(), node, sources);
    if (result.folder) return;
    if (result.nodeChanged) NodeChanged(node);
    Render();
    if (afterSelection) afterSelection(node, result);
    if (!result.titleToSpeak.empty()) Speak(MakeSpeakable(result.titleToSpeak));
}

void GameRoadController::ShowEditedTitle(const std::string& title, const std::string* makerLine) {
    state_.titleCaption = DoubleAmpersands(title);
    if (state_.titleCaption.size() > TitleCaptionLimit)
        state_.titleCaption = state_.titleCaption.substr(0, TitleCaptionLimit) + "...";
    state_.titleTooltip = title;
    if (makerLine) state_.maker = PanelText(DoubleAmpersands(*makerLine), colours::Green);
    Render();
}

void GameRoadController::ClickSwitch(PanelSwitch which) {
    const SwitchResult result = switches_.Click(which, form_.Tree(), selectedNode_);
    if (result.nodeChanged) NodeChanged(selectedNode_);
    Render();
    Speak(result.spoken);
}

void GameRoadController::RunSelectedGame() {
    RunRequest request;
    request.selectedGameKey = state_.selectedGameKey;
    request.switches = state_.Run();
    request.resolution = state_.resolution;
    request.safeMode = safeMode_;
    request.romFolder = program_.options.DefaultROMdir;
    request.currentEmulator = currentEmulator_;
    const GameLauncherServices services{program_.gameRecords, program_.options, program_.host,
                                        program_.appFolder.string(), *program_.log, launcher_,
                                        watch_, speaker_, *program_.prompt, *program_.clock,
                                        *program_.regional};
    speaker_.SetReady(form_.SpeechReady());
    RunGame(request, services);
}

void GameRoadController::WatchTick() {
    const GameWatch::TickResult tick = watch_.Tick(program_.gameRecords, state_.selectedGameKey);
    if (!tick.ended) return;
    {
        BusyCursor busy;
        QApplication::processEvents();
    }
    const NodeId node = CurrentNode();
    if (node != NoNode) SelectNode(node);
}

void GameRoadController::RefreshExecutable() {
    const ExecutableDisplay display = DescribeExecutable(program_.options, program_.host);
    if (!display.label.empty()) state_.executable.text = display.label;
    RefreshVersion();
    state_.executable.colour = display.present ? colours::Green : colours::Red;
    state_.play = display.present ? PlayImage::Normal : PlayImage::Disabled;
    Render();
    if (display.present) Speak(display.spoken);
}

void GameRoadController::RefreshVersion() {
    BusyCursor busy;
    EmulatorVersionCheck check(program_.options, program_.appFolder, program_.host, *program_.log,
                               launcher_, *program_.yield);
    const EmulatorVersion version = check.Detect(program_.options.MameExec, false);
    currentEmulator_ = version.current || version.text == kNotAvailable;
    program_.mameVersion = version.text;
    state_.version = VersionLabelText(program_.options.MameExec, version.text);
    Render();
}

void GameRoadController::NextResolution() {
    MyClass* game = state_.selectedGameKey.empty()
                        ? nullptr
                        : program_.gameRecords.Item(state_.selectedGameKey);
    state_.resolution = resolutions_.Advance(state_.resolution, game);
    Render();
}

void GameRoadController::ShowNode(NodeId node) {
    TreePane& pane = form_.Pane();
    const QModelIndex index = pane.Model().IndexOf(node);
    if (!index.isValid()) return;
    for (QModelIndex up = index.parent(); up.isValid(); up = up.parent()) pane.View()->expand(up);
    pane.View()->scrollTo(index);
    if (pane.View()->currentIndex() == index) {
        SelectNode(node);  // already selected: the view reports no change, run the handler here
    } else {
        pane.View()->setCurrentIndex(index);  // the view reports it and the handler runs
    }
}

void GameRoadController::SearchTree() {
    const std::string text = form_.Pane().SearchBox()->text().toStdString();
    const SearchOutcome outcome = search_.Search(form_.Tree(), CurrentNode(), text);
    if (outcome.select != NoNode) ShowNode(outcome.select);
    if (!outcome.found) program_.prompt->Inform(outcome.message, PromptIcon::Information);
}

}  // namespace qv
