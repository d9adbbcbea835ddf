#pragma once
#include <string>

namespace qv {

// How paths, executables and the command interpreter look on the host. The program runs with
// Posix(); Windows() keeps the classic forms producible (and tested) for a Windows build.
struct HostConventions {
    char separator = '/';
    bool caseInsensitivePaths = false;  // path settings are upper-cased only where case is moot
    bool executablesHaveExtension = false;  // ".EXE" names and the ".EXE" tests
    bool startThroughShell = false;     // "Cmd.exe /C " / "Command.com /C " prefix

    static HostConventions Posix() { return {}; }
    static HostConventions Windows() { return {'\\', true, true, true}; }

    // folder + separator + name, without doubling a separator that is already there.
    std::string Join(const std::string& folder, const std::string& name) const {
        if (folder.empty()) return name;
        if (folder.back() == separator) return folder + name;
        return folder + separator + name;
    }
};

}  // namespace qv
