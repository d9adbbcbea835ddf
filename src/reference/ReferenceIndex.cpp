#include "reference/ReferenceIndex.h"

#include <fstream>
#include <system_error>

#include "app/TextFile.h"

namespace qv {
namespace {

// Collects the lines of a matched entry until its "$end", with the same rules as the scan.
class EntryCollector {
public:
    explicit EntryCollector(ReferenceKind kind) : kind_(kind) {
        entry_.matched = true;
        entry_.text = std::string(CollectedStart(kind));
    }
    // One raw line (without its line end); true once the entry is closed.
    bool Line(std::string_view raw) {
        std::string_view line = raw;
        if (!line.empty() && line.back() == '\r') line.remove_suffix(1);
        line = TrimSpaces(line);
        if (!line.empty() && line.front() == '#') return false;
        if (!line.empty() && line.front() == '$') {
            if (line == "$end") entry_.closed = true;
            return entry_.closed;
        }
        if (kind_ == ReferenceKind::History && line.empty() && entry_.text.empty()) return false;
        entry_.text.append(line);
        entry_.text.append("\r\n");
        return false;
    }
    EntryText Take() { return std::move(entry_); }

private:
    ReferenceKind kind_;
    EntryText entry_;
};

// Feeds the lines of bytes to the collector; returns true when it closed the entry.
bool FeedLines(std::string_view bytes, EntryCollector& collector) {
    std::size_t start = 0;
    while (start < bytes.size()) {
        std::size_t end = bytes.find('\n', start);
        if (end == std::string_view::npos) end = bytes.size();
        if (collector.Line(bytes.substr(start, end - start))) return true;
        start = end + 1;
    }
    return false;
}

}  // namespace

std::optional<ReferenceIndex::Stamp> ReferenceIndex::StampOf(const std::filesystem::path& file) {
    std::error_code error;
    Stamp stamp;
    stamp.path = file;
    stamp.size = std::filesystem::file_size(file, error);
    if (error) return std::nullopt;
    stamp.modified = std::filesystem::last_write_time(file, error);
    if (error) return std::nullopt;
    return stamp;
}

void ReferenceIndex::Build(std::string_view bytes) {
    starts_.clear();
    ++builds_;
    // Directive lines are rare, so jump from "$" to "$" and check that only spaces stand
    // between it and the start of its line.
    std::size_t at = 0;
    while ((at = bytes.find('$', at)) != std::string_view::npos) {
        std::size_t lineStart = at;
        while (lineStart > 0 && bytes[lineStart - 1] == ' ') --lineStart;
        if (lineStart != 0 && bytes[lineStart - 1] != '\n') {
            ++at;
            continue;
        }
        std::size_t end = bytes.find('\n', at);
        const std::size_t next = end == std::string_view::npos ? bytes.size() : end + 1;
        if (end == std::string_view::npos) end = bytes.size();
        std::string_view line = bytes.substr(at, end - at);
        if (!line.empty() && line.back() == '\r') line.remove_suffix(1);
        line = TrimSpaces(line);
        if (line.substr(0, 6) == "$info=") {
            std::string_view items = line.substr(6);
            std::size_t from = 0;
            while (true) {
                const std::size_t comma = items.find(',', from);
                const std::string_view item = items.substr(
                    from, comma == std::string_view::npos ? std::string_view::npos : comma - from);
                if (!item.empty()) starts_.emplace(std::string(item), next);  // first one wins
                if (comma == std::string_view::npos) break;
                from = comma + 1;
            }
        }
        at = next;
    }
}

std::optional<EntryText> ReferenceIndex::ReadEntry(const std::filesystem::path& file,
                                                   std::uint64_t start) const {
    std::ifstream in(file, std::ios::binary);
    if (!in) return std::nullopt;
    in.seekg(static_cast<std::streamoff>(start));
    if (!in) return std::nullopt;
    EntryCollector collector(kind_);
    std::string pending;
    std::string chunk(64 * 1024, '\0');
    while (true) {
        in.read(chunk.data(), static_cast<std::streamsize>(chunk.size()));
        const std::streamsize got = in.gcount();
        if (got <= 0) break;
        pending.append(chunk.data(), static_cast<std::size_t>(got));
        const std::size_t lastBreak = pending.rfind('\n');
        if (lastBreak == std::string::npos) continue;
        if (FeedLines(std::string_view(pending).substr(0, lastBreak + 1), collector))
            return collector.Take();
        pending.erase(0, lastBreak + 1);
    }
    if (!pending.empty()) collector.Line(pending);  // a last line without a line end
    return collector.Take();
}

std::optional<EntryText> ReferenceIndex::Find(const std::filesystem::path& file,
                                              std::string_view key) {
    const std::optional<Stamp> stamp = StampOf(file);
    if (!stamp) return std::nullopt;
    if (!stamp_ || !(*stamp_ == *stamp)) {
        const std::optional<std::string> bytes = ReadFileBytes(file);
        if (!bytes) return std::nullopt;
        Build(*bytes);
        stamp_ = stamp;
        EntryText entry;
        entry.text = std::string(CollectedStart(kind_));
        const auto found = starts_.find(std::string(key));
        if (found == starts_.end()) return entry;
        EntryCollector collector(kind_);
        FeedLines(std::string_view(*bytes).substr(found->second), collector);
        return collector.Take();
    }
    const auto found = starts_.find(std::string(key));
    if (found == starts_.end()) {
        EntryText entry;
        entry.text = std::string(CollectedStart(kind_));
        return entry;
    }
    return ReadEntry(file, found->second);
}

}  // namespace qv
