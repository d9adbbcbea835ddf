#include "ui/Application.h"

#include <QApplication>
#include <QDir>
#include <QGuiApplication>
#include <QScreen>
#include <cstdlib>

#include "platform/PosixHostInfo.h"
#include "platform/PosixProcessLauncher.h"
#include "platform/qt/QtEventYield.h"
#include "platform/qt/QtPrompt.h"
#include "platform/qt/QtRegional.h"
#include "platform/qt/QtSpeechEngine.h"
#include "ui/AppFolder.h"
#include "ui/GameRoadController.h"
#include "ui/HelpPages.h"
#include "ui/ReferenceController.h"
#include "ui/PlayForm.h"
#include "ui/Program.h"
#include "ui/StartUp.h"
#include "ui/WaitWindow.h"

namespace qv {

int RunQuorvane(int argc, char** argv) {
    QApplication app(argc, argv);
    QApplication::setApplicationName(QStringLiteral("Quorvane"));
    // The program ends when the user confirms the quit question, not when the main window
    // hides itself behind the help window or the about box.
    QApplication::setQuitOnLastWindowClosed(false);

    const std::string home = QDir::homePath().toStdString();
    Program program;
    program.appFolder = ApplicationFolder(std::getenv("QUORVANE_HOME"),
                                          std::getenv("XDG_DATA_HOME"), home);
    PrepareApplicationFolder(program.appFolder);
    EnsureHelpPages(program.appFolder);
    program.regional = std::make_unique<QtRegional>();
    program.clock = std::make_unique<SystemClock>();
    program.yield = std::make_unique<QtEventYield>();
    program.prompt = std::make_unique<QtPrompt>();
    program.OpenLog();

    PosixHostInfo hostInfo(program.prompt.get());
    QSize screen(0, 0);
    if (const QScreen* primary = QGuiApplication::primaryScreen()) screen = primary->size();
    BeginRun(program, hostInfo, screen.width(), screen.height(), home);

    // The speech engine and the game launcher outlive the window that uses them.
    QtSpeechEngine speech;
    PosixProcessLauncher gameLauncher;
    WaitWindow wait(program.yield.get());
    PlayForm form(program, &wait);
    auto* road = new GameRoadController(form, program, speech, gameLauncher);  // owned by the window
    AttachReference(form, program, *road);
    QObject::connect(&form, &PlayForm::quitConfirmed, &app, [] { QCoreApplication::exit(0); });

    PosixProcessLauncher versionLauncher;
    OpenFirstWindow(program, hostInfo, home, versionLauncher, wait, form);
    return app.exec();
}

}  // namespace qv
