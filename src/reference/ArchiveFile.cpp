#include "reference/ArchiveFile.h"

#include <system_error>

namespace qv {

std::optional<std::filesystem::path> ArchiveInRomFolder(const std::string& romDir,
                                                        const std::string& romFile) {
    namespace fs = std::filesystem;
    if (romDir.empty() || romFile.empty() || romFile == "." || romFile == "..") return std::nullopt;
    if (romFile.find('/') != std::string::npos || romFile.find('\\') != std::string::npos)
        return std::nullopt;
    const fs::path name(romFile);
    if (name.is_absolute() || name.has_root_name() || name.has_parent_path()) return std::nullopt;
    std::error_code error;
    const fs::path file = fs::path(romDir) / name;
    const fs::file_status status = fs::symlink_status(file, error);
    if (error || !fs::is_regular_file(status)) return std::nullopt;
    const fs::path folder = fs::canonical(romDir, error);
    if (error) return std::nullopt;
    const fs::path real = fs::canonical(file, error);
    if (error || real.parent_path() != folder) return std::nullopt;
    return real;
}

}  // namespace qv
