#pragma once
#include <QAbstractItemModel>
#include <vector>

#include "catalogue/GameTree.h"
#include "ui/IconSet.h"

namespace qv {

// Shows a GameTree to a Qt view. It holds no copy of the nodes: rows, texts, colours and
// pictures are read from the tree when the view asks. After the tree changes wholesale the
// model is reset once (no signal per node), which keeps showing 45,000 games fast.
class GameTreeModel final : public QAbstractItemModel {
    Q_OBJECT
public:
    enum Role {
        KeyRole = Qt::UserRole + 1,  // the node's key, e.g. "alpha_pacman.zip"
        ImageKeyRole,                // the picture shown now: "good", "fclosed", "fopen"...
        TagRole,                     // a game's RomFile
        NodeIdRole,
    };

    GameTreeModel(const GameTree& tree, IconSet& icons, QObject* parent = nullptr);

    // Wrap every change of the tree's nodes in these two calls.
    void BeginTreeChange();
    void EndTreeChange();

    // The view opened or closed a folder; its picture follows ("fopen" while open).
    void SetExpanded(const QModelIndex& index, bool expanded);

    NodeId NodeOf(const QModelIndex& index) const;
    QModelIndex IndexOf(NodeId id) const;

    QModelIndex index(int row, int column, const QModelIndex& parent = {}) const override;
    QModelIndex parent(const QModelIndex& child) const override;
    int rowCount(const QModelIndex& parent = {}) const override;
    int columnCount(const QModelIndex& parent = {}) const override;
    QVariant data(const QModelIndex& index, int role = Qt::DisplayRole) const override;
    Qt::ItemFlags flags(const QModelIndex& index) const override;

private:
    bool Valid(NodeId id) const { return id >= 0 && id < tree_.Count(); }
    std::string ImageKeyOf(NodeId id) const;

    const GameTree& tree_;
    IconSet& icons_;
    std::vector<char> expanded_;  // per node id
};

}  // namespace qv
