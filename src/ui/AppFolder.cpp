#include "ui/AppFolder.h"

namespace qv {

std::filesystem::path ApplicationFolder(const char* quorvaneHome, const char* xdgDataHome,
                                        const std::string& homeFolder) {
    if (quorvaneHome && *quorvaneHome) return std::filesystem::path(quorvaneHome);
    if (xdgDataHome && *xdgDataHome) return std::filesystem::path(xdgDataHome) / "quorvane";
    return std::filesystem::path(homeFolder) / ".local" / "share" / "quorvane";
}

bool PrepareApplicationFolder(const std::filesystem::path& folder) {
    std::error_code error;
    std::filesystem::create_directories(folder / "logs", error);
    return std::filesystem::is_directory(folder / "logs");
}

}  // namespace qv
