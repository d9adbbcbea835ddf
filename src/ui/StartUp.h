#pragma once
#include <string>

#include "platform/HostInfo.h"
#include "platform/ProcessLauncher.h"
#include "ui/Program.h"

namespace qv {

class PlayForm;
class WaitWindow;

// The start-up sequence in two halves, so that the windows can be created in between.

// Enables the log, writes the run header and sets the built-in defaults.
void BeginRun(Program& program, HostInfo& hostInfo, int screenWidth, int screenHeight,
              const std::string& homeFolder);

// With config.inc: the wait window, the settings, the emulator's version and the ROM library.
// Without it (until the first-run wizard exists): the built-in defaults again and the library.
// Then the main window's load, which closes the wait window.
void OpenFirstWindow(Program& program, HostInfo& hostInfo, const std::string& homeFolder,
                     ProcessLauncher& launcher, WaitWindow& wait, PlayForm& form);

}  // namespace qv
