#include "app/SupportFileVersions.h"

#include <fstream>
#include <vector>

#include "app/TextFile.h"

namespace qv {

namespace {

// Reads lines one at a time, so a large file is read only as far as needed.
class LineReader {
public:
    explicit LineReader(const std::string& path) {
        if (FileExists(path)) in_.open(path, std::ios::binary);
    }
    bool IsOpen() const { return in_.is_open() && in_.good(); }
    // False at the end of the file (or on a read error).
    bool Next(std::string& line) {
        if (!std::getline(in_, line)) return false;
        if (!line.empty() && line.back() == '\r') line.pop_back();
        return true;
    }

private:
    std::ifstream in_;
};

// Up to count characters from a 0-based position; empty past the end of the text.
std::string Mid(const std::string& text, std::size_t from,
                std::size_t count = std::string::npos) {
    if (from >= text.size()) return {};
    return text.substr(from, count);
}

// The first count lines; lines past the end of the file stay empty. Empty when unreadable.
std::vector<std::string> FirstLines(const std::string& path, std::size_t count,
                                    std::size_t* linesRead = nullptr) {
    std::vector<std::string> lines(count);
    LineReader reader(path);
    std::size_t read = 0;
    if (reader.IsOpen())
        while (read < count && reader.Next(lines[read])) ++read;
    if (linesRead) *linesRead = read;
    return lines;
}

// The text of length count right after the marker (plus skip), when the line holds it.
bool CutAfter(const std::string& line, std::string_view marker, std::size_t offset,
              std::size_t count, std::string& out) {
    const auto at = line.find(marker);
    if (at == std::string::npos) return false;
    out = Mid(line, at + offset, count);
    return true;
}

}  // namespace

std::string GetHiscoreVer(const Options& options, const HostConventions& host) {
    std::string path = host.Join(options.MamePath, "HISCORE.DAT");
    // Where case matters the file is just as likely to be spelt in lower case.
    if (!host.caseInsensitivePaths && !FileExists(path))
        path = host.Join(options.MamePath, "hiscore.dat");
    std::string result = kNotAvailable;
    const auto lines = FirstLines(path, 1);
    if (!lines[0].empty()) CutAfter(lines[0], "Version ", 8, 3, result);
    return result;
}

std::string GetCheatVer(const Options& options) {
    std::size_t read = 0;
    const auto lines = FirstLines(options.CheatsFile, 2, &read);
    const std::string& line = read >= 2 ? lines[1] : lines[0];
    std::string result = kNotAvailable;
    if (!line.empty()) CutAfter(line, "Release Date: ", 14, 11, result);
    return result;
}

std::string GetMAMEInfoVer(const Options& options) {
    const auto lines = FirstLines(options.MameInfoFile, 1);
    const std::string& line = lines[0];
    std::string result = kNotAvailable;
    if (line.empty()) return result;
    CutAfter(line, "MAMEINFO.DAT ", 14, 5, result);
    std::string updated;
    if (CutAfter(line, "Last Update: ", 14, std::string::npos, updated))
        result += " (Updated " + updated + ")";
    return result;
}

std::string GetHistoryVer(const Options& options) {
    LineReader reader(options.HistoryFile);
    if (!reader.IsOpen()) return kNotAvailable;
    std::string revision, date, line;
    bool found = false;
    while ((revision.empty() || date.empty()) && reader.Next(line)) {
        found = CutAfter(line, "Revision: ", 10, 5, revision) || found;
        found = CutAfter(line, "Last update: ", 13, 10, date) || found;
    }
    if (!found) return kNotAvailable;
    return revision + " (Updated " + date + ")";
}

std::string GetROMLibVer(const Options& options) {
    const auto lines = FirstLines(options.RomLibraryFile, 3);
    std::string rest;
    if (lines[2].empty() || !CutAfter(lines[2], "# Revision: ", 12, std::string::npos, rest))
        return kNotAvailable;
    return std::string(TrimSpaces(rest));
}

}  // namespace qv
