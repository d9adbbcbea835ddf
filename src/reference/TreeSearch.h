#pragma once
#include <cstdint>
#include <string>
#include <string_view>

#include "catalogue/GameTree.h"

namespace qv {

// What the window does after a search: make `select` visible, select it and run the game
// selection handler for it (nothing when it is NoNode); when `found` is false, also show
// `message` in an information box.
struct SearchOutcome {
    NodeId select = NoNode;
    bool found = false;
    std::string message;  // "Could not find '<text>'" when nothing was found
};

// The search box: finds the next node, in insertion order, whose text contains the search
// text (ignoring ASCII letter case). Repeated searches step through the matches from top to
// bottom; a pass that reaches the end without a match starts the next one from the top.
class TreeSearch {
public:
    SearchOutcome Search(const GameTree& tree, NodeId selected, std::string_view text);

    // 1-based position where the next search starts; 0 when it starts from the first node.
    // Trees exceed 32767 nodes, so it is 32 bits wide.
    std::int32_t Position() const { return position_; }

private:
    std::int32_t position_ = 0;
};

}  // namespace qv
