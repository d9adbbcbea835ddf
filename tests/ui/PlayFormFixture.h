#pragma once
#include <gtest/gtest.h>

#include <QAction>
#include <QApplication>
#include <QBrush>
#include <QLabel>
#include <QTest>
#include <QTreeView>
#include <functional>
#include <memory>
#include <string>

#include "app/OptionsFile.h"
#include "catalogue/RomLibrary.h"
#include "platform/Regional.h"
#include "support/FixedLog.h"
#include "support/ScriptedPrompt.h"
#include "support/TempDir.h"
#include "ui/GameTreeModel.h"
#include "ui/PlayForm.h"
#include "ui/Program.h"
#include "ui/TreePane.h"

namespace qv::test {

// A home folder with a library, records and a ROM folder whose games show every colour and
// icon of the tree, and a main window opened on it.
class PlayFormFixture : public ::testing::Test {
protected:
    void SetUp() override {
        home.Write("mame_rom_lib.inc",
                   "# Test library\r\n#\r\n# Revision: 1\r\n"
                   "pacman\tPac-Man\t1980\tNamco\tYes\tYes\tYes\tYes\tMaze\t.30\r\n"
                   "digdug\tDig Dug\t1982\tNamco\tYes\tYes\tYes\tYes\tMaze\t.30\r\n"
                   "galaga\tGalaga\t1981\tNamco\tYes\tYes\tYes\tYes\tShooter\t.30\r\n"
                   "dkong\tDonkey Kong\t1981\tNintendo\tYes\tYes\tYes\tYes\tPlatform\t.30\r\n"
                   "joust\tJoust\t1982\tWilliams\tYes\tYes\tYes\tNo\tPlatform\t.30\r\n"
                   "missile\tMissile Command\t1980\tAtari\tYes\tYes\tYes\tYes\tShooter\t.30\r\n"
                   "qbert\tQ*bert\t1982\tGottlieb\tYes\tYes\tYes\tNo\tPuzzle\t.30\r\n"
                   "asteroid\tAsteroids\t1979\tAtari\tYes\tYes\tYes\tNo\tShooter\t.30\r\n");
        home.Write("games.inc", GamesInc());
        for (const char* archive : {"pacman.zip", "digdug.zip", "galaga.zip", "dkong.zip",
                                    "joust.zip", "mystery.zip", "qbert.zip"})
            home.Write(std::string("roms/") + archive, std::string(2048, 'z'));
        home.Write("roms/readme.txt", "not a game");
        home.Write("snap/pacman.png", "png");
        home.Write("snap/dkong.png", "png");
        home.Write("snap/asteroid.png", "png");

        program.appFolder = home.path();
        program.regional = std::make_unique<EnglishRegional>();
        program.clock = std::make_unique<FixedClock>();
        program.yield = std::make_unique<NoEventYield>();
        auto scripted = std::make_unique<ScriptedPrompt>();
        prompt = scripted.get();
        program.prompt = std::move(scripted);
        program.OpenLog();
        program.log->SetEnabled(true);
        SetDefaults(program.options, home.path(), program.host, home.path().string());
        Options& o = program.options;
        o.DefaultROMdir = (home / "roms").string();
        o.SnapDir = (home / "snap").string();
        o.Speak = false;
    }

    static std::string GamesInc() {
        // RomFile Title Notes Working Mouse Year Company Rating Categories Hidden Plays
        // LastPlayed Resolution PlaySeconds
        return "pacman.zip\tPac-Man\t\tTrue\tFalse\t1980\tNamco\t***\t\tFalse\t3\tNever\t\t60\r\n"
               "digdug.zip\tDig Dug\t\tTrue\tFalse\t1982\tNamco\t\t\tFalse\t0\tNever\t\t0\r\n"
               "galaga.zip\tGalaga\t\tTrue\tFalse\t1981\tNamco\t\t\tFalse\t0\tNever\t\t0\r\n"
               "dkong.zip\tDonkey Kong\t\tFalse\tFalse\t1981\tNintendo\t\t\tFalse\t0\tNever\t\t0\r\n"
               "joust.zip\tJoust\t\tTrue\tFalse\t1982\tWilliams\t\t\tTrue\t0\tNever\t\t0\r\n"
               "missile.zip\tMissile Command\t\tTrue\tFalse\t1980\tAtari\t\t\tFalse\t0\tNever\t\t0\r\n"
               "^qbert.zip\tQ*bert\t\tTrue\tFalse\t1982\tGottlieb\t\t\tFalse\t0\tNever\t\t0\r\n";
    }

    // Reads the library and opens the window (the start-up's last steps); `attach` adds the
    // window's controllers before it loads.
    PlayForm& Open(const std::function<void(PlayForm&)>& attach = {}) {
        NoStatusDisplay status;
        LoadRomLibrary(program.romLibrary, program.options.RomLibraryFile, *program.log, status);
        form = std::make_unique<PlayForm>(program, nullptr);
        if (attach) attach(*form);
        form->Load();
        return *form;
    }

    template <typename T = QWidget>
    T* Control(const char* name) {
        auto* control = form->findChild<T*>(QString::fromLatin1(name));
        EXPECT_NE(control, nullptr) << name;
        return control;
    }
    QString Text(const char* name) { return Control<QLabel>(name)->text(); }
    bool Shown(const char* name) { return !Control(name)->isHidden(); }
    void Click(const char* name) {
        QApplication::processEvents();  // lay out the tabs so a click lands inside them
        QTest::mouseClick(Control(name), Qt::LeftButton);
    }
    void Select(const std::string& key) { form->Pane().View()->setCurrentIndex(NodeIndex(key)); }

    GameTreeModel& Model() { return form->Pane().Model(); }

    QModelIndex NodeIndex(const std::string& key) {
        return Model().IndexOf(form->Tree().Find(key));
    }
    QString TextOf(const std::string& key) { return NodeIndex(key).data().toString(); }
    QColor ColourOf(const std::string& key) {
        return NodeIndex(key).data(Qt::ForegroundRole).value<QBrush>().color();
    }
    QString PictureOf(const std::string& key) {
        return NodeIndex(key).data(GameTreeModel::ImageKeyRole).toString();
    }
    QStringList TopLevelTexts() {
        QStringList texts;
        for (int row = 0; row < Model().rowCount(); ++row)
            texts << Model().index(row, 0).data().toString();
        return texts;
    }
    QAction* Command(const char* name) {
        auto* action = form->findChild<QAction*>(QString::fromLatin1(name));
        EXPECT_NE(action, nullptr) << name;
        return action;
    }

    TempDir home;
    Program program;
    ScriptedPrompt* prompt = nullptr;
    std::unique_ptr<PlayForm> form;
};

}  // namespace qv::test
