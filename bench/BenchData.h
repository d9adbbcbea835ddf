#pragma once
#include <filesystem>
#include <string>

#include "catalogue/MyClass.h"

namespace qv::bench {

// Generated data sets for the benchmarks, written once into a folder under /tmp.
std::filesystem::path BenchFolder();
// A mame_rom_lib.inc of `games` entries in a dozen categories; returns its path.
std::filesystem::path WriteRomLibrary(const std::filesystem::path& folder, int games);


// In memory: `games` library entries gameN.zip ("Generated Game N", a dozen categories).
void FillRomLibrary(MyClass& library, int games);
// In memory: `owned` records spread over the library's keys, with some missing archives,
// non-working, hidden, unidentified and removed ("^") games among them.
void FillGameRecords(MyClass& records, int owned, int libraryGames);
// A snapshot folder holding an (empty) gameN.png for every `every`-th game; returns its path.
std::filesystem::path WriteSnapshotFolder(const std::filesystem::path& folder, int games,
                                          int every);

// A games.inc of `records` records game0.zip.. (notes, ratings, plays, some removed "^"
// games); returns its path.
std::filesystem::path WriteGamesFile(const std::filesystem::path& folder, int records);
// A ROM folder of `archives` small archives game<first>.zip.. plus a readme.txt; returns its
// path.
std::filesystem::path WriteRomFolder(const std::filesystem::path& folder, int archives,
                                     int first);

}  // namespace qv::bench
