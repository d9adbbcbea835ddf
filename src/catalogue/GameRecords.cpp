#include "catalogue/GameRecords.h"

#include <charconv>
#include <cstdio>
#include <filesystem>
#include <limits>

#include "app/TextFile.h"
#include "catalogue/RomFolderScan.h"
#include "catalogue/TabColumns.h"

namespace qv {
namespace {

constexpr std::size_t kRecordColumns = 14;

bool IsReadableFile(const std::string& path) {
    std::FILE* file = std::fopen(path.c_str(), "rb");
    if (!file) return false;
    std::fclose(file);
    return true;
}

// A games.inc boolean: any letter case of "TRUE" is true, everything else false.
bool RecordFlag(std::string_view text) {
    if (text.size() != 4) return false;
    return UpperAscii(text) == "TRUE";
}

// A plain decimal number that fits T, or nothing: a column that is not such a number leaves
// the field as it was.
template <typename T>
bool ReadInteger(std::string_view text, T& field) {
    text = TrimSpaces(text);
    if (!text.empty() && text.front() == '+') text.remove_prefix(1);
    if (text.empty()) return false;
    long long value = 0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), value);
    if (error != std::errc() || end != text.data() + text.size()) return false;
    if (value < std::numeric_limits<T>::min() || value > std::numeric_limits<T>::max())
        return false;
    field = static_cast<T>(value);
    return true;
}

// Sets a record's stored fields from one trimmed, non-empty games.inc line.
void SetRecordFields(MyClass& record, std::string_view line) {
    const TabColumns<kRecordColumns> columns(line);
    record.RomFile.assign(columns[0]);
    if (columns[1].empty())
        record.Title.assign(columns[0]);
    else
        AssignWithoutQuotes(record.Title, columns[1]);
    record.Notes.assign(columns[2]);
    record.Working = RecordFlag(columns[3]);
    record.Mouse = RecordFlag(columns[4]);
    record.Year.assign(columns[5]);
    AssignWithoutQuotes(record.Company, columns[6]);
    record.Rating.assign(columns[7]);
    record.Categories.assign(columns[8]);
    record.Hidden = RecordFlag(columns[9]);
    ReadInteger(columns[10], record.Plays);
    record.LastPlayed.assign(columns[11].empty() ? std::string_view("Never") : columns[11]);
    record.Resolution.assign(TrimSpaces(columns[12]));
    ReadInteger(columns[13], record.PlaySeconds);
    record.Present = false;
}

bool EndsWithZip(const std::string& name) {
    return name.size() >= 4 && LowerAscii(std::string_view(name).substr(name.size() - 4)) == ".zip";
}

// Reads games.inc into a fresh collection; counts every line that is not a comment.
MyClass ReadGamesFile(std::string_view bytes, std::int32_t& romCount) {
    MyClass records;
    records.Reserve(bytes.size() / 48 + 16);
    ForEachLine(bytes, [&](std::string_view raw) {
        const std::string_view line = TrimSpaces(raw);
        if (!line.empty() && line.front() == '#') return;
        ++romCount;
        if (line.empty()) return;
        const std::string_view key = TabColumns<1>(line)[0];
        // A second line for the same archive cannot be kept beside the first; the first wins.
        MyClass* record = records.Add(std::string(key));
        if (!record) return;
        SetRecordFields(*record, line);
        record->StoredLine.assign(raw);
    });
    return records;
}

// Merges the ROM folder into the records: sizes and presence for known archives, new records
// for new archives, the bytes of every file counted except archives of removed games.
void ScanRomFolder(MyClass& records, const std::string& romDir, ActivityLog& log,
                   RecordCounts& counts) {
    const std::vector<FolderFile> files = ListFolderFiles(romDir);
    log.WriteLog("Checking " + std::to_string(files.size()) + " ROMs ... ");
    for (const FolderFile& file : files) {
        MyClass* record = nullptr;
        if (EndsWithZip(file.name)) {
            record = records.Item(file.name);
            if (!record) {
                if (records.exists("^" + file.name)) continue;
                record = records.Add(file.name);
                if (record) {
                    record->RomFile = file.name;
                    record->Title = file.name;
                    ++counts.RomCount;
                }
            }
        }
        if (record) {
            record->FileSize = file.size;
            record->Present = true;
        }
        counts.RomBytes += file.size;
    }
}

