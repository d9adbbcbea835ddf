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

}  // namespace qv::bench
