#pragma once
#include <string>

#include "app/HostConventions.h"
#include "app/Options.h"

namespace qv {

// The emulator builds the executable label cycles through, in order. On a host without
// executable extensions the names are "mamepp", "fastmame", "mameanalog", "mame"; otherwise
// "MAMEPP.EXE" ... "MAME.EXE". Names compare with exact case.
struct ExecutableBuild {
    std::string exec;    // the MameExec value
    std::string label;   // executable label text, e.g. "MAMEPP"
    std::string spoken;  // e.g. "Mame pentium pro"
};

// The build named by mameExec, or nullptr for a name outside the cycle.
const ExecutableBuild* FindExecutableBuild(const std::string& mameExec, const HostConventions& host);

// The name after mameExec in the cycle (the last one wraps to the first); a name outside the
// cycle is returned unchanged.
std::string NextExecutable(const std::string& mameExec, const HostConventions& host);

// What the executable selector shows after a refresh.
struct ExecutableDisplay {
    std::string label;   // new label text; empty: leave the label as it is (unknown build)
    std::string spoken;  // speak this when `present`; empty for an unknown build
    bool present = false;  // MamePath + MameExec exists: label green, IPlayN shown, IPlayX hidden;
                           // otherwise label red, IPlayN hidden, IPlayX shown
};
ExecutableDisplay DescribeExecutable(const Options& options, const HostConventions& host);

// The version label: "Using " + mameExec with every ".EXE" removed + " Version: " + version.
std::string VersionLabelText(const std::string& mameExec, const std::string& version);

}  // namespace qv
