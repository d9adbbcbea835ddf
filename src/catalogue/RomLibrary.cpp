#include "catalogue/RomLibrary.h"

#include <cmath>

#include "app/TextFile.h"
#include "catalogue/TabColumns.h"

namespace qv {
namespace {

constexpr std::size_t kLibraryColumns = 11;

// A library flag: "Yes", "YES" and "yes, imperfect" are true; "Y", "No" and "" are false.
bool LibraryFlag(std::string_view text) {
    if (text.size() < 3) return false;
    auto upper = [](char c) { return c >= 'a' && c <= 'z' ? static_cast<char>(c - 'a' + 'A') : c; };
    return upper(text[0]) == 'Y' && upper(text[1]) == 'E' && upper(text[2]) == 'S';
}

// About how many lines the file has, from the lines in its first 64 KiB (library lines are
// much alike), with a little to spare. Counting every line end would cost a third of reading.
std::size_t EstimateLines(std::string_view bytes) {
    const std::string_view sample = bytes.substr(0, 65536);
    std::size_t lines = 0;
    for (std::size_t at = sample.find('\n'); at != std::string_view::npos;
         at = sample.find('\n', at + 1))
        ++lines;
    if (lines == 0) return bytes.size() / 64 + 16;
    const double perByte = static_cast<double>(lines) / static_cast<double>(sample.size());
    return static_cast<std::size_t>(perByte * static_cast<double>(bytes.size()) * 1.0625) + 16;
}

void ReadLibraryLine(MyClass& library, std::string_view line, std::string& key) {
    TabColumns<kLibraryColumns> columns(line);
    key.assign(columns[0]);
    key += ".zip";
    MyClass* entry = library.Add(key);
    // A later line for the same game updates the entry that is already there.
    if (!entry) entry = library.Item(key);
    if (!entry) return;
    entry->RomFile = key;
    if (columns.Has(1)) columns.AssignWithoutQuotes(entry->Title, 1);
    if (columns.Has(2)) columns.AssignWithoutQuotes(entry->Year, 2);
    if (columns.Has(3)) columns.AssignWithoutQuotes(entry->Company, 3);
    if (columns.Has(4)) entry->EmuWorking = LibraryFlag(columns[4]);
    if (columns.Has(5)) entry->EmuColors = LibraryFlag(columns[5]);
    if (columns.Has(6)) entry->EmuSound = LibraryFlag(columns[6]);
    if (columns.Has(7)) entry->EmuScreenFlip = LibraryFlag(columns[7]);
    if (columns.Has(8)) entry->Category.assign(columns[8]);
    if (columns.Has(9)) entry->MameVersion.assign(columns[9]);
    if (columns.Has(10)) entry->Extra.assign(columns[10]);
}

}  // namespace

void LoadRomLibrary(MyClass& library, const std::string& libraryFile, ActivityLog& log,
                    StatusDisplay& status) {
    log.WriteLog("Loading MAME Info...");
    status.ShowStatusIfVisible("Loading MAME ROMs Library ...");
    if (!FileExists(libraryFile)) {
        log.WriteLog("Cannot find MAME ROMs Library: " + libraryFile);
        return;
    }
    const auto bytes = ReadFileBytes(libraryFile);
    if (!bytes) {
        log.WriteLog("Cannot read MAME ROMs Library: " + libraryFile);
        return;
    }
    // At most one entry per line; reserving avoids regrowing the key index while loading.
    library.Reserve(static_cast<std::size_t>(library.Count()) + EstimateLines(*bytes));
    std::string key;
    ForEachLine(*bytes, [&](std::string_view raw) {
        const std::string_view line = TrimSpaces(raw);
        if (line.empty() || line.front() == '#') return;
        ReadLibraryLine(library, line, key);
    });
}

std::string SizeText(std::int64_t bytes, const Regional& regional) {
    if (bytes < 1) return "0 KB";
    const double kilobytes = static_cast<double>(bytes) / 1024.0;
    if (kilobytes < 1000.0) {
        const double whole = std::floor(kilobytes - 0.001) + 1.0;
        return regional.FormatNumber(whole, 0) + " KB";
    }
    return regional.FormatNumber(static_cast<double>(bytes) / 1048576.0, 1) + " MB";
}

}  // namespace qv
