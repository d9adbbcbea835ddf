#pragma once
#include <filesystem>
#include <optional>
#include <string>

namespace qv {

// The archive of a record as a file on disk, only when it is a regular file (not a link)
// directly inside the ROM folder. A name that leads elsewhere ("../x.zip", an absolute path,
// a folder part, a symbolic link) gives nothing, so nothing outside the folder is ever deleted.
std::optional<std::filesystem::path> ArchiveInRomFolder(const std::string& romDir,
                                                        const std::string& romFile);

}  // namespace qv
