#include <gtest/gtest.h>

#include <QApplication>
#include <QKeyEvent>
#include <QLabel>
#include <QPushButton>
#include <QTest>
#include <QTextBrowser>

#include "app/AppVersion.h"
#include "support/TempDir.h"
#include "ui/AboutWindow.h"
#include "ui/HelpPages.h"
#include "ui/HelpWindow.h"
#include "ui/WaitWindow.h"

namespace qv::test {

namespace {
QString Build() { return QString::number(app_version::Build); }

template <typename T>
T* Child(QWidget& parent, const char* name) {
    T* found = parent.findChild<T*>(QLatin1String(name));
    EXPECT_NE(found, nullptr) << name;
    return found;
}
}  // namespace

TEST(WaitWindow, ShowsVersionAndStatusAndRepaintsOnChange) {
    NoEventYield yield;
    WaitWindow wait(&yield);
    EXPECT_FALSE(wait.IsVisible());
    EXPECT_EQ(wait.Status(), "Loading ...");
    auto* version = Child<QLabel>(wait, "lblVersion");
    ASSERT_NE(version, nullptr);
    EXPECT_EQ(version->text(), "Version: 2.25 Build " + Build());
    EXPECT_EQ(version->toolTip(), "Version: 2.25.031704 Build " + Build());
    EXPECT_EQ(wait.cursor().shape(), Qt::WaitCursor);

    // Hidden: loaders' progress is not shown.
    wait.ShowStatusIfVisible("Loading Options ...");
    EXPECT_EQ(wait.Status(), "Loading ...");

    wait.show();
    ASSERT_TRUE(QTest::qWaitForWindowExposed(&wait));
    wait.ShowStatusIfVisible("Initializing ...");
    EXPECT_EQ(Child<QLabel>(wait, "lblStatus")->text(), "Initializing ...");
    EXPECT_GE(yield.yields, 1);
    const long before = yield.yields;
    QTest::qWait(1100);  // two ticks of the 500 ms timer
    EXPECT_GE(yield.yields, before + 2);
}

TEST(AboutWindow, SpeaksLogoTextOnceOnOpeningAndClosesWithC) {
    std::vector<std::string> spoken;
    AboutWindow about([&](const std::string& text) { spoken.push_back(text); });
    EXPECT_EQ(about.windowTitle(), "Quorvane");
    auto* version = Child<QLabel>(about, "lblVersion");
    ASSERT_NE(version, nullptr);
    EXPECT_EQ(version->text(), "Version 2.25 Build " + Build());
    EXPECT_EQ(version->toolTip(), "2.25.031704 Build " + Build());
    const std::string credit = Child<QLabel>(about, "lblCredit")->text().toStdString();
    const std::string logoText =
        "Quorvane . Version 2.25 Build " + Build().toStdString() + "   .   " + credit;
    EXPECT_EQ(about.LogoText(), logoText);

    about.show();
    ASSERT_TRUE(QTest::qWaitForWindowExposed(&about));
    about.hide();
    about.show();
    EXPECT_EQ(spoken, std::vector<std::string>{logoText});

    QTest::mouseClick(Child<QLabel>(about, "imgLogo"), Qt::LeftButton);
    QTest::mouseClick(Child<QLabel>(about, "imgMAME"), Qt::LeftButton);
    ASSERT_EQ(spoken.size(), 3u);
    EXPECT_EQ(spoken[1], logoText);
    EXPECT_EQ(spoken[2], AboutWindow::EmulatorSentence());

    QTest::keyClick(&about, Qt::Key_C);
    EXPECT_FALSE(about.isVisible());
    EXPECT_EQ(about.result(), QDialog::Accepted);

    AboutWindow silent({});  // no voice: nothing to call, nothing breaks
    silent.show();
    QTest::mouseClick(Child<QLabel>(silent, "imgClose"), Qt::LeftButton);
    EXPECT_FALSE(silent.isVisible());
}

TEST(HelpWindow, TopicsPickPagesOrWebSite) {
    TempDir app;
    EXPECT_EQ(EnsureHelpPages(app.path()), 2);
    EXPECT_NE(app.Read("help/quorvane.html").find("<h1>Quorvane</h1>"), std::string::npos);
    EXPECT_NE(app.Read("help/mame.html").find("<h1>MAME Tips</h1>"), std::string::npos);
    // Pages the user edited stay as they are.
    app.Write("help/mame.html", "<p>my own tips</p>");
    EXPECT_EQ(EnsureHelpPages(app.path()), 0);
    EXPECT_EQ(app.Read("help/mame.html"), "<p>my own tips</p>");

    std::vector<QUrl> opened;
    HelpWindow help(app.path(), nullptr, [&](const QUrl& url) { opened.push_back(url); });
    int closedSignals = 0;
    QObject::connect(&help, &HelpWindow::closed, [&] { ++closedSignals; });
    auto* browser = Child<QTextBrowser>(help, "WebBrowser1");
    ASSERT_NE(browser, nullptr);

    help.ShowTopic("QUORVANE");
    help.show();
    EXPECT_EQ(help.windowTitle(), "Quorvane - Help");
    EXPECT_TRUE(browser->toPlainText().contains("front-end for the MAME arcade emulator"));
    help.ShowTopic("MAME");
    EXPECT_TRUE(browser->toPlainText().contains("my own tips"));

    // Refresh reads the page again.
    app.Write("help/mame.html", "<p>changed tips</p>");
    QTest::mouseClick(Child<QPushButton>(help, "cmdRefresh"), Qt::LeftButton);
    EXPECT_TRUE(browser->toPlainText().contains("changed tips"));
    EXPECT_TRUE(opened.empty());

    help.ShowTopic("");
    ASSERT_EQ(opened.size(), 1u);
    EXPECT_EQ(opened[0].scheme(), "https");

    std::filesystem::remove(app / "help" / "quorvane.html");
    help.ShowTopic("QUORVANE");
    EXPECT_TRUE(browser->toPlainText().contains("cannot be found"));

    auto* close = Child<QPushButton>(help, "cmdClose");
    EXPECT_EQ(close->text(), "&Close");
    QTest::mouseClick(close, Qt::LeftButton);
    EXPECT_FALSE(help.isVisible());
    EXPECT_EQ(closedSignals, 1);
}

}  // namespace qv::test
