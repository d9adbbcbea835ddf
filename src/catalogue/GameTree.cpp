#include "catalogue/GameTree.h"

#include <algorithm>

#include "catalogue/MyClass.h"

namespace qv {

namespace {
inline unsigned char Fold(char c) {
    return static_cast<unsigned char>(c >= 'A' && c <= 'Z' ? c - 'A' + 'a' : c);
}
}  // namespace

bool GameTree::TextLess(std::string_view a, std::string_view b) {
    const std::size_t n = std::min(a.size(), b.size());
    for (std::size_t i = 0; i < n; ++i) {
        const unsigned char x = Fold(a[i]), y = Fold(b[i]);
        if (x != y) return x < y;
    }
    return a.size() < b.size();
}

void GameTree::Clear() {
    nodes_.clear();
    children_.clear();
    topLevel_ = {};
    rows_.clear();
    byKey_.clear();
}

GameTree::ChildList& GameTree::ListOf(NodeId parent) {
    return parent == NoNode ? topLevel_ : children_[static_cast<std::size_t>(parent)];
}

const GameTree::ChildList& GameTree::ListOf(NodeId parent) const {
    return parent == NoNode ? topLevel_ : children_[static_cast<std::size_t>(parent)];
}

void GameTree::MarkUnsorted(NodeId parent) { ListOf(parent).sorted = false; }

NodeId GameTree::Add(NodeId parent, std::string key, std::string text, std::string image,
                     std::string expandedImage) {
    if (parent != NoNode && (parent < 0 || parent >= Count())) return NoNode;
    const auto id = static_cast<NodeId>(nodes_.size());
    if (!byKey_.try_emplace(MyClass::FoldKey(key), id).second) return NoNode;
    nodes_.push_back(TreeNode{std::move(key), std::move(text), std::move(image),
                              std::move(expandedImage), colours::Black, {}, parent});
    children_.emplace_back();
    rows_.push_back(0);
    ChildList& siblings = ListOf(parent);
    siblings.ids.push_back(id);
    siblings.sorted = false;
    return id;
}

void GameTree::Remove(NodeId node) {
    if (node < 0 || node >= Count()) return;
    // Mark the node and its descendants; descendants always come after their parent.
    std::vector<bool> gone(nodes_.size(), false);
    gone[static_cast<std::size_t>(node)] = true;
    for (std::size_t i = static_cast<std::size_t>(node) + 1; i < nodes_.size(); ++i) {
        const NodeId p = nodes_[i].Parent;
        if (p != NoNode && gone[static_cast<std::size_t>(p)]) gone[i] = true;
    }
    std::vector<NodeId> renumber(nodes_.size(), NoNode);
    std::vector<TreeNode> kept;
    kept.reserve(nodes_.size());
    for (std::size_t i = 0; i < nodes_.size(); ++i) {
        if (gone[i]) continue;
        renumber[i] = static_cast<NodeId>(kept.size());
        kept.push_back(std::move(nodes_[i]));
    }
    auto remap = [&](NodeId id) { return id == NoNode ? NoNode : renumber[static_cast<std::size_t>(id)]; };
    std::vector<ChildList> keptChildren(kept.size());
    ChildList keptTop;
    for (const NodeId id : topLevel_.ids)
        if (remap(id) != NoNode) keptTop.ids.push_back(remap(id));
    keptTop.sorted = topLevel_.sorted;
    for (std::size_t i = 0; i < children_.size(); ++i) {
        if (gone[i]) continue;
        ChildList& list = keptChildren[static_cast<std::size_t>(renumber[i])];
        for (const NodeId id : children_[i].ids)
            if (remap(id) != NoNode) list.ids.push_back(remap(id));
        list.sorted = children_[i].sorted;
    }
    for (TreeNode& n : kept) n.Parent = remap(n.Parent);
    nodes_ = std::move(kept);
    children_ = std::move(keptChildren);
    topLevel_ = std::move(keptTop);
    topLevel_.sorted = false;
    for (auto& list : children_) list.sorted = false;
    rows_.assign(nodes_.size(), 0);
    byKey_.clear();
    for (std::size_t i = 0; i < nodes_.size(); ++i)
        byKey_.emplace(MyClass::FoldKey(nodes_[i].Key), static_cast<NodeId>(i));
}

NodeId GameTree::Find(std::string_view key) const {
    const auto found = byKey_.find(MyClass::FoldKey(key));
    return found == byKey_.end() ? NoNode : found->second;
}

bool GameTree::NodeExists(std::string_view key) const {
    const NodeId id = Find(key);
    return id != NoNode && !Node(id).Text.empty();
}

void GameTree::SetText(NodeId id, std::string text) {
    TreeNode& node = nodes_[static_cast<std::size_t>(id)];
    node.Text = std::move(text);
    MarkUnsorted(node.Parent);
}

void GameTree::SetImage(NodeId id, std::string image) {
    nodes_[static_cast<std::size_t>(id)].Image = std::move(image);
}

void GameTree::SortIfNeeded(const ChildList& list) const {
    if (list.sorted) return;
    auto& ids = const_cast<std::vector<NodeId>&>(list.ids);
    std::stable_sort(ids.begin(), ids.end(), [this](NodeId a, NodeId b) {
        return TextLess(nodes_[static_cast<std::size_t>(a)].Text,
                        nodes_[static_cast<std::size_t>(b)].Text);
    });
    for (std::size_t row = 0; row < ids.size(); ++row)
        rows_[static_cast<std::size_t>(ids[row])] = static_cast<std::int32_t>(row);
    const_cast<ChildList&>(list).sorted = true;
}

const std::vector<NodeId>& GameTree::Children(NodeId parent) const {
    const ChildList& list = ListOf(parent);
    SortIfNeeded(list);
    return list.ids;
}

std::int32_t GameTree::ChildCount(NodeId parent) const {
    return static_cast<std::int32_t>(ListOf(parent).ids.size());
}

std::int32_t GameTree::RowOf(NodeId id) const {
    SortIfNeeded(ListOf(Node(id).Parent));
    return rows_[static_cast<std::size_t>(id)];
}

}  // namespace qv
