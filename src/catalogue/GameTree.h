#pragma once
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace qv {

struct Rgb {
    std::uint8_t r = 0, g = 0, b = 0;
    bool operator==(const Rgb&) const = default;
};

namespace colours {
inline constexpr Rgb Red{255, 0, 0};
inline constexpr Rgb Green{0, 255, 0};
inline constexpr Rgb Black{0, 0, 0};
inline constexpr Rgb LightBlue{128, 128, 255};
inline constexpr Rgb Grey{128, 128, 128};
inline constexpr Rgb Blue{0, 0, 255};
}  // namespace colours

// Node ids are 0-based positions in insertion order (the order a search walks); they stay valid
// until a node is removed, which renumbers the nodes after it.
using NodeId = std::int32_t;
inline constexpr NodeId NoNode = -1;

struct TreeNode {
    std::string Key;
    std::string Text;
    std::string Image;          // "fclosed", "good", "bad" or "" (no picture)
    std::string ExpandedImage;  // "fopen" for folders
    Rgb Colour = colours::Black;
    std::string Tag;            // a game's RomFile
    NodeId Parent = NoNode;
};

// The game tree as plain data: unique case-insensitive keys, children kept sorted by text (the
// view asks for them sorted; sorting is deferred until then so that building stays linear).
class GameTree {
public:
    void Clear();
    // Room for this many nodes in all, so that a large fill does not regrow the tables.
    void Reserve(std::size_t nodes);

    // Adds a node under parent (NoNode: top level). Returns NoNode when the key is taken.
    NodeId Add(NodeId parent, std::string key, std::string text, std::string image = {},
               std::string expandedImage = {});
    // Removes the node and everything below it.
    void Remove(NodeId node);

    NodeId Find(std::string_view key) const;
    // A node with that key exists and has a non-empty text.
    bool NodeExists(std::string_view key) const;

    std::int32_t Count() const { return static_cast<std::int32_t>(nodes_.size()); }
    const TreeNode& Node(NodeId id) const { return nodes_[static_cast<std::size_t>(id)]; }

    void SetText(NodeId id, std::string text);
    void SetImage(NodeId id, std::string image);
    void SetColour(NodeId id, Rgb colour) { nodes_[static_cast<std::size_t>(id)].Colour = colour; }
    void SetTag(NodeId id, std::string tag) { nodes_[static_cast<std::size_t>(id)].Tag = std::move(tag); }

    // Children of a node (NoNode: the top level), sorted by text, case-insensitively; nodes of
    // equal text keep their insertion order.
    const std::vector<NodeId>& Children(NodeId parent) const;
    std::int32_t ChildCount(NodeId parent) const;
    // Position of a node among its parent's sorted children.
    std::int32_t RowOf(NodeId id) const;

    // Folders are the nodes that carry an expanded image.
    bool IsFolder(NodeId id) const { return !Node(id).ExpandedImage.empty(); }

    static bool TextLess(std::string_view a, std::string_view b);

private:
    struct ChildList {
        std::vector<NodeId> ids;
        bool sorted = true;
    };
    ChildList& ListOf(NodeId parent);
    const ChildList& ListOf(NodeId parent) const;
    void SortIfNeeded(const ChildList& list) const;
    void MarkUnsorted(NodeId parent);

    std::vector<TreeNode> nodes_;
    std::vector<ChildList> children_;  // per node
    ChildList topLevel_;
    mutable std::vector<std::int32_t> rows_;  // per node, valid once its parent's list is sorted
    // Key lookup: open addressing over node ids, keyed by the case-folded hash, comparing the
    // nodes' own keys. No folded copies and no per-key allocation, which matters with 45,000+
    // nodes added at a time.
    struct KeySlot {
        std::uint32_t hash = 0;
        NodeId id = NoNode;
    };
    static std::uint32_t KeyHash(std::string_view key);
    static bool SameKey(std::string_view a, std::string_view b);
    NodeId FindSlot(std::string_view key, std::uint32_t hash, std::size_t& slot) const;
    void IndexKey(NodeId id, std::uint32_t hash);
    void RebuildKeyIndex(std::size_t capacityFor);
    std::vector<KeySlot> keySlots_;  // size is zero or a power of two, at most half full
    std::size_t keyCount_ = 0;
};

}  // namespace qv
