#pragma once
#include <string>

#include "app/HostConventions.h"
#include "app/Options.h"

namespace qv {

// The text for a version or revision that cannot be determined; callers compare against it.
inline constexpr const char* kNotAvailable = "#N/A";

// Revisions cut out of the header lines of the support files. Each gives "#N/A" when its file
// is missing or unreadable or the marker is not where it belongs.

// HISCORE.DAT in the emulator folder: 3 characters after "Version " on the first line.
std::string GetHiscoreVer(const Options& options, const HostConventions& host);
// History file: revision and date, e.g. "0.78 (Updated 2003-11-02)". Reads only until both
// markers are found.
std::string GetHistoryVer(const Options& options);
// Information file: version and update date from its first line.
std::string GetMAMEInfoVer(const Options& options);
// Cheat file: the release date on its second line.
std::string GetCheatVer(const Options& options);
// ROM library: the revision on its third line.
std::string GetROMLibVer(const Options& options);

}  // namespace qv
