#include "reference/TreeSearch.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace qv {
namespace {

// One search from the selected node and what it must select.
struct Step {
    NodeId from;
    std::string text;
    NodeId select;
    bool found;
};

void Walk(TreeSearch& search, const GameTree& tree, const std::vector<Step>& steps) {
    for (const Step& step : steps) {
        SCOPED_TRACE("from " + std::to_string(step.from) + " for '" + step.text + "'");
        const SearchOutcome outcome = search.Search(tree, step.from, step.text);
        EXPECT_EQ(outcome.select, step.select);
        EXPECT_EQ(outcome.found, step.found);
        EXPECT_EQ(outcome.message, step.found ? "" : "Could not find '" + step.text + "'");
    }
}

// Insertion order (the search order): alpha_ 0, Maze_ 1, then the games 2..5.
GameTree SixNodes() {
    GameTree tree;
    const NodeId alpha = tree.Add(NoNode, "alpha_", " Alphabetical (3)", "fclosed", "fopen");
    const NodeId maze = tree.Add(NoNode, "Maze_", "Maze (1)", "fclosed", "fopen");
    tree.Add(alpha, "alpha_galwars.zip", "Galaxy Wars");
    tree.Add(alpha, "alpha_pacman.zip", "Pac-Man");
    tree.Add(maze, "Maze_pacman.zip", "Pac-Man");
    tree.Add(alpha, "alpha_frogger.zip", "Frogger");
    return tree;
}

TEST(TreeSearchTest, SearchesStepThroughMatchesWithoutWrappingWithinAPass) {
    const GameTree tree = SixNodes();
    const std::vector<std::vector<Step>> scenarios = {
        // Case-insensitive; after the last match: not found, the selection stays, then the top.
        {{NoNode, "galaxy", 2, true}, {2, "PAC", 3, true}, {3, "pac", 4, true},
         {4, "pac", 4, false}, {4, "pac", 3, true}},
        {{NoNode, "Galaxy", 2, true}, {2, "Galaxy", 2, false}, {2, "Galaxy", 2, true}},
        // A match on the last node sends the next search to the top.
        {{NoNode, "Frog", 5, true}, {5, "Frog", 5, true}, {5, "Galaxy", 2, true},
         // From just after the first Pac-Man "Galaxy" is missed although node 2 matches.
         {2, "Pac", 3, true}, {3, "Galaxy", 3, false}, {3, "Galaxy", 2, true}},
        // Folder texts are searched too.
        {{NoNode, "maze (1)", 1, true}, {1, "(3)", 1, false}, {1, "(3)", 0, true}},
        {{NoNode, "zzz", NoNode, false}},
        // An empty text selects every node in turn, then starts again.
        {{NoNode, "", 0, true}, {NoNode, "", 1, true}, {NoNode, "", 2, true},
         {NoNode, "", 3, true}, {NoNode, "", 4, true}, {NoNode, "", 5, true},
         {NoNode, "", 0, true}},
    };
    for (const auto& steps : scenarios) {
        TreeSearch search;
        Walk(search, tree, steps);
    }
    TreeSearch search;
    Walk(search, tree, {{NoNode, "galaxy", 2, true}});
    EXPECT_EQ(search.Position(), 4);  // 1-based index 3, plus one
    Walk(search, GameTree(), {{3, "", NoNode, false}});  // the noted node went with its tree
}

TEST(TreeSearchTest, PositionBeyondShrunkTreeStartsFromTheFirstNode) {
    GameTree big;
    const NodeId root = big.Add(NoNode, "alpha_", " Alphabetical");
    for (int i = 0; i < 100; ++i)
        big.Add(root, "alpha_g" + std::to_string(i) + ".zip", "Game " + std::to_string(i));
    TreeSearch search;
    Walk(search, big, {{NoNode, "Game 90", 91, true}});
    EXPECT_EQ(search.Position(), 93);
    Walk(search, SixNodes(), {{NoNode, "alphabetical", 0, true}});
}

TEST(TreeSearchTest, PositionsBeyondSixteenBitsWork) {
    GameTree tree;
    const NodeId root = tree.Add(NoNode, "MAME.ROMS", "All MAME ROMs", "fclosed", "fopen");
    for (int i = 1; i < 45010; ++i)
        tree.Add(root, "MAME.ROMS_g" + std::to_string(i) + ".zip", i % 2 ? "Odd" : "Even");
    tree.SetText(40000, "Target one");
    tree.SetText(45005, "Target two");
    TreeSearch search;
    Walk(search, tree, {{NoNode, "target", 40000, true}, {40000, "target", 45005, true},
                        {45005, "target", 45005, false}, {45005, "target", 40000, true}});
}

}  // namespace
}  // namespace qv
