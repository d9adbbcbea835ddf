#include "BenchData.h"

#include <fstream>

namespace qv::bench {

std::filesystem::path BenchFolder() {
    auto folder = std::filesystem::temp_directory_path() / "quorvane-bench";
    std::filesystem::create_directories(folder);
    return folder;
}

std::filesystem::path WriteRomLibrary(const std::filesystem::path& folder, int games) {
    static const char* kCategories[] = {"Maze", "Shooter", "Platform", "Sports", "Racing",
                                        "Puzzle", "Fighter", "Climbing", "Driving", "Casino",
                                        "Quiz", "Ball & Paddle"};
    const auto path = folder / ("mame_rom_lib_" + std::to_string(games) + ".inc");
    if (std::filesystem::exists(path)) return path;
    std::ofstream out(path, std::ios::binary);
    out << "# Generated ROM library\r\n#\r\n# Revision: 0.251\r\n";
    for (int i = 0; i < games; ++i) {
        out << "game" << i << "\t\"Generated Game " << i << "\"\t" << 1978 + i % 30
            << "\tMaker " << i % 400 << "\t" << (i % 7 ? "Yes" : "No") << "\tYes\t"
            << (i % 3 ? "Yes" : "No") << "\tYes\t" << kCategories[i % 12] << "\t.37b" << i % 16
            << "\r\n";
    }
    return path;
}

void FillRomLibrary(MyClass& library, int games) {
    static const char* kGenres[] = {"Maze", "Shooter", "Platform", "Sports", "Racing",
                                    "Puzzle", "Fighter", "Climbing", "Driving", "Casino",
                                    "Quiz", "Ball & Paddle"};
    library.Reserve(static_cast<std::size_t>(games));
    for (int i = 0; i < games; ++i) {
        const std::string romFile = "game" + std::to_string(i) + ".zip";
        MyClass* entry = library.Add(romFile);
        if (entry == nullptr) continue;
        entry->RomFile = romFile;
        entry->Title = "Generated Game " + std::to_string(i);
        entry->Year = std::to_string(1978 + i % 30);
        entry->Company = "Maker " + std::to_string(i % 400);
        entry->EmuWorking = i % 7 != 0;
        entry->Category = i % 50 == 0 ? "" : kGenres[i % 12];
    }
}

void FillGameRecords(MyClass& records, int owned, int libraryGames) {
    records.Reserve(static_cast<std::size_t>(owned));
    const int step = owned > 0 && libraryGames > owned ? libraryGames / owned : 1;
    for (int n = 0; n < owned; ++n) {
        const int game = n * step;
        const std::string romFile = "game" + std::to_string(game) + ".zip";
        MyClass* record = records.Add(romFile);
        if (record == nullptr) continue;
        record->RomFile = n % 97 == 0 ? "^" + romFile : romFile;
        record->Title = n % 41 == 0 ? romFile : "Generated Game " + std::to_string(game);
        record->Working = n % 9 != 0;
        record->Hidden = n % 23 == 0;
        record->Present = n % 13 != 0;
        record->LastPlayed = "Never";
    }
}

std::filesystem::path WriteSnapshotFolder(const std::filesystem::path& folder, int games,
                                          int every) {
    const auto snap = folder / ("snap_" + std::to_string(games) + "_" + std::to_string(every));
    if (std::filesystem::exists(snap / "done")) return snap;
    std::filesystem::create_directories(snap);
    for (int i = 0; i < games; i += every)
        std::ofstream(snap / ("game" + std::to_string(i) + ".png"), std::ios::binary);
    std::ofstream(snap / "done", std::ios::binary);
    return snap;
}

std::filesystem::path WriteGamesFile(const std::filesystem::path& folder, int records) {
    static const char* kRatings[] = {"", "*", "**", "***", "****", "*****"};
    const auto path = folder / ("games_" + std::to_string(records) + ".inc");
    if (std::filesystem::exists(path)) return path;
    std::ofstream out(path, std::ios::binary);
    for (int i = 0; i < records; ++i) {
        const std::string romFile = "game" + std::to_string(i) + ".zip";
        out << (i % 97 == 0 ? "^" : "") << romFile << "\t\"Generated Game " << i << "\"\t"
            << (i % 5 == 0 ? "Beat level<crlf><tab>" + std::to_string(i) : "") << "\t"
            << (i % 9 ? "True" : "False") << "\t" << (i % 17 ? "False" : "True") << "\t"
            << 1978 + i % 30 << "\tMaker " << i % 400 << "\t" << kRatings[i % 6] << "\t"
            << (i % 3 ? "Favourites" : "") << "\t" << (i % 23 ? "False" : "True") << "\t"
            << i % 300 << "\t" << (i % 4 ? "3/17/2004 3:30:00 PM" : "Never") << "\t"
            << (i % 11 ? "" : "640x480") << "\t" << i * 37 << "\r\n";
    }
    return path;
}

std::filesystem::path WriteRomFolder(const std::filesystem::path& folder, int archives,
                                     int first) {
    const auto roms =
        folder / ("roms_" + std::to_string(archives) + "_" + std::to_string(first));
    if (std::filesystem::exists(roms / "readme.txt")) return roms;
    std::filesystem::create_directories(roms);
    const std::string bytes(64, 'z');
    for (int i = first; i < first + archives; ++i) {
        std::ofstream archive(roms / ("game" + std::to_string(i) + ".zip"), std::ios::binary);
        archive.write(bytes.data(), static_cast<std::streamsize>(bytes.size()) - i % 32);
    }
    // Written last: its presence says the folder is complete.
    std::ofstream(roms / "readme.txt", std::ios::binary) << "Generated ROM folder\r\n";
    return roms;
}

}  // namespace qv::bench
