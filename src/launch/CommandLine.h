#pragma once
#include <functional>
#include <string>
#include <vector>

#include "app/HostConventions.h"
#include "app/Options.h"
#include "catalogue/MyClass.h"
#include "launch/RunSwitches.h"

namespace qv {

// Everything the emulator command is built from. The game's own Mouse flag is the mouse switch;
// the resolution is the resolution label's text ("Auto" or an entry such as "640 x 480").
struct CommandInputs {
    const Options& options;
    const MyClass& game;
    RunSwitches switches;
    std::string resolution = "Auto";
    bool safeMode = false;
    std::string romFolder;
    // The game log the output goes to (full path); only the classic text spells it out.
    std::string logFile;
    // Asked whether the cheat file and the controller file exist; real files by default.
    std::function<bool(const std::string&)> fileExists;
};

// An emulator command as started on a host without a shell: the program and its arguments,
// each arriving as it is here (an archive named "a;b $(x).zip" is one argument).
struct EmulatorCommand {
    std::string program;
    std::vector<std::string> arguments;
};

// The classic emulator's command (full layout, or the short one in Safe Mode) as a list.
EmulatorCommand ClassicCommand(const CommandInputs& inputs, const HostConventions& host);

// The classic command text, exactly as the classic emulator is started through a shell: words
// joined by blanks, nothing quoted but the log file of the output redirect, and on a host that
// starts through a shell (HostConventions::Windows()) the prefix "Cmd.exe /C " or
// "Command.com /C " (by Windows2000XP).
std::string ClassicCommandText(const CommandInputs& inputs, const HostConventions& host);

// A current emulator's command (the options it accepts today).
EmulatorCommand CurrentCommand(const CommandInputs& inputs, const HostConventions& host);

// The current command as one readable line for the activity log: arguments holding blanks or
// quotes are shown in double quotes, then the redirect to the game log.
std::string CommandText(const EmulatorCommand& command, const std::string& logFile);

}  // namespace qv
