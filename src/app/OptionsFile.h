#pragma once
#include <filesystem>
#include <string>

#include "app/ActivityLog.h"
#include "app/HostConventions.h"
#include "app/Options.h"
#include "platform/HostInfo.h"
#include "platform/StatusDisplay.h"

namespace qv {

// Built-in defaults. homeFolder is the user's home (for the ~/mame/... defaults on this host);
// hostInfo, when given, feeds the private-network switch of the download addresses.
void SetDefaults(Options& options, const std::filesystem::path& appFolder,
                 const HostConventions& host, const std::string& homeFolder,
                 HostInfo* hostInfo = nullptr);

// Reads config.inc into options; fields without a line keep their values. A stray line stops
// the reading there (logged with "Globals" / "LoadOptions").
void LoadOptions(Options& options, const std::filesystem::path& configFile, ActivityLog& log,
                 StatusDisplay& status);

// The fixed 70-line layout. Written through a temporary file, so a failed write keeps the old
// file. Returns an error text (also logged with "Globals" / "WriteOptions"), empty on success.
std::string WriteOptions(const Options& options, const std::filesystem::path& configFile,
                         const HostConventions& host, const Regional& regional,
                         const Clock& clock, ActivityLog& log);

// The text WriteOptions writes (CR LF after every line), for callers that only need the text.
std::string OptionsFileText(const Options& options, const HostConventions& host,
                            const std::string& updatedText);

}  // namespace qv
