#pragma once
#include <string>

#include "app/ActivityLog.h"
#include "app/HostConventions.h"
#include "app/Options.h"
#include "catalogue/MyClass.h"
#include "launch/GameWatch.h"
#include "launch/RunSwitches.h"
#include "platform/Clock.h"
#include "platform/ProcessLauncher.h"
#include "platform/Prompt.h"
#include "platform/Regional.h"
#include "reference/Speaker.h"

namespace qv {

// The main window's collaborators RunGame works with; all outlive the call.
struct GameLauncherServices {
    MyClass& records;         // GameRecords
    const Options& options;
    HostConventions host;
    std::string appFolder;    // the game logs go to appFolder/logs (created when missing)
    ActivityLog& log;
    ProcessLauncher& launcher;
    GameWatch& watch;         // receives GameTaskId; cleared first on every call
    Speaker& speaker;         // "Cannot find required ROM file"
    Prompt& prompt;           // the "Quorvane" message boxes
    const Clock& clock;
    const Regional& regional;
};

// What the window knows at the moment of the start.
struct RunRequest {
    std::string selectedGameKey;  // empty: nothing happens
    RunSwitches switches;         // cheats, artwork, priority, window
    std::string resolution = "Auto";  // the resolution label's text
    bool safeMode = false;
    std::string romFolder;        // the folder of the window's file list (DefaultROMdir)
    bool currentEmulator = true;  // the version check found a current emulator, not a classic one
};

enum class RunOutcome {
    NothingSelected,  // no key: nothing done, nothing reported
    NotWorking,       // the record's Working flag is off: nothing reported
    NotPresent,       // archive missing: logged "Failed: ..." and spoken
    StartFailed,      // the launcher returned 0: message box and error line
    Failed,           // anything else (e.g. no record for the key): error line and message box
    Started,
};

struct RunResult {
    RunOutcome outcome = RunOutcome::NothingSelected;
    std::string commandText;  // what was logged as the command, when one was built
    ProcessId processId = 0;
};

// Safe Mode at start-up: on when the system is not of the NT family (Windows2000XP off).
inline bool InitialSafeMode(const Options& options) { return !options.Windows2000XP; }

// Starts the selected game: drops any watched game, builds the command for the detected
// emulator generation (current: argument list; classic: the classic layout), sends the output
// to logs/<key with ".zip" -> ".log">, logs "Play: " + title and the command, starts the
// emulator directly (no shell) in MamePath, and on success hands the process to the watch,
// raises Plays (it stays at 32767) and sets LastPlayed. Failures are logged as
// "PlayForm" / "RunGame" and never escape.
RunResult RunGame(const RunRequest& request, const GameLauncherServices& services);

}  // namespace qv
