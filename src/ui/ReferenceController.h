#pragma once
#include <QObject>
#include <functional>
#include <string>

#include "catalogue/GameTree.h"
#include "reference/CatalogueEditing.h"
#include "platform/qt/QtPictureReader.h"
#include "reference/DetailsText.h"
#include "reference/GameNotes.h"
#include "reference/PictureLayout.h"
#include "reference/ReferenceViews.h"
#include "ui/ReferenceView.h"

namespace qv {

class GameRoadController;
class PlayForm;
class TreeLabelEditor;
struct Program;

// What the reference side needs from the rest of the main window.
struct ReferenceHooks {
    std::function<std::string()> selectedGameKey;  // SelectedGameKey of the details panel
    std::function<void(const std::string&)> speak;
    // The title label (and, when given, the maker line in green) show an edited title.
    std::function<void(const std::string& title, const std::string* makerLine)> showTitle;
};

// Notes, history, information, log and pictures in the details panel, and the Edit menu's
// catalogue commands. Holds the per-window state (the text area, NotesOwnerKey, the image
// panel, the drag anchor); the work is done by the core.
class ReferenceController final : public QObject {
    Q_OBJECT
public:
    ReferenceController(PlayForm& form, Program& program, ReferenceHooks hooks);

    // Marks the history and information tabs "Not found" when their files are missing. Runs
    // during the window's load, once the settings are read.
    void MarkMissingDatabases();

    ReferenceView& View() { return *view_; }
    const DetailsText& Area() const { return area_; }
    const ImagePanel& Pictures() const { return pictures_; }
    GameNotes& Notes() { return notes_; }

    // The details panel showed a game: repeat the chosen text view and refresh the pictures.
    // withLog: a "Log" view follows too (owned games only).
    void GameShown(NodeId node, bool refreshText, bool withLog, bool refreshPictures);

    // The view tabs and the commands of the Edit menu.
    void ClickTab(ViewTab tab);
    void ViewLog();
    void Rename();
    void Delete();
    void InsertMameInformation();
    void UpdateAll();

private:
    std::string SelectedKey() const;
    NodeId CurrentNode() const;
    std::string NodeTag(NodeId node) const;
    void ShowLog(const std::string& key);
    void ShowPictures(const std::string& key);
    void RenderText();
    void RenderPictures();
    void LabelEdited(NodeId node, const std::string& oldText, const std::string& newText);
    void NodeTextChanged(NodeId node);
    CatalogueEdit Edit();

    PlayForm& form_;
    Program& program_;
    ReferenceHooks hooks_;
    ReferenceView* view_;
    TreeLabelEditor* labelEditor_;
    DetailsText area_;
    GameNotes notes_;
    ReferenceViews views_;
    ImagePanel pictures_;
    DragAnchor anchor_;
    QtPictureReader reader_;
};

// Puts the reference side into the main window next to the details panel and follows the
// panel's selection. Owned by the window.
ReferenceController* AttachReference(PlayForm& form, Program& program, GameRoadController& road);

}  // namespace qv
