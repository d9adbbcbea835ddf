#pragma once
#include <QMainWindow>
#include <functional>
#include <string>

#include "catalogue/GameRecords.h"
#include "catalogue/GameTree.h"
#include "ui/IconSet.h"
#include "ui/MainMenus.h"
#include "ui/Program.h"

class QVBoxLayout;

namespace qv {

class HelpWindow;
class TitleArea;
class TreePane;
class WaitWindow;

// Where later parts of the program plug into the main window. Every hook may stay empty.
struct PlayFormHooks {
    std::function<void(const std::string&)> speak;  // Speak(text)
    std::function<void()> checkVoice;               // CheckVoice, run during the load
    std::function<void(NodeId)> nodeSelected;       // the details panel follows the selection
    std::function<void(NodeId)> runGame;            // double click on a game node
};

// The main window: title strip, game tree with its count label, and the details side.
class PlayForm final : public QMainWindow {
    Q_OBJECT
public:
    // wait may be null (no wait window); it is shown by start-up and closed by Load().
    PlayForm(Program& program, WaitWindow* wait, QWidget* parent = nullptr);
    ~PlayForm() override;

    PlayFormHooks& Hooks() { return hooks_; }

    // The window load: records, check marks, editing rules, tree, count label; then shows the
    // window maximised and closes the wait window.
    void Load();

    // The four menus shown or hidden together.
    void ShowMenuBar(bool visible);
    bool MenuBarShown() const { return menuBarShown_; }

    // Window commands (also reachable through the menus).
    void SaveRomInformation();
    void SetShowHidden(bool show);
    void SetShowWorking(bool show);
    void AddAllEmulatedGames();
    // BuildGameTree shown in the view (load, Refresh and the view filters call it).
    void RebuildTree();
    void Refresh();
    void FullScreen();
    void MinimizeWindow();
    // The help window ("QUORVANE": the program's help, "MAME": the emulator tips) replaces the
    // main window until it is closed; the about box does so while it is open.
    void ShowHelp(const std::string& topic);
    void ShowAbout();
    const std::string& HelpTopic() const { return helpTopic_; }
    HelpWindow* Help() const { return help_; }

    // RomCount + " ROMS (" + SizeText(RomBytes) + ")".
    std::string CountCaption() const;
    const RecordCounts& Counts() const { return counts_; }
    bool SpeechReady() const { return speechReady_; }

    const MainMenus& Menus() const { return menus_; }
    GameTree& Tree() { return tree_; }
    TreePane& Pane() { return *pane_; }
    TitleArea& Title() { return *title_; }
    // The right-hand side: the details panel and the text area are added to this layout.
    QVBoxLayout* DetailsLayout() const { return detailsLayout_; }

signals:
    // The user confirmed the quit question and the records were saved (or not needed): the
    // program ends now.
    void quitConfirmed();

protected:
    void closeEvent(QCloseEvent* event) override;

private:
    void BuildLayout();
    void ConnectCommands();
    void ShowCount();
    void ShowWait(const std::string& status);
    void CloseWait();
    StatusDisplay& Status();
    void Speak(const std::string& text);
    bool ConfirmQuit();

    Program& program_;
    WaitWindow* wait_;
    NoStatusDisplay noStatus_;
    GameTree tree_;
    IconSet icons_;
    MainMenus menus_;
    TitleArea* title_ = nullptr;
    TreePane* pane_ = nullptr;
    QVBoxLayout* detailsLayout_ = nullptr;
    PlayFormHooks hooks_;
    HelpWindow* help_ = nullptr;  // created on first use
    std::string helpTopic_;
    RecordCounts counts_;
    bool menuBarShown_ = true;
    bool speechReady_ = false;
    bool quitting_ = false;
};

}  // namespace qv
