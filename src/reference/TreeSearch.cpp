#include "reference/TreeSearch.h"

#include <algorithm>

#include "app/TextFile.h"

namespace qv {

namespace {

inline char Upper(char c) { return c >= 'a' && c <= 'z' ? static_cast<char>(c - 'a' + 'A') : c; }

// Case-insensitive containment without an upper-cased copy of every node text; `upperNeedle`
// is already upper case.
bool ContainsUpper(std::string_view haystack, std::string_view upperNeedle) {
    if (upperNeedle.empty()) return true;
    if (upperNeedle.size() > haystack.size()) return false;
    const auto found = std::search(haystack.begin(), haystack.end(), upperNeedle.begin(),
                                   upperNeedle.end(),
                                   [](char a, char b) { return Upper(a) == b; });
    return found != haystack.end();
}

}  // namespace

SearchOutcome TreeSearch::Search(const GameTree& tree, NodeId selected, std::string_view text) {
    const std::int32_t count = tree.Count();
    std::int32_t start = position_ != 0 ? position_ : 1;
    if (start > count) start = 1;

    const std::string needle = UpperAscii(text);
    SearchOutcome outcome;
    for (std::int32_t index = start; index <= count; ++index) {
        if (ContainsUpper(tree.Node(index - 1).Text, needle)) {
            outcome.select = index - 1;
            outcome.found = true;
            position_ = index + 1;
            break;
        }
    }
    // After a match the position lies beyond the start and stays; a failed pass clears it.
    if (position_ != 0 && position_ <= start) position_ = 0;

    if (!outcome.found) {
        // Back to what was selected before, if that node still exists.
        outcome.select = selected >= 0 && selected < count ? selected : NoNode;
        outcome.message = "Could not find '" + std::string(text) + "'";
    }
    return outcome;
}

}  // namespace qv
