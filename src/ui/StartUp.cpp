#include "ui/StartUp.h"

#include "app/EmulatorVersion.h"
#include "app/OptionsFile.h"
#include "app/RunHeader.h"
#include "app/TextFile.h"
#include "catalogue/RomLibrary.h"
#include "ui/PlayForm.h"
#include "ui/WaitWindow.h"

namespace qv {

void BeginRun(Program& program, HostInfo& hostInfo, int screenWidth, int screenHeight,
              const std::string& homeFolder) {
    program.log->SetEnabled(true);
    WriteRunHeader(*program.log, hostInfo, screenWidth, screenHeight, *program.regional,
                   *program.clock);
    SetDefaults(program.options, program.appFolder, program.host, homeFolder, &hostInfo);
}

void OpenFirstWindow(Program& program, HostInfo& hostInfo, const std::string& homeFolder,
                     ProcessLauncher& launcher, WaitWindow& wait, PlayForm& form) {
    Options& options = program.options;
    ActivityLog& log = *program.log;
    const auto configFile = program.appFolder / "config.inc";
    if (FileExists(configFile)) {
        wait.show();
        wait.SetStatus("Initializing ...");
        LoadOptions(options, configFile, log, wait);
        EmulatorVersionCheck versionCheck(options, program.appFolder, program.host, log,
                                          launcher, *program.yield);
        program.mameVersion = versionCheck.GetMAMEVer(options.MameExec, true);
        LoadRomLibrary(program.romLibrary, options.RomLibraryFile, log, wait);
    } else {
        // No settings yet. Until the first-run wizard exists the window opens on the built-in
        // defaults, with the library the wizard would have read.
        SetDefaults(options, program.appFolder, program.host, homeFolder, &hostInfo);
        LoadRomLibrary(program.romLibrary, options.RomLibraryFile, log, wait);
    }
    form.Load();
}

}  // namespace qv
