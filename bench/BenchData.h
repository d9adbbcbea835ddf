#pragma once
#include <filesystem>
#include <string>

namespace qv::bench {

// Generated data sets for the benchmarks, written once into a folder under /tmp.
std::filesystem::path BenchFolder();
// A mame_rom_lib.inc of `games` entries in a dozen categories; returns its path.
std::filesystem::path WriteRomLibrary(const std::filesystem::path& folder, int games);

}  // namespace qv::bench
