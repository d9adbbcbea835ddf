#pragma once
#include <filesystem>
#include <string>
#include <string_view>

namespace qv::test {

// A fresh folder under the system's temporary folder, removed with everything in it.
class TempDir {
public:
    TempDir();
    ~TempDir();
    TempDir(const TempDir&) = delete;
    TempDir& operator=(const TempDir&) = delete;

    const std::filesystem::path& path() const { return path_; }
    std::filesystem::path operator/(std::string_view name) const { return path_ / name; }

    // Writes bytes to a file below the folder (creating folders) and returns its path.
    std::filesystem::path Write(std::string_view relative, std::string_view bytes) const;
    // Reads a file below the folder; empty when missing.
    std::string Read(std::string_view relative) const;

private:
    std::filesystem::path path_;
};

std::string ReadAll(const std::filesystem::path& path);

}  // namespace qv::test
