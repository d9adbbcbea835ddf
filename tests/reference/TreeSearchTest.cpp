#include "reference/TreeSearch.h"

#include <gtest/gtest.h>

#include <string>

namespace qv {
namespace {

// Insertion order (the search order): alpha_ 0, Maze_ 1, then the games.
class TreeSearchTest : public ::testing::Test {
protected:
    void SetUp() override {
        const NodeId alpha = tree.Add(NoNode, "alpha_", " Alphabetical (3)", "fclosed", "fopen");
        const NodeId maze = tree.Add(NoNode, "Maze_", "Maze (1)", "fclosed", "fopen");
        tree.Add(alpha, "alpha_galwars.zip", "Galaxy Wars");    // 2
        tree.Add(alpha, "alpha_pacman.zip", "Pac-Man");         // 3
        tree.Add(maze, "Maze_pacman.zip", "Pac-Man");           // 4
        tree.Add(alpha, "alpha_frogger.zip", "Frogger");        // 5
    }
    GameTree tree;
    TreeSearch search;
};

TEST_F(TreeSearchTest, CaseInsensitiveMatchSelectsAndStepsThroughMatches) {
    SearchOutcome outcome = search.Search(tree, NoNode, "galaxy");
    EXPECT_TRUE(outcome.found);
    EXPECT_EQ(outcome.select, 2);
    EXPECT_TRUE(outcome.message.empty());
    EXPECT_EQ(search.Position(), 4);  // 1-based index 3, plus one

    outcome = search.Search(tree, 2, "PAC");
    EXPECT_EQ(outcome.select, 3);
    outcome = search.Search(tree, 3, "pac");
    EXPECT_EQ(outcome.select, 4);
    outcome = search.Search(tree, 4, "pac");
    EXPECT_FALSE(outcome.found);
    EXPECT_EQ(outcome.select, 4);  // the earlier selection is restored
    EXPECT_EQ(outcome.message, "Could not find 'pac'");
    EXPECT_EQ(search.Position(), 0);
    EXPECT_EQ(search.Search(tree, 4, "pac").select, 3);  // from the top again
}

TEST_F(TreeSearchTest, SingleMatchFoundThenNotFoundThenFoundAgain) {
    EXPECT_EQ(search.Search(tree, NoNode, "Galaxy").select, 2);
    const SearchOutcome second = search.Search(tree, 2, "Galaxy");
    EXPECT_FALSE(second.found);
    EXPECT_EQ(second.select, 2);
    EXPECT_EQ(second.message, "Could not find 'Galaxy'");
    EXPECT_EQ(search.Search(tree, 2, "Galaxy").select, 2);
}

TEST_F(TreeSearchTest, MatchOnTheLastNodeSendsTheNextSearchToTheTop) {
    EXPECT_EQ(search.Search(tree, NoNode, "Frog").select, 5);
    EXPECT_EQ(search.Position(), 7);  // beyond the six nodes
    EXPECT_EQ(search.Search(tree, 5, "Frog").select, 5);
}

TEST_F(TreeSearchTest, NoWrapAroundWithinOnePass) {
    EXPECT_EQ(search.Search(tree, NoNode, "Frogger").select, 5);  // position now past the end
    // "Galaxy" lies before the position: the pass from the top finds it only because the
    // position beyond the last node sends the search back to the first node.
    EXPECT_EQ(search.Search(tree, 5, "Galaxy").select, 2);
    EXPECT_EQ(search.Search(tree, 2, "Pac").select, 3);
    // From just after the first Pac-Man, "Galaxy" is not found although node 2 matches.
    const SearchOutcome missed = search.Search(tree, 3, "Galaxy");
    EXPECT_FALSE(missed.found);
    EXPECT_EQ(missed.select, 3);
    EXPECT_EQ(search.Search(tree, 3, "Galaxy").select, 2);
}

TEST_F(TreeSearchTest, EmptyTextSelectsEachNodeInTurnAndRootsAreSearched) {
    for (NodeId expected = 0; expected < tree.Count(); ++expected)
        EXPECT_EQ(search.Search(tree, NoNode, "").select, expected);
    // Past the last node: starts at the first again.
    EXPECT_EQ(search.Search(tree, NoNode, "").select, 0);

    TreeSearch fresh;
    EXPECT_EQ(fresh.Search(tree, NoNode, "maze (1)").select, 1);
    // The alphabetical root lies before the stored position: missed once, then found.
    EXPECT_FALSE(fresh.Search(tree, 1, "(3)").found);
    EXPECT_EQ(fresh.Search(tree, 1, "(3)").select, 0);
}

TEST_F(TreeSearchTest, NothingFoundWithNothingSelectedSelectsNothing) {
    const SearchOutcome outcome = search.Search(tree, NoNode, "zzz");
    EXPECT_FALSE(outcome.found);
    EXPECT_EQ(outcome.select, NoNode);
    EXPECT_EQ(outcome.message, "Could not find 'zzz'");

    GameTree empty;
    const SearchOutcome none = search.Search(empty, 3, "");
    EXPECT_FALSE(none.found);
    EXPECT_EQ(none.select, NoNode);  // the noted node is gone with the old tree
}

TEST_F(TreeSearchTest, PositionBeyondShrunkTreeStartsFromTheFirstNode) {
    GameTree big;
    const NodeId root = big.Add(NoNode, "alpha_", " Alphabetical");
    for (int i = 0; i < 100; ++i)
        big.Add(root, "alpha_g" + std::to_string(i) + ".zip", "Game " + std::to_string(i));
    EXPECT_EQ(search.Search(big, NoNode, "Game 90").select, 91);
    EXPECT_EQ(search.Position(), 93);

    // The six-node tree: 93 is past its end, so the search starts at 1 and finds node 0.
    const SearchOutcome outcome = search.Search(tree, NoNode, "alphabetical");
    EXPECT_TRUE(outcome.found);
    EXPECT_EQ(outcome.select, 0);
    EXPECT_EQ(search.Position(), 2);
}

TEST(TreeSearchLargeTest, PositionsBeyondSixteenBitsWork) {
    GameTree tree;
    const NodeId root = tree.Add(NoNode, "MAME.ROMS", "All MAME ROMs", "fclosed", "fopen");
    for (int i = 1; i < 45010; ++i)
        tree.Add(root, "MAME.ROMS_g" + std::to_string(i) + ".zip", i % 2 ? "Odd" : "Even");
    tree.SetText(40000, "Target one");
    tree.SetText(45005, "Target two");

    TreeSearch search;
    EXPECT_EQ(search.Search(tree, NoNode, "target").select, 40000);
    EXPECT_EQ(search.Position(), 40002);
    EXPECT_EQ(search.Search(tree, 40000, "target").select, 45005);
    EXPECT_EQ(search.Position(), 45007);
    const SearchOutcome third = search.Search(tree, 45005, "target");
    EXPECT_FALSE(third.found);
    EXPECT_EQ(third.select, 45005);
    EXPECT_EQ(search.Search(tree, 45005, "target").select, 40000);
}

}  // namespace
}  // namespace qv
