#pragma once
#include <filesystem>
#include <memory>
#include <string>

#include "app/ActivityLog.h"
#include "app/HostConventions.h"
#include "app/Options.h"
#include "catalogue/MyClass.h"
#include "platform/Clock.h"
#include "platform/EventYield.h"
#include "platform/Prompt.h"
#include "platform/Regional.h"

namespace qv {

// What lives for the whole run: the settings, the two game collections, the activity log and
// the services every window needs. Start-up creates one and passes it by reference; tests build
// one with fixed formats and a scripted prompt.
struct Program {
    std::filesystem::path appFolder;
    HostConventions host = HostConventions::Posix();
    std::unique_ptr<Regional> regional;
    std::unique_ptr<Clock> clock;
    std::unique_ptr<EventYield> yield;
    std::unique_ptr<Prompt> prompt;
    std::unique_ptr<ActivityLog> log;  // quorvane.log in appFolder

    Options options;
    MyClass romLibrary;   // mame_rom_lib.inc
    MyClass gameRecords;  // games.inc merged with the ROM folder
    std::string mameVersion;  // of the default emulator, "#N/A" when unknown

    // Creates the log once the services are set.
    void OpenLog() {
        log = std::make_unique<ActivityLog>(appFolder / "quorvane.log", *regional, *clock, *yield);
    }
};

}  // namespace qv
