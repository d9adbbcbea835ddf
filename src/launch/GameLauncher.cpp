#include "launch/GameLauncher.h"

#include <exception>
#include <filesystem>
#include <limits>
#include <system_error>

#include "launch/CommandLine.h"
#include "launch/GameLog.h"

namespace qv {
namespace {

constexpr const char* kWindowName = "PlayForm";
constexpr const char* kSafeModeAdvice =
    "If you are running Windows 98, you should turn on \"Safe Mode\" from the file menu.";

RunResult Fail(const GameLauncherServices& s, RunResult result, const std::string& what) {
    s.log.LogError(kWindowName, "RunGame",
                   PendingError{1, what.empty() ? std::string("unexpected failure") : what});
    s.prompt.Inform(kSafeModeAdvice, PromptIcon::Information);
    result.outcome = RunOutcome::Failed;
    return result;
}

// The logs folder is made when missing; a failure shows up later as a start that fails.
void EnsureLogsFolder(const GameLauncherServices& s) {
    const std::filesystem::path logs = s.host.Join(s.appFolder, "logs");
    std::error_code error;
    if (std::filesystem::is_directory(logs, error)) return;
    std::filesystem::create_directories(logs, error);
    if (error)
        s.log.LogError(kWindowName, "RunGame", PendingError{1, "cannot create " + logs.string() +
                                                                 ": " + error.message()});
}

// MameExec names a file inside MamePath; a name with a folder in it would start a program
// from somewhere else.
bool IsBareName(const std::string& name) {
    return !name.empty() && name != "." && name != ".." &&
           name.find_first_of("/\\") == std::string::npos;
}

}  // namespace

RunResult RunGame(const RunRequest& request, const GameLauncherServices& s) {
    RunResult result;
    s.watch.Clear();
    if (request.selectedGameKey.empty()) return result;

    try {
        MyClass* game = s.records.Item(request.selectedGameKey);
        if (!game) return Fail(s, result, "no record for " + request.selectedGameKey);
        if (!game->Working) {
            result.outcome = RunOutcome::NotWorking;
            return result;
        }

        const std::string logFile = GameLogPath(s.appFolder, game->RomFile, s.host);
        const CommandInputs inputs{s.options,          *game,   request.switches,
                                   request.resolution, request.safeMode,
                                   request.romFolder,  logFile, nullptr};
        const EmulatorCommand command = request.currentEmulator ? CurrentCommand(inputs, s.host)
                                                                : ClassicCommand(inputs, s.host);
        result.commandText = request.currentEmulator ? CommandText(command, logFile)
                                                     : ClassicCommandText(inputs, s.host);

        if (!game->Present) {
            s.log.WriteLog("Failed: " + game->RomFile + " does not exist.");
            s.speaker.Speak("Cannot find required ROM file");
            result.outcome = RunOutcome::NotPresent;
            return result;
        }

        s.log.WriteLog("Play: " + game->Title);
        s.log.WriteLog(result.commandText);
        EnsureLogsFolder(s);

        LaunchRequest launch;
        launch.program = command.program;
        launch.arguments = command.arguments;
        launch.outputFile = s.options.LogGameOutput ? logFile : std::string();
        // The emulator runs in its own folder; this program's current folder stays as it is.
        std::error_code error;
        if (std::filesystem::is_directory(s.options.MamePath, error))
            launch.workingDirectory = s.options.MamePath;

        const ProcessId id = IsBareName(s.options.MameExec) ? s.launcher.Start(launch) : 0;
        // Logging yields to the event loop: look the record up again in case it went meanwhile.
        game = s.records.Item(request.selectedGameKey);
        if (id == 0) {
            const std::string title = game ? game->Title : request.selectedGameKey;
            s.prompt.Inform("Error!  Cannot start the game: " + title, PromptIcon::Information);
            s.log.LogError(kWindowName, "RunGame: Result code = 0, game did not start");
            result.outcome = RunOutcome::StartFailed;
            return result;
        }

        result.processId = id;
        result.outcome = RunOutcome::Started;
        s.watch.Watch(id);
        if (game) {
            // The count is 16-bit: at its largest it stays, and the start goes on.
            if (game->Plays < std::numeric_limits<std::int16_t>::max()) ++game->Plays;
            game->LastPlayed = s.regional.GeneralDate(s.clock.Now());
        }
        return result;
    } catch (const std::exception& failure) {
        return Fail(s, result, failure.what());
    } catch (...) {
        return Fail(s, result, "");
    }
}

}  // namespace qv
