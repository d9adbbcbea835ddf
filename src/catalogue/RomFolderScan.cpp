#include "catalogue/RomFolderScan.h"

#include <algorithm>
#include <filesystem>
#include <system_error>

namespace qv {

std::vector<FolderFile> ListFolderFiles(const std::string& folder) {
    namespace fs = std::filesystem;
    std::vector<FolderFile> files;
    if (folder.empty()) return files;
    std::error_code error;
    fs::directory_iterator it(folder, fs::directory_options::skip_permission_denied, error);
    if (error) return files;
    const fs::directory_iterator end;
    while (it != end) {
        const fs::directory_entry& entry = *it;
        std::error_code entryError;
        // The listing already knows the entry's type; only its size costs a stat.
        if (entry.is_regular_file(entryError) && !entryError) {
            const std::uintmax_t size = entry.file_size(entryError);
            // A file that vanished between listing and stat is simply not there.
            if (!entryError)
                files.push_back(
                    {entry.path().filename().string(), static_cast<std::int64_t>(size)});
        }
        it.increment(error);
        if (error) return {};  // a listing that fails half-way is not trusted either
    }
    std::sort(files.begin(), files.end(),
              [](const FolderFile& a, const FolderFile& b) { return a.name < b.name; });
    return files;
}

}  // namespace qv
