#include <QSignalSpy>

#include "PlayFormFixture.h"

namespace qv::test {
namespace {

using PlayFormQuitTest = PlayFormFixture;

const std::string kSeparator(60, '_');

bool LogEndsWithSeparator(const std::string& log) {
    return log.size() >= kSeparator.size() + 2 &&
           log.compare(log.size() - kSeparator.size() - 2, std::string::npos,
                       kSeparator + "\r\n") == 0;
}

TEST_F(PlayFormQuitTest, TheQuitQuestionAnsweredNoKeepsTheWindowAndWritesNothing) {
    PlayForm& window = Open();
    QSignalSpy quits(&window, &PlayForm::quitConfirmed);
    const std::string logBefore = home.Read("quorvane.log");
    prompt->Answer(PromptAnswer::No);
    EXPECT_FALSE(window.close());
    ASSERT_EQ(prompt->asked.size(), 1u);
    EXPECT_EQ(prompt->asked[0].title, "Quorvane");
    EXPECT_EQ(prompt->asked[0].text, "Are you sure you want to quit?");
    EXPECT_EQ(prompt->asked[0].buttons, PromptButtons::YesNo);
    EXPECT_EQ(prompt->asked[0].icon, PromptIcon::Question);
    EXPECT_TRUE(window.isVisible());
    EXPECT_EQ(quits.count(), 0);
    EXPECT_EQ(home.Read("games.inc"), GamesInc());
    EXPECT_EQ(home.Read("quorvane.log"), logBefore);
}

TEST_F(PlayFormQuitTest, YesSavesTheRecordsWhenSaveOnExitIsSet) {
    PlayForm& window = Open();
    QSignalSpy quits(&window, &PlayForm::quitConfirmed);
    prompt->Answer(PromptAnswer::Yes);
    EXPECT_TRUE(window.close());
    EXPECT_EQ(quits.count(), 1);
    const std::string saved = home.Read("games.inc");
    // The scan's new archive and the missing game now marked not working reach the file.
    EXPECT_NE(saved.find("mystery.zip\tmystery.zip"), std::string::npos);
    EXPECT_NE(saved.find("missile.zip\tMissile Command\t\tFalse"), std::string::npos);
    EXPECT_TRUE(LogEndsWithSeparator(home.Read("quorvane.log")));
    EXPECT_EQ(prompt->unexpected, 0);
}

TEST_F(PlayFormQuitTest, YesWithoutSaveOnExitLeavesTheRecordsFileAlone) {
    program.options.SaveOnExit = false;
    PlayForm& window = Open();
    prompt->Answer(PromptAnswer::Yes);
    EXPECT_TRUE(window.close());
    EXPECT_EQ(home.Read("games.inc"), GamesInc());
    EXPECT_TRUE(LogEndsWithSeparator(home.Read("quorvane.log")));
}

class FailingSaveTest : public PlayFormFixture {
protected:
    void SetUp() override {
        PlayFormFixture::SetUp();
        Open();
        // A records file inside a "folder" that is a plain file cannot be written.
        home.Write("blocked", "a file, not a folder");
        program.options.GamesFile = (home / "blocked" / "games.inc").string();
    }
};

TEST_F(FailingSaveTest, AFailedSaveOnExitAsksWhetherToQuitWithoutSaving) {
    QSignalSpy quits(form.get(), &PlayForm::quitConfirmed);
    prompt->Answer(PromptAnswer::Yes);
    prompt->Answer(PromptAnswer::No);
    EXPECT_FALSE(form->close());
    EXPECT_EQ(quits.count(), 0);
    ASSERT_EQ(prompt->asked.size(), 2u);
    EXPECT_EQ(prompt->asked[1].title, "Quorvane");
    EXPECT_NE(prompt->asked[1].text.find("could not be saved"), std::string::npos);
    EXPECT_NE(prompt->asked[1].text.find("Quit without saving?"), std::string::npos);
    EXPECT_NE(home.Read("quorvane.log").find(" *** "), std::string::npos);
    EXPECT_FALSE(LogEndsWithSeparator(home.Read("quorvane.log")));

    prompt->Answer(PromptAnswer::Yes);  // asked again, this time the user accepts
    prompt->Answer(PromptAnswer::Yes);
    EXPECT_TRUE(form->close());
    EXPECT_EQ(quits.count(), 1);
    EXPECT_TRUE(LogEndsWithSeparator(home.Read("quorvane.log")));
}

TEST_F(FailingSaveTest, SaveCommandReportsAFailureInAQuorvaneMessage) {
    Command("mSave")->trigger();
    ASSERT_EQ(prompt->asked.size(), 1u);
    EXPECT_EQ(prompt->asked[0].title, "Quorvane");
    EXPECT_EQ(prompt->asked[0].buttons, PromptButtons::Ok);
    EXPECT_NE(prompt->asked[0].text.find("could not be saved"), std::string::npos);
}

TEST_F(PlayFormQuitTest, SaveCommandWritesTheRecords) {
    Open();
    Command("mSave")->trigger();
    const std::string saved = home.Read("games.inc");
    EXPECT_NE(saved.find("mystery.zip\tmystery.zip"), std::string::npos);
    EXPECT_NE(saved.find("^qbert.zip\tQ*bert"), std::string::npos);
    EXPECT_TRUE(prompt->asked.empty());
}

}  // namespace
}  // namespace qv::test
