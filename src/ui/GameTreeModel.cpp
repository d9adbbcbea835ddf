#include "ui/GameTreeModel.h"

#include <QBrush>
#include <QColor>

#include "app/TextFile.h"

namespace qv {

GameTreeModel::GameTreeModel(const GameTree& tree, IconSet& icons, QObject* parent)
    : QAbstractItemModel(parent), tree_(tree), icons_(icons) {}

void GameTreeModel::BeginTreeChange() {
    beginResetModel();
    // A reset closes every folder in the view; the view reports the ones it opens again.
    expanded_.clear();
}

void GameTreeModel::EndTreeChange() {
    expanded_.assign(static_cast<std::size_t>(tree_.Count()), 0);
    endResetModel();
}

void GameTreeModel::SetExpanded(const QModelIndex& index, bool expanded) {
    const NodeId id = NodeOf(index);
    if (!Valid(id)) return;
    if (expanded_.size() < static_cast<std::size_t>(tree_.Count()))
        expanded_.resize(static_cast<std::size_t>(tree_.Count()), 0);
    expanded_[static_cast<std::size_t>(id)] = expanded ? 1 : 0;
    emit dataChanged(index, index, {Qt::DecorationRole, ImageKeyRole});
}

NodeId GameTreeModel::NodeOf(const QModelIndex& index) const {
    if (!index.isValid() || index.model() != this) return NoNode;
    const auto id = static_cast<NodeId>(index.internalId());
    return Valid(id) ? id : NoNode;
}

QModelIndex GameTreeModel::IndexOf(NodeId id) const {
    if (!Valid(id)) return {};
    return createIndex(tree_.RowOf(id), 0, static_cast<quintptr>(id));
}

QModelIndex GameTreeModel::index(int row, int column, const QModelIndex& parent) const {
    if (column != 0 || row < 0) return {};
    NodeId parentId = NoNode;
    if (parent.isValid()) {
        parentId = NodeOf(parent);
        if (parentId == NoNode) return {};
    }
    const auto& children = tree_.Children(parentId);
    if (row >= static_cast<int>(children.size())) return {};
    return createIndex(row, 0, static_cast<quintptr>(children[static_cast<std::size_t>(row)]));
}

QModelIndex GameTreeModel::parent(const QModelIndex& child) const {
    const NodeId id = NodeOf(child);
    if (id == NoNode) return {};
    return IndexOf(tree_.Node(id).Parent);
}

int GameTreeModel::rowCount(const QModelIndex& parent) const {
    if (!parent.isValid()) return tree_.ChildCount(NoNode);
    if (parent.column() != 0) return 0;
    const NodeId id = NodeOf(parent);
    return id == NoNode ? 0 : tree_.ChildCount(id);
}

int GameTreeModel::columnCount(const QModelIndex&) const { return 1; }

std::string GameTreeModel::ImageKeyOf(NodeId id) const {
    const TreeNode& node = tree_.Node(id);
    const bool open = static_cast<std::size_t>(id) < expanded_.size() &&
                      expanded_[static_cast<std::size_t>(id)] && !node.ExpandedImage.empty();
    return open ? node.ExpandedImage : node.Image;
}

QVariant GameTreeModel::data(const QModelIndex& index, int role) const {
    const NodeId id = NodeOf(index);
    if (id == NoNode) return {};
    const TreeNode& node = tree_.Node(id);
    switch (role) {
        case Qt::DisplayRole:
        case Qt::EditRole:
        case Qt::ToolTipRole:
            return QString::fromStdString(DisplayUtf8(node.Text));
        case Qt::ForegroundRole:
            return QBrush(QColor(node.Colour.r, node.Colour.g, node.Colour.b));
        case Qt::DecorationRole: {
            const QIcon& icon = icons_.Icon(ImageKeyOf(id));
            return icon.isNull() ? QVariant() : QVariant(icon);
        }
        case KeyRole:
            return QString::fromStdString(DisplayUtf8(node.Key));
        case ImageKeyRole:
            return QString::fromStdString(ImageKeyOf(id));
        case TagRole:
            return QString::fromStdString(DisplayUtf8(node.Tag));
        case NodeIdRole:
            return id;
        default:
            return {};
    }
}

Qt::ItemFlags GameTreeModel::flags(const QModelIndex& index) const {
    if (NodeOf(index) == NoNode) return Qt::NoItemFlags;
    return Qt::ItemIsEnabled | Qt::ItemIsSelectable;
}

}  // namespace qv
