#pragma once
#include <QWidget>
#include <functional>
#include <string>

#include "catalogue/GameTree.h"
#include "ui/GameTreeModel.h"

class QLineEdit;
class QListWidget;
class QToolButton;
class QTreeView;

namespace qv {

class ClickLabel;

// The left side of the main window: the search box, the game tree (or, swapped in its place,
// the ROM folder's file list) and the count label under them.
class TreePane final : public QWidget {
    Q_OBJECT
public:
    TreePane(GameTree& tree, IconSet& icons, QWidget* parent = nullptr);

    GameTree& Tree() { return tree_; }
    GameTreeModel& Model() { return *model_; }
    QTreeView* View() const { return view_; }
    QListWidget* FileList() const { return files_; }
    QLineEdit* SearchBox() const { return search_; }
    QToolButton* SearchButton() const { return searchButton_; }
    ClickLabel* CountLabel() const { return count_; }

    // Runs a change of the tree's nodes with the view frozen and input blocked, then shows the
    // result with one model reset. keepOpenFolders: folders that were open stay open (for
    // changes that only add nodes).
    void ChangeTree(const std::function<void()>& change, bool keepOpenFolders);

    // Lists the files of the ROM folder (names only, sorted as the file system sorts them).
    void FillFileList(const std::string& folder);

    // Shows the file list in place of the tree, or the tree in place of the list.
    void SwapTreeAndFileList();
    bool TreeShown() const;

signals:
    void nodeSelected(qv::NodeId node);
    // A double click on a game node; double clicks on folders only open or close them.
    void gameActivated(qv::NodeId node);

private:
    GameTree& tree_;
    GameTreeModel* model_;
    QLineEdit* search_;
    QToolButton* searchButton_;
    QTreeView* view_;
    QListWidget* files_;
    ClickLabel* count_;
};

}  // namespace qv
