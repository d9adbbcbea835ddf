#include "catalogue/GameTree.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace qv {
namespace {

std::vector<std::string> ChildTexts(const GameTree& tree, NodeId parent) {
    std::vector<std::string> texts;
    for (const NodeId id : tree.Children(parent)) texts.push_back(tree.Node(id).Text);
    return texts;
}

TEST(GameTreeTest, KeysIgnoreCaseAndDuplicatesAreRefused) {
    GameTree tree;
    const NodeId root = tree.Add(NoNode, "Maze_", "Maze", "fclosed", "fopen");
    ASSERT_EQ(root, 0);
    EXPECT_EQ(tree.Add(root, "Maze_pacman.zip", "Pac-Man"), 1);
    EXPECT_EQ(tree.Add(NoNode, "MAZE_", "Other"), NoNode);
    EXPECT_EQ(tree.Add(root, "maze_PACMAN.ZIP", "Other"), NoNode);
    EXPECT_EQ(tree.Count(), 2);
    EXPECT_EQ(tree.Find("mAzE_PacMan.Zip"), 1);
    EXPECT_EQ(tree.Node(1).Parent, root);
    // A parent that does not exist is refused and takes no key.
    EXPECT_EQ(tree.Add(7, "x", "X"), NoNode);
    EXPECT_NE(tree.Add(NoNode, "x", "X"), NoNode);
    // A node only "exists" for the window with a non-empty text.
    tree.Add(NoNode, "blank_", "");
    EXPECT_TRUE(tree.NodeExists("maze_"));
    EXPECT_FALSE(tree.NodeExists("blank_"));
    EXPECT_FALSE(tree.NodeExists("missing"));
}

TEST(GameTreeTest, ChildrenSortedByTextIgnoringCaseAndStableForTies) {
    GameTree tree;
    const NodeId root = tree.Add(NoNode, "r", "Root");
    tree.Add(root, "a", "galaga");
    tree.Add(root, "b", "Donkey Kong");
    tree.Add(root, "c", "Frogger");
    tree.Add(root, "d", "frogger");
    tree.Add(root, "e", "Donkey");
    EXPECT_EQ(ChildTexts(tree, root),
              (std::vector<std::string>{"Donkey", "Donkey Kong", "Frogger", "frogger", "galaga"}));
    EXPECT_EQ(tree.RowOf(tree.Find("d")), 3);
    // A new text or a new node resorts; insertion order (the ids) does not change.
    tree.SetText(tree.Find("a"), "Asteroids");
    EXPECT_EQ(tree.RowOf(tree.Find("a")), 0);
    EXPECT_EQ(tree.Find("a"), 1);
    tree.Add(root, "f", "Centipede");
    EXPECT_EQ(tree.RowOf(tree.Find("f")), 1);
    EXPECT_EQ(tree.RowOf(tree.Find("b")), 3);
    // The leading space of " Alphabetical" puts it first at the top level.
    tree.Add(NoNode, "Ace_", "Ace");
    tree.Add(NoNode, "alpha_", " Alphabetical");
    EXPECT_EQ(ChildTexts(tree, NoNode), (std::vector<std::string>{" Alphabetical", "Ace", "Root"}));
}

TEST(GameTreeTest, RemoveTakesDescendantsAndRenumbersTheRest) {
    GameTree tree;
    const NodeId alpha = tree.Add(NoNode, "alpha_", " Alphabetical");   // 0
    const NodeId maze = tree.Add(NoNode, "Maze_", "Maze");              // 1
    tree.Add(alpha, "alpha_pacman.zip", "Pac-Man");                     // 2
    tree.Add(maze, "Maze_pacman.zip", "Pac-Man");                       // 3
    tree.Add(alpha, "alpha_dkong.zip", "Donkey Kong");                  // 4
    const NodeId all = tree.Add(NoNode, "MAME.ROMS", "All MAME ROMs");  // 5
    tree.Add(all, "MAME.ROMS_pacman.zip", "Pac-Man");                   // 6

    tree.Remove(maze);
    ASSERT_EQ(tree.Count(), 5);
    EXPECT_EQ(tree.Find("maze_pacman.zip"), NoNode);
    // Later nodes move up, keep their order, keys and parents.
    EXPECT_EQ(tree.Find("alpha_dkong.zip"), 2);
    EXPECT_EQ(tree.Find("MAME.ROMS_pacman.zip"), 4);
    EXPECT_EQ(tree.Node(4).Parent, 3);
    EXPECT_EQ(tree.Node(2).Parent, 0);
    EXPECT_EQ(ChildTexts(tree, 0), (std::vector<std::string>{"Donkey Kong", "Pac-Man"}));
    EXPECT_EQ(tree.RowOf(3), 1);
    // The removed keys are free again; an out-of-range id changes nothing.
    EXPECT_EQ(tree.Add(NoNode, "maze_", "Maze"), 5);
    tree.Remove(99);
    tree.Remove(NoNode);
    EXPECT_EQ(tree.Count(), 6);

    tree.Clear();
    EXPECT_EQ(tree.Find("alpha_"), NoNode);
    EXPECT_TRUE(tree.Children(NoNode).empty());
    EXPECT_EQ(tree.Add(NoNode, "alpha_", " Alphabetical"), 0);
}

TEST(GameTreeTest, HoldsMoreNodesThanSixteenBitsCount) {
    GameTree tree;
    const NodeId root = tree.Add(NoNode, "MAME.ROMS", "All MAME ROMs");
    for (int i = 0; i < 45000; ++i)
        tree.Add(root, "MAME.ROMS_g" + std::to_string(i) + ".zip", "Game " + std::to_string(44999 - i));
    EXPECT_EQ(tree.Count(), 45001);
    EXPECT_EQ(tree.Find("mame.roms_g44999.zip"), 45000);
    EXPECT_EQ(tree.RowOf(45000), 0);
    tree.Remove(1);
    EXPECT_EQ(tree.Find("mame.roms_g44999.zip"), 44999);
}

}  // namespace
}  // namespace qv
