#pragma once
#include <QObject>
#include <QTimer>
#include <functional>
#include <string>

#include "launch/DetailsSelection.h"
#include "launch/DetailsState.h"
#include "launch/GameWatch.h"
#include "launch/PanelSwitches.h"
#include "launch/ResolutionCycle.h"
#include "platform/ProcessLauncher.h"
#include "platform/SpeechEngine.h"
#include "reference/Speaker.h"
#include "reference/TreeSearch.h"

namespace qv {

class DetailsPanel;
class PlayForm;
struct Program;

// A game's road through the main window: selecting a node fills the details panel and speaks
// the title, the switches and rating change the record or the run-time switches, the play image
// or a double click starts the game, the watch timer notices its end, and the search box finds
// nodes. It puts the details panel into the window and connects the window's hooks and menus.
class GameRoadController final : public QObject {
    Q_OBJECT
public:
    GameRoadController(PlayForm& form, Program& program, SpeechEngine& engine,
                       ProcessLauncher& launcher);

    DetailsPanel& Panel() { return *panel_; }
    const DetailsState& State() const { return state_; }
    Speaker& Voice() { return speaker_; }
    GameWatch& Watch() { return watch_; }
    bool SafeMode() const { return safeMode_; }

    // The node selection of the details panel (also run by the search and after a game ended).
    void SelectNode(NodeId node);
    // RunGame for the selected game.
    void RunSelectedGame();
    // One tick of the watch timer.
    void WatchTick();
    // The search box: Enter or the search icon.
    void SearchTree();

    // Runs after the panel showed a game, before the title is spoken: the text view and the
    // pictures follow the selection.
    std::function<void(NodeId, const SelectionResult&)> afterSelection;
    // The title label and, when given, the maker line (in green) show an edited title.
    void ShowEditedTitle(const std::string& title, const std::string* makerLine);

private:
    void Speak(const std::string& text);
    void FinishLoad();
    void ClickSwitch(PanelSwitch which);
    void RefreshExecutable();
    void RefreshVersion();
    void NextResolution();
    void ShowNode(NodeId node);
    void NodeChanged(NodeId node);
    NodeId CurrentNode() const;
    void Render();

    PlayForm& form_;
    Program& program_;
    ProcessLauncher& launcher_;
    DetailsPanel* panel_;
    DetailsState state_;
    PanelSwitches switches_;
    Speaker speaker_;
    GameWatch watch_;
    ResolutionCycle resolutions_;
    TreeSearch search_;
    QTimer watchTimer_;
    NodeId selectedNode_ = NoNode;
    bool safeMode_ = false;
    bool currentEmulator_ = true;
    bool quiet_ = false;  // load steps that run before speech is ready
};

}  // namespace qv
