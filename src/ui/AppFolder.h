#pragma once
#include <filesystem>
#include <string>

namespace qv {

// The application folder: $QUORVANE_HOME when set, else $XDG_DATA_HOME/quorvane, else
// ~/.local/share/quorvane. Empty variables count as unset.
std::filesystem::path ApplicationFolder(const char* quorvaneHome, const char* xdgDataHome,
                                        const std::string& homeFolder);

// Creates the folder and its logs folder; returns false when that fails.
bool PrepareApplicationFolder(const std::filesystem::path& folder);

}  // namespace qv
