#include "catalogue/GameTree.h"

#include <algorithm>

namespace qv {

namespace {
inline unsigned char Fold(char c) {
    return static_cast<unsigned char>(c >= 'A' && c <= 'Z' ? c - 'A' + 'a' : c);
}
}  // namespace

std::uint32_t GameTree::KeyHash(std::string_view key) {
    std::uint64_t h = 14695981039346656037ull;  // FNV-1a over the folded bytes
    for (const char c : key) {
        h ^= Fold(c);
        h *= 1099511628211ull;
    }
    h ^= h >> 33;  // spread the bits so that neighbouring slots stay independent
    h *= 0xff51afd7ed558ccdull;
    h ^= h >> 33;
    return static_cast<std::uint32_t>(h);
}

bool GameTree::SameKey(std::string_view a, std::string_view b) {
    if (a.size() != b.size()) return false;
    for (std::size_t i = 0; i < a.size(); ++i)
        if (Fold(a[i]) != Fold(b[i])) return false;
    return true;
}

NodeId GameTree::FindSlot(std::string_view key, std::uint32_t hash, std::size_t& slot) const {
    if (keySlots_.empty()) return NoNode;
    const std::size_t mask = keySlots_.size() - 1;
    for (slot = hash & mask;; slot = (slot + 1) & mask) {
        const KeySlot& entry = keySlots_[slot];
        if (entry.id == NoNode) return NoNode;
        if (entry.hash == hash && SameKey(nodes_[static_cast<std::size_t>(entry.id)].Key, key))
            return entry.id;
    }
}

void GameTree::IndexKey(NodeId id, std::uint32_t hash) {
    if ((keyCount_ + 1) * 2 > keySlots_.size()) RebuildKeyIndex(keyCount_ + 1);
    const std::size_t mask = keySlots_.size() - 1;
    std::size_t slot = hash & mask;
    while (keySlots_[slot].id != NoNode) slot = (slot + 1) & mask;
    keySlots_[slot] = KeySlot{hash, id};
    ++keyCount_;
}

void GameTree::RebuildKeyIndex(std::size_t capacityFor) {
    std::size_t size = 16;
    while (size < capacityFor * 2) size *= 2;
    std::vector<KeySlot> old = std::move(keySlots_);
    keySlots_.assign(size, KeySlot{});
    keyCount_ = 0;
    const std::size_t mask = size - 1;
    auto place = [&](const KeySlot& entry) {
        std::size_t slot = entry.hash & mask;
        while (keySlots_[slot].id != NoNode) slot = (slot + 1) & mask;
        keySlots_[slot] = entry;
        ++keyCount_;
    };
    for (const KeySlot& entry : old)
        if (entry.id != NoNode) place(entry);
}

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
    keySlots_.clear();
    keyCount_ = 0;
}

void GameTree::Reserve(std::size_t nodes) {
    nodes_.reserve(nodes);
    children_.reserve(nodes);
    rows_.reserve(nodes);
    if (nodes * 2 > keySlots_.size()) RebuildKeyIndex(nodes);
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
    const std::uint32_t hash = KeyHash(key);
    std::size_t slot = 0;
    if (FindSlot(key, hash, slot) != NoNode) return NoNode;
    nodes_.push_back(TreeNode{std::move(key), std::move(text), std::move(image),
                              std::move(expandedImage), colours::Black, {}, parent});
    children_.emplace_back();
    rows_.push_back(0);
    IndexKey(id, hash);
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
    keySlots_.clear();
    keyCount_ = 0;
    RebuildKeyIndex(nodes_.size());
    for (std::size_t i = 0; i < nodes_.size(); ++i)
        IndexKey(static_cast<NodeId>(i), KeyHash(nodes_[i].Key));
}

NodeId GameTree::Find(std::string_view key) const {
    std::size_t slot = 0;
    return FindSlot(key, KeyHash(key), slot);
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
