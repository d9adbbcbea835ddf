#pragma once
#include <filesystem>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace qv {

// Text files are bytes: lines end in CR LF or LF when read and CR LF when written, and every
// byte of a line is kept so that a load and a save give back the same file.

// The whole file, or nothing when it cannot be read.
std::optional<std::string> ReadFileBytes(const std::filesystem::path& path);

// Calls onLine(line) for every line of bytes (without its CR LF / LF). A last line without a
// line end is still a line; an empty file has no lines.
template <typename OnLine>
void ForEachLine(std::string_view bytes, OnLine&& onLine) {
    std::size_t start = 0;
    while (start < bytes.size()) {
        std::size_t end = bytes.find('\n', start);
        const bool last = end == std::string_view::npos;
        if (last) end = bytes.size();
        std::size_t stop = end;
        if (stop > start && bytes[stop - 1] == '\r') --stop;
        onLine(bytes.substr(start, stop - start));
        if (last) break;
        start = end + 1;
    }
}

std::vector<std::string> SplitLines(std::string_view bytes);

// Spaces (only the space character) removed at both ends.
std::string_view TrimSpaces(std::string_view text);

// Writes the content to a temporary file beside the target and renames it over the target, so
// a failed or interrupted save leaves the previous file as it was. Returns an error text, or
// an empty text on success.
std::string WriteFileAtomically(const std::filesystem::path& path, std::string_view content);

// Appends one line (plus CR LF); returns false when the file cannot be opened or written.
bool AppendLine(const std::filesystem::path& path, std::string_view line);

// ASCII upper / lower case; other bytes unchanged.
std::string UpperAscii(std::string_view text);
std::string LowerAscii(std::string_view text);

// A file (not a folder) exists at the path.
bool FileExists(const std::filesystem::path& path);

// "Yes" or "No".
inline const char* YesNo(bool flag) { return flag ? "Yes" : "No"; }

// Bytes shown to a person: valid UTF-8 stays as it is, anything else is read as Windows-1252.
std::string DisplayUtf8(std::string_view bytes);

}  // namespace qv
