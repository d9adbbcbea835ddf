#pragma once
#include <cstdint>
#include <filesystem>
#include <optional>
#include <string>
#include <string_view>
#include <unordered_map>

#include "reference/ReferenceScan.h"

namespace qv {

// Answers lookups in a reference database without scanning it every time: the first lookup
// reads the file once and remembers where each game's entry starts; later lookups read only
// that entry. The positions are rebuilt when the file's path, size or modification time
// changes. Answers are exactly those of ScanReference.
class ReferenceIndex {
public:
    explicit ReferenceIndex(ReferenceKind kind) : kind_(kind) {}

    // Nothing when the file cannot be read.
    std::optional<EntryText> Find(const std::filesystem::path& file, std::string_view key);

    // How often the file was read whole to build the positions (for tests and tuning).
    int Builds() const { return builds_; }
    std::size_t Names() const { return starts_.size(); }

private:
    struct Stamp {
        std::filesystem::path path;
        std::uintmax_t size = 0;
        std::filesystem::file_time_type modified{};
        bool operator==(const Stamp&) const = default;
    };
    static std::optional<Stamp> StampOf(const std::filesystem::path& file);
    void Build(std::string_view bytes);
    std::optional<EntryText> ReadEntry(const std::filesystem::path& file,
                                       std::uint64_t start) const;

    ReferenceKind kind_;
    std::optional<Stamp> stamp_;
    // Game name as listed -> byte position of the line after its first "$info=" line.
    std::unordered_map<std::string, std::uint64_t> starts_;
    int builds_ = 0;
};

}  // namespace qv