// A text column with the separators of the file replaced, so a stray tab or line break in a
// field can never split a record or shift its columns.
void AppendColumn(std::string& line, std::string_view text) {
    for (char c : text) line += (c == '\t' || c == '\r' || c == '\n') ? ' ' : c;
}

// Notes carry their line breaks and tabs as "<crlf>" and "<tab>"; anything still unescaped
// (a lone CR or LF) is written the same way rather than breaking the record.
void AppendNotes(std::string& line, std::string_view notes) {
    for (std::size_t i = 0; i < notes.size(); ++i) {
        const char c = notes[i];
        if (c == '\t') {
            line += "<tab>";
        } else if (c == '\r' || c == '\n') {
            if (c == '\r' && i + 1 < notes.size() && notes[i + 1] == '\n') ++i;
            line += "<crlf>";
        } else {
            line += c;
        }
    }
}

// The line a record is saved as: its stored line while the record still matches it.
std::string LineToSave(const MyClass& record, const Regional& regional) {
    std::string line = GameRecordLine(record, regional);
    if (record.StoredLine.empty()) return line;
    MyClass asRead;
    SetRecordFields(asRead, TrimSpaces(record.StoredLine));
    if (GameRecordLine(asRead, regional) == line) return record.StoredLine;
    return line;
}

std::string WithoutCarets(const std::string& text) {
    std::string out;
    for (char c : text)
        if (c != '^') out += c;
    return out;
}

}  // namespace

RecordCounts LoadGameRecords(MyClass& records, const Options& options,
                             const HostConventions& host, ActivityLog& log,
                             StatusDisplay& status) {
    (void)host;
    RecordCounts counts;
    if (FileExists(options.GamesFile)) {
        log.WriteLog("Loading ROM Info (" + options.GamesFile + ") ...");
        status.ShowStatusIfVisible("Loading information for local ROMs ...");
        if (const auto bytes = ReadFileBytes(options.GamesFile)) {
            records = ReadGamesFile(*bytes, counts.RomCount);
        } else {
            // Keep what is in memory rather than replace the user's records with nothing.
            log.WriteLog("Cannot read " + options.GamesFile);
        }
    } else {
        log.WriteLog(options.GamesFile + " does not exist.  Creating new.");
    }
    // Sizes and presence describe this scan only; records kept from before start unknown.
    for (MyClass& record : records) {
        record.Present = false;
        record.FileSize = 0;
    }
    ScanRomFolder(records, options.DefaultROMdir, log, counts);
    return counts;
}

std::string GameRecordLine(const MyClass& record, const Regional& regional) {
    std::string line;
    line.reserve(128 + record.Notes.size());
    const auto text = [&](std::string_view value) {
        AppendColumn(line, value);
        line += '\t';
    };
    text(record.RomFile);
    text(record.Title);
    AppendNotes(line, record.Notes);
    line += '\t';
    text(regional.BooleanText(record.Working));
    text(regional.BooleanText(record.Mouse));
    text(record.Year);
    text(record.Company);
    text(record.Rating);
    text(record.Categories);
    text(regional.BooleanText(record.Hidden));
    text(std::to_string(record.Plays));
    text(record.LastPlayed);
    text(record.Resolution);
    line += std::to_string(record.PlaySeconds);
    return line;
}

std::string SaveGameRecords(const MyClass& records, const Options& options,
                            const HostConventions& host, const Regional& regional,
                            ActivityLog& log) {
    log.WriteLog("Saving ROMs Library (" + options.GamesFile + ") ...");
    std::string content;
    content.reserve(static_cast<std::size_t>(records.Count()) * 128);
    for (const MyClass& record : records) {
        // A removed game is forgotten once its archive is gone.
        if (!record.RomFile.empty() && record.RomFile.front() == '^' &&
            !FileExists(host.Join(options.DefaultROMdir, WithoutCarets(record.RomFile))))
            continue;
        content += LineToSave(record, regional);
        content += "\r\n";
    }
    // A games.inc that exists but cannot be read (its permissions, say) was never loaded, so
    // the records in memory are not the user's: replacing it would lose them all.
    std::string error;
    if (std::filesystem::exists(options.GamesFile) && !IsReadableFile(options.GamesFile))
        error = "Cannot read " + options.GamesFile + "; it was left as it is.";
    else
        error = WriteFileAtomically(options.GamesFile, content);
    if (!error.empty()) log.LogError("PlayForm", "SaveGameRecords", PendingError{75, error});
    return error;
}

}  // namespace qv
