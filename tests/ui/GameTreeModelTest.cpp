#include <gtest/gtest.h>

#include <QAbstractItemModelTester>
#include <QBrush>
#include <QIcon>

#include "catalogue/GameTree.h"
#include "ui/GameTreeModel.h"

namespace qv {
namespace {

// A tree like the builder makes: two folders with games in unsorted order.
void FillTree(GameTree& tree) {
    const NodeId alpha = tree.Add(NoNode, "alpha_", " Alphabetical (3)", "fclosed", "fopen");
    const NodeId maze = tree.Add(NoNode, "Maze_", "Maze (2)", "fclosed", "fopen");
    const NodeId pac = tree.Add(alpha, "alpha_pacman.zip", "Pac-Man", "good");
    tree.SetTag(pac, "pacman.zip");
    const NodeId dig = tree.Add(alpha, "alpha_digdug.zip", "Dig Dug", "bad");
    tree.SetColour(dig, colours::Red);
    tree.Add(alpha, "alpha_cafe.zip", "Caf\xE9 Racer", "good");  // a Windows-1252 byte
    tree.Add(maze, "Maze_pacman.zip", "Pac-Man", "good");
    const NodeId missing = tree.Add(maze, "Maze_digdug.zip", "Dig Dug", "bad");
    tree.SetColour(missing, colours::Grey);
}

QStringList ChildTexts(const GameTreeModel& model, const QModelIndex& parent) {
    QStringList texts;
    for (int row = 0; row < model.rowCount(parent); ++row)
        texts << model.index(row, 0, parent).data().toString();
    return texts;
}

TEST(GameTreeModelTest, PassesTheModelTesterWhileTheTreeIsBuiltAndRebuilt) {
    GameTree tree;
    IconSet icons;
    GameTreeModel model(tree, icons);
    QAbstractItemModelTester tester(&model, QAbstractItemModelTester::FailureReportingMode::Fatal);

    model.BeginTreeChange();
    FillTree(tree);
    model.EndTreeChange();
    EXPECT_EQ(model.rowCount(), 2);

    model.BeginTreeChange();
    tree.Clear();
    tree.Add(NoNode, "alpha_", " Alphabetical (0)", "fclosed", "fopen");
    model.EndTreeChange();
    EXPECT_EQ(ChildTexts(model, {}), QStringList{" Alphabetical (0)"});
}

TEST(GameTreeModelTest, ShowsChildrenSortedWithTheirParentsAndTexts) {
    GameTree tree;
    IconSet icons;
    GameTreeModel model(tree, icons);
    model.BeginTreeChange();
    FillTree(tree);
    model.EndTreeChange();

    EXPECT_EQ(ChildTexts(model, {}), (QStringList{" Alphabetical (3)", "Maze (2)"}));
    const QModelIndex alpha = model.index(0, 0);
    // Undecodable bytes are shown as Windows-1252 rather than dropped.
    EXPECT_EQ(ChildTexts(model, alpha),
              (QStringList{QString::fromUtf8("Caf\u00e9 Racer"), "Dig Dug", "Pac-Man"}));

    const QModelIndex pac = model.index(2, 0, alpha);
    EXPECT_EQ(model.parent(pac), alpha);
    EXPECT_EQ(pac.data(GameTreeModel::KeyRole).toString(), "alpha_pacman.zip");
    EXPECT_EQ(pac.data(GameTreeModel::TagRole).toString(), "pacman.zip");
    EXPECT_EQ(model.IndexOf(model.NodeOf(pac)), pac);
    EXPECT_EQ(model.rowCount(pac), 0);
}

TEST(GameTreeModelTest, GivesTheNodeColoursAndPictures) {
    GameTree tree;
    IconSet icons;
    GameTreeModel model(tree, icons);
    model.BeginTreeChange();
    FillTree(tree);
    model.EndTreeChange();

    const QModelIndex maze = model.index(1, 0);
    const QModelIndex dig = model.index(0, 0, maze);
    EXPECT_EQ(dig.data(Qt::ForegroundRole).value<QBrush>().color(), QColor(128, 128, 128));
    EXPECT_EQ(dig.data(GameTreeModel::ImageKeyRole).toString(), "bad");
    EXPECT_FALSE(dig.data(Qt::DecorationRole).value<QIcon>().isNull());
    const QModelIndex pac = model.index(1, 0, maze);
    EXPECT_EQ(pac.data(Qt::ForegroundRole).value<QBrush>().color(), QColor(0, 0, 0));
    EXPECT_EQ(pac.data(GameTreeModel::ImageKeyRole).toString(), "good");
}

TEST(GameTreeModelTest, AnOpenFolderShowsTheOpenFolderPicture) {
    GameTree tree;
    IconSet icons;
    GameTreeModel model(tree, icons);
    model.BeginTreeChange();
    FillTree(tree);
    model.EndTreeChange();
    const QModelIndex maze = model.index(1, 0);
    EXPECT_EQ(maze.data(GameTreeModel::ImageKeyRole).toString(), "fclosed");

    model.SetExpanded(maze, true);
    EXPECT_EQ(maze.data(GameTreeModel::ImageKeyRole).toString(), "fopen");
    // A game node has no open picture: opening it changes nothing.
    const QModelIndex game = model.index(0, 0, maze);
    model.SetExpanded(game, true);
    EXPECT_EQ(game.data(GameTreeModel::ImageKeyRole).toString(), "bad");

    model.SetExpanded(maze, false);
    EXPECT_EQ(maze.data(GameTreeModel::ImageKeyRole).toString(), "fclosed");
}

TEST(GameTreeModelTest, IndexesOfAnotherModelOrOutOfRangeAreRefused) {
    GameTree tree;
    IconSet icons;
    GameTreeModel model(tree, icons);
    model.BeginTreeChange();
    FillTree(tree);
    model.EndTreeChange();
    EXPECT_FALSE(model.index(5, 0).isValid());
    EXPECT_FALSE(model.index(0, 1).isValid());
    EXPECT_EQ(model.NodeOf(QModelIndex()), NoNode);
    EXPECT_FALSE(model.IndexOf(99).isValid());
}

}  // namespace
}  // namespace qv
