#include <gtest/gtest.h>

#include <QAbstractItemModelTester>
#include <QBrush>
#include <QIcon>

#include "catalogue/GameTree.h"
#include "ui/GameTreeModel.h"

namespace qv {
namespace {

// A tree like the builder makes: two folders with games in unsorted order, watched by Qt's
// model tester through every change.
struct GameTreeModelTest : ::testing::Test {
    GameTree tree;
    IconSet icons;
    GameTreeModel model{tree, icons};
    QAbstractItemModelTester tester{&model, QAbstractItemModelTester::FailureReportingMode::Fatal};

    GameTreeModelTest() {
        model.BeginTreeChange();
        const NodeId alpha = tree.Add(NoNode, "alpha_", " Alphabetical (3)", "fclosed", "fopen");
        const NodeId maze = tree.Add(NoNode, "Maze_", "Maze (2)", "fclosed", "fopen");
        tree.SetTag(tree.Add(alpha, "alpha_pacman.zip", "Pac-Man", "good"), "pacman.zip");
        tree.SetColour(tree.Add(alpha, "alpha_digdug.zip", "Dig Dug", "bad"), colours::Red);
        tree.Add(alpha, "alpha_cafe.zip", "Caf\xE9 Racer", "good");  // a Windows-1252 byte
        tree.Add(maze, "Maze_pacman.zip", "Pac-Man", "good");
        tree.SetColour(tree.Add(maze, "Maze_digdug.zip", "Dig Dug", "bad"), colours::Grey);
        model.EndTreeChange();
    }
    QStringList ChildTexts(const QModelIndex& parent) {
        QStringList texts;
        for (int row = 0; row < model.rowCount(parent); ++row)
            texts << model.index(row, 0, parent).data().toString();
        return texts;
    }
    QString Picture(const QModelIndex& index) {
        return index.data(GameTreeModel::ImageKeyRole).toString();
    }
};

TEST_F(GameTreeModelTest, ShowsChildrenSortedWithTheirParentsTextsAndKeys) {
    EXPECT_EQ(ChildTexts({}), (QStringList{" Alphabetical (3)", "Maze (2)"}));
    const QModelIndex alpha = model.index(0, 0);
    // Undecodable bytes are shown as Windows-1252 rather than dropped.
    EXPECT_EQ(ChildTexts(alpha),
              (QStringList{QString::fromUtf8("Caf\u00e9 Racer"), "Dig Dug", "Pac-Man"}));
    const QModelIndex pac = model.index(2, 0, alpha);
    EXPECT_EQ(model.parent(pac), alpha);
    EXPECT_EQ(pac.data(GameTreeModel::KeyRole).toString(), "alpha_pacman.zip");
    EXPECT_EQ(pac.data(GameTreeModel::TagRole).toString(), "pacman.zip");
    EXPECT_EQ(model.IndexOf(model.NodeOf(pac)), pac);
    EXPECT_FALSE(model.index(5, 0).isValid());
    EXPECT_FALSE(model.index(0, 1).isValid());
    EXPECT_EQ(model.NodeOf(QModelIndex()), NoNode);
    EXPECT_FALSE(model.IndexOf(99).isValid());

    model.BeginTreeChange();  // a rebuild
    tree.Clear();
    tree.Add(NoNode, "alpha_", " Alphabetical (0)", "fclosed", "fopen");
    model.EndTreeChange();
    EXPECT_EQ(ChildTexts({}), QStringList{" Alphabetical (0)"});
}

TEST_F(GameTreeModelTest, GivesColoursPicturesAndTheOpenFolderPicture) {
    const QModelIndex maze = model.index(1, 0);
    const QModelIndex dig = model.index(0, 0, maze);
    EXPECT_EQ(dig.data(Qt::ForegroundRole).value<QBrush>().color(), QColor(128, 128, 128));
    EXPECT_EQ(Picture(dig), "bad");
    EXPECT_FALSE(dig.data(Qt::DecorationRole).value<QIcon>().isNull());
    const QModelIndex pac = model.index(1, 0, maze);
    EXPECT_EQ(pac.data(Qt::ForegroundRole).value<QBrush>().color(), QColor(0, 0, 0));
    EXPECT_EQ(Picture(pac), "good");

    EXPECT_EQ(Picture(maze), "fclosed");
    model.SetExpanded(maze, true);
    EXPECT_EQ(Picture(maze), "fopen");
    model.SetExpanded(dig, true);  // a game has no open picture
    EXPECT_EQ(Picture(dig), "bad");
    model.SetExpanded(maze, false);
    EXPECT_EQ(Picture(maze), "fclosed");
}

}  // namespace
}  // namespace qv
