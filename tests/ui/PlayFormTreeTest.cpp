#include "PlayFormFixture.h"

namespace qv::test {
namespace {

using PlayFormTreeTest = PlayFormFixture;

// Which node gets which colour is the tree builder's rule; here the model hands it on.
const QColor kBlack(0, 0, 0), kGrey(128, 128, 128), kLightBlue(128, 128, 255), kBlue(0, 0, 255);

TEST_F(PlayFormTreeTest, OpensWithTheUsersGamesByTitleAndByCategory) {
    PlayForm& window = Open();
    EXPECT_EQ(window.objectName(), "PlayForm");
    // pacman, digdug, galaga, dkong, missile, the unidentified mystery.zip; joust is hidden and
    // ^qbert removed.
    EXPECT_EQ(TopLevelTexts(),
              (QStringList{" Alphabetical (6)", "Maze (2)", "Platform (1)", "Shooter (2)"}));
    const QModelIndex alpha = NodeIndex("alpha_");
    QStringList titles;
    for (int row = 0; row < Model().rowCount(alpha); ++row)
        titles << Model().index(row, 0, alpha).data().toString();
    EXPECT_EQ(titles, (QStringList{"Dig Dug", "Donkey Kong", "Galaga", "Missile Command",
                                   "mystery.zip", "Pac-Man"}));
    EXPECT_FALSE(NodeIndex("alpha_joust.zip").isValid());
    EXPECT_FALSE(NodeIndex("alpha_^qbert.zip").isValid());
    EXPECT_FALSE(NodeIndex("alpha_qbert.zip").isValid());
}

TEST_F(PlayFormTreeTest, ColoursAndPicturesTellWorkingPresentAndScreenshot) {
    Open();
    EXPECT_EQ(ColourOf("alpha_pacman.zip"), kBlack);       // working, present, screenshot
    EXPECT_EQ(PictureOf("alpha_pacman.zip"), "good");
    EXPECT_EQ(ColourOf("alpha_galaga.zip"), kLightBlue);   // no screenshot
    EXPECT_EQ(ColourOf("Shooter_missile.zip"), kGrey);     // archive missing
    EXPECT_EQ(PictureOf("alpha_missile.zip"), "bad");
    EXPECT_FALSE(NodeIndex("Maze_pacman.zip").data(Qt::DecorationRole).value<QIcon>().isNull());
}

TEST_F(PlayFormTreeTest, OpenFoldersShowTheOpenFolderAndStayOpenWhenGamesAreAdded) {
    Open();
    QTreeView* view = Control<QTreeView>("TreeView1");
    view->expand(NodeIndex("Maze_"));
    EXPECT_EQ(PictureOf("Maze_"), "fopen");
    view->collapse(NodeIndex("Maze_"));
    EXPECT_EQ(PictureOf("Maze_"), "fclosed");

    view->expand(NodeIndex("alpha_"));
    Command("mViewAll")->trigger();
    EXPECT_TRUE(view->isExpanded(NodeIndex("alpha_")));
    EXPECT_EQ(PictureOf("alpha_"), "fopen");
    EXPECT_FALSE(view->isExpanded(NodeIndex("MAME.ROMS")));
}

TEST_F(PlayFormTreeTest, FilterCommandsFollowTheirCheckMarks) {
    program.options.ShowHidden = true;
    Open();
    QAction* hidden = Command("mViewHidden");
    EXPECT_TRUE(hidden->isChecked());
    EXPECT_TRUE(NodeIndex("alpha_joust.zip").isValid());
    hidden->trigger();
    EXPECT_FALSE(hidden->isChecked());
    EXPECT_FALSE(program.options.ShowHidden);
    EXPECT_FALSE(NodeIndex("alpha_joust.zip").isValid());

    QAction* working = Command("mViewWorking");
    EXPECT_FALSE(working->isChecked());
    working->trigger();
    EXPECT_TRUE(working->isChecked());
    EXPECT_TRUE(program.options.ShowWorking);
    EXPECT_FALSE(NodeIndex("alpha_dkong.zip").isValid());
    EXPECT_TRUE(NodeIndex("alpha_mystery.zip").isValid());  // unidentified archives stay
}

TEST_F(PlayFormTreeTest, AddAllEmulatedGamesAddsTheLibraryOnce) {
    Open();
    QAction* addAll = Command("mViewAll");
    addAll->trigger();
    const QModelIndex all = NodeIndex("MAME.ROMS");
    ASSERT_TRUE(all.isValid());
    EXPECT_EQ(all.data().toString(), "All MAME ROMs");
    EXPECT_EQ(Model().rowCount(all), 8);
    EXPECT_EQ(ColourOf("MAME.ROMS_asteroid.zip"), kBlue);  // screenshot, not owned

    const int before = form->Tree().Count();
    addAll->trigger();
    EXPECT_EQ(form->Tree().Count(), before);
}

TEST_F(PlayFormTreeTest, RefreshReadsRecordsAndFolderAgain) {
    PlayForm& window = Open();
    Command("mViewAll")->trigger();
    home.Write("roms/galaxian.zip", std::string(1024, 'g'));
    home.Write("games.inc", GamesInc() + "frogger.zip\tFrogger\r\n");

    Command("mRefresh")->trigger();
    EXPECT_FALSE(NodeIndex("MAME.ROMS").isValid());  // a rebuild drops the all-games folder
    EXPECT_TRUE(NodeIndex("alpha_galaxian.zip").isValid());
    EXPECT_EQ(ColourOf("alpha_frogger.zip"), kGrey);
    EXPECT_EQ(TextOf("alpha_"), " Alphabetical (8)");
    EXPECT_EQ(window.Counts().RomCount, 10);  // 8 lines + mystery.zip + galaxian.zip
}

TEST_F(PlayFormTreeTest, CountLabelShowsArchivesAndTheirSize) {
    Open();
    // 7 lines of games.inc + mystery.zip; six archives of 2 KB and the readme's 10 bytes.
    EXPECT_EQ(Text("Label15"), "8 ROMS (13 KB)");
}

}  // namespace
}  // namespace qv::test
