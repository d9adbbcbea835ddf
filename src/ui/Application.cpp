#include "ui/Application.h"

#include <QApplication>
#include <QDir>
#include <QGuiApplication>
#include <QScreen>
#include <cstdlib>

#include "app/EmulatorVersion.h"
#include "app/OptionsFile.h"
#include "app/RunHeader.h"
#include "app/TextFile.h"
#include "catalogue/RomLibrary.h"
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
    ActivityLog& log = *program.log;
    log.SetEnabled(true);

    PosixHostInfo hostInfo(program.prompt.get());
    QSize screen(0, 0);
    if (const QScreen* primary = QGuiApplication::primaryScreen()) screen = primary->size();
    WriteRunHeader(log, hostInfo, screen.width(), screen.height(), *program.regional,
                   *program.clock);

    Options& options = program.options;
    SetDefaults(options, program.appFolder, program.host, home, &hostInfo);

    // The speech engine and the game launcher outlive the window that uses them.
    QtSpeechEngine speech;
    PosixProcessLauncher gameLauncher;
    WaitWindow wait(program.yield.get());
    PlayForm form(program, &wait);
    auto* road = new GameRoadController(form, program, speech, gameLauncher);  // owned by the window
    AttachReference(form, program, *road);
    QObject::connect(&form, &PlayForm::quitConfirmed, &app, [] { QCoreApplication::exit(0); });

    const auto configFile = program.appFolder / "config.inc";
    if (FileExists(configFile)) {
        wait.show();
        wait.SetStatus("Initializing ...");
        LoadOptions(options, configFile, log, wait);
        PosixProcessLauncher launcher;
        EmulatorVersionCheck versionCheck(options, program.appFolder, program.host, log,
                                          launcher, *program.yield);
        program.mameVersion = versionCheck.GetMAMEVer(options.MameExec, true);
        LoadRomLibrary(program.romLibrary, options.RomLibraryFile, log, wait);
    } else {
        // No settings yet. Until the first-run wizard exists the window opens on the built-in
        // defaults, with the library the wizard would have read.
        SetDefaults(options, program.appFolder, program.host, home, &hostInfo);
        LoadRomLibrary(program.romLibrary, options.RomLibraryFile, log, wait);
    }
    form.Load();
    return app.exec();
}

}  // namespace qv
