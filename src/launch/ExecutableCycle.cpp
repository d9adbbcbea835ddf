#include "launch/ExecutableCycle.h"

#include <array>

#include "app/TextFile.h"

namespace qv {
namespace {

const std::array<ExecutableBuild, 4>& Builds(const HostConventions& host) {
    static const std::array<ExecutableBuild, 4> withExtension{{
        {"MAMEPP.EXE", "MAMEPP", "Mame pentium pro"},
        {"FASTMAME.EXE", "FASTMAME", "Fast Mame"},
        {"MAMEANALOG.EXE", "MAMEANALOG", "Mame analog"},
        {"MAME.EXE", "MAME", "Mame"},
    }};
    static const std::array<ExecutableBuild, 4> bare{{
        {"mamepp", "MAMEPP", "Mame pentium pro"},
        {"fastmame", "FASTMAME", "Fast Mame"},
        {"mameanalog", "MAMEANALOG", "Mame analog"},
        {"mame", "MAME", "Mame"},
    }};
    return host.executablesHaveExtension ? withExtension : bare;
}

}  // namespace

const ExecutableBuild* FindExecutableBuild(const std::string& mameExec,
                                           const HostConventions& host) {
    for (const ExecutableBuild& build : Builds(host))
        if (build.exec == mameExec) return &build;
    return nullptr;
}

std::string NextExecutable(const std::string& mameExec, const HostConventions& host) {
    const auto& builds = Builds(host);
    for (std::size_t i = 0; i < builds.size(); ++i)
        if (builds[i].exec == mameExec) return builds[(i + 1) % builds.size()].exec;
    return mameExec;
}

ExecutableDisplay DescribeExecutable(const Options& options, const HostConventions& host) {
    ExecutableDisplay display;
    if (const ExecutableBuild* build = FindExecutableBuild(options.MameExec, host)) {
        display.label = build->label;
        display.spoken = build->spoken;
    }
    display.present = !options.MameExec.empty() &&
                      FileExists(host.Join(options.MamePath, options.MameExec));
    return display;
}

std::string VersionLabelText(const std::string& mameExec, const std::string& version) {
    std::string name;
    for (std::size_t i = 0; i < mameExec.size();) {
        if (mameExec.compare(i, 4, ".EXE") == 0) {
            i += 4;
        } else {
            name += mameExec[i++];
        }
    }
    return "Using " + name + " Version: " + version;
}

}  // namespace qv
