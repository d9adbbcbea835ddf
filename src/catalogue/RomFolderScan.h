#pragma once
#include <cstdint>
#include <string>
#include <vector>

namespace qv {

struct FolderFile {
    std::string name;
    std::int64_t size = 0;
};

// The files (not folders) of a folder with their sizes, sorted by name so that archives new to
// the records are added in a stable order. An unreadable or missing folder gives no files.
std::vector<FolderFile> ListFolderFiles(const std::string& folder);

}  // namespace qv
