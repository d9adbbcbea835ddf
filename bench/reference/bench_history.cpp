#include <benchmark/benchmark.h>

#include <filesystem>
#include <fstream>
#include <string>

#include "BenchData.h"
#include "app/TextFile.h"
#include "reference/ReferenceIndex.h"

namespace {

constexpr int kEntries = 40000;

// A history file of about 40 MB: 40,000 entries of about 1 KB in the published layout, CR LF.
const std::filesystem::path& HistoryFile() {
    static const std::filesystem::path file = [] {
        const std::filesystem::path path = qv::bench::BenchFolder() / "history40mb.dat";
        if (std::filesystem::exists(path) && std::filesystem::file_size(path) > 39'000'000) return path;
        std::string bytes = "# history.dat generated for benchmarks\r\n";
        bytes.reserve(42'000'000);
        for (int i = 0; i < kEntries; ++i) {
            const std::string name = "game" + std::to_string(i);
            bytes += "$info=" + name + "," + name + "a,\r\n$bio\r\n\r\n";
            bytes += name + " (c) 1982 Maker.\r\n\r\n";
            for (int line = 0; line < 13; ++line)
                bytes += "  A line of the game's story that runs on for a while, number " +
                         std::to_string(line) + ".  \r\n";
            bytes += "# a comment\r\n- TRIVIA -\r\n\r\nSomething worth knowing.\r\n$end\r\n\r\n";
        }
        std::ofstream(path, std::ios::binary) << bytes;
        return path;
    }();
    return file;
}

const std::string kLastKey = "game" + std::to_string(kEntries - 1);

void BM_ReadHistoryBytes40MB(benchmark::State& state) {
    const auto& file = HistoryFile();
    for (auto _ : state) {
        auto bytes = qv::ReadFileBytes(file);
        benchmark::DoNotOptimize(bytes);
    }
    state.SetBytesProcessed(state.iterations() *
                            static_cast<std::int64_t>(std::filesystem::file_size(file)));
}
BENCHMARK(BM_ReadHistoryBytes40MB)->Unit(benchmark::kMillisecond);

void BM_HistoryLookupFirst40MB(benchmark::State& state) {
    const auto& file = HistoryFile();
    for (auto _ : state) {
        qv::ReferenceIndex index(qv::ReferenceKind::History);
        auto entry = index.Find(file, kLastKey);
        if (!entry || !entry->closed) state.SkipWithError("entry not found");
        benchmark::DoNotOptimize(entry);
    }
}
BENCHMARK(BM_HistoryLookupFirst40MB)->Unit(benchmark::kMillisecond);

void BM_HistoryLookupRepeat40MB(benchmark::State& state) {
    const auto& file = HistoryFile();
    qv::ReferenceIndex index(qv::ReferenceKind::History);
    index.Find(file, "game0");
    for (auto _ : state) {
        auto entry = index.Find(file, kLastKey);
        if (!entry || !entry->closed) state.SkipWithError("entry not found");
        benchmark::DoNotOptimize(entry);
    }
}
BENCHMARK(BM_HistoryLookupRepeat40MB)->Unit(benchmark::kMicrosecond);

}  // namespace
