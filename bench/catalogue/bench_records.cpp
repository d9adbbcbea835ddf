#include <benchmark/benchmark.h>

#include <string>

#include "BenchData.h"
#include "app/ActivityLog.h"
#include "app/TextFile.h"
#include "catalogue/GameRecords.h"
#include "catalogue/RomLibrary.h"
#include "platform/Clock.h"
#include "platform/EventYield.h"

namespace {

constexpr int kLibraryGames = 45000;
constexpr int kRecords = 10000;

const std::string& LibraryFile() {
    static const std::string path =
        qv::bench::WriteRomLibrary(qv::bench::BenchFolder(), kLibraryGames).string();
    return path;
}

// A log that writes nothing: the benchmarks measure reading, not the log file.
struct QuietLog {
    qv::EnglishRegional regional;
    qv::SystemClock clock;
    qv::NoEventYield yield;
    qv::ActivityLog log{qv::bench::BenchFolder() / "bench.log", regional, clock, yield};
};

// games.inc of 10,000 records and a ROM folder of 10,000 archives (500 of them new).
qv::Options RecordsOptions() {
    qv::Options options;
    options.GamesFile = qv::bench::WriteGamesFile(qv::bench::BenchFolder(), kRecords).string();
    options.DefaultROMdir =
        qv::bench::WriteRomFolder(qv::bench::BenchFolder(), kRecords, 500).string();
    return options;
}

// The floor for the library loader: the file's bytes read and its line ends found.
void BM_ReadAndSplitLines45k(benchmark::State& state) {
    const std::string& path = LibraryFile();
    for (auto _ : state) {
        const auto bytes = qv::ReadFileBytes(path);
        std::size_t lines = 0;
        qv::ForEachLine(*bytes, [&](std::string_view line) { lines += !line.empty(); });
        benchmark::DoNotOptimize(lines);
    }
}
BENCHMARK(BM_ReadAndSplitLines45k)->Unit(benchmark::kMillisecond);

void BM_LoadRomLibrary45k(benchmark::State& state) {
    const std::string& path = LibraryFile();
    QuietLog quiet;
    qv::NoStatusDisplay status;
    qv::MyClass library;
    for (auto _ : state) {
        state.PauseTiming();
        library = qv::MyClass();  // freeing the previous round is not part of a load
        state.ResumeTiming();
        qv::LoadRomLibrary(library, path, quiet.log, status);
        benchmark::DoNotOptimize(library.Count());
    }
    state.counters["entries"] = library.Count();
}
BENCHMARK(BM_LoadRomLibrary45k)->Unit(benchmark::kMillisecond);

void BM_LoadGameRecords10k(benchmark::State& state) {
    qv::Options options = RecordsOptions();
    const qv::HostConventions host = qv::HostConventions::Posix();
    QuietLog quiet;
    qv::NoStatusDisplay status;
    qv::MyClass records;
    qv::RecordCounts counts;
    for (auto _ : state) {
        state.PauseTiming();
        records = qv::MyClass();
        state.ResumeTiming();
        counts = qv::LoadGameRecords(records, options, host, quiet.log, status);
        benchmark::DoNotOptimize(counts);
    }
    state.counters["records"] = records.Count();
    state.counters["RomCount"] = counts.RomCount;
}
BENCHMARK(BM_LoadGameRecords10k)->Unit(benchmark::kMillisecond);

// Saving 10,000 unchanged records (each compared with the line it was read from).
void BM_SaveGameRecords10k(benchmark::State& state) {
    qv::Options options = RecordsOptions();
    const qv::HostConventions host = qv::HostConventions::Posix();
    QuietLog quiet;
    qv::NoStatusDisplay status;
    qv::MyClass records;
    qv::LoadGameRecords(records, options, host, quiet.log, status);
    options.GamesFile = (qv::bench::BenchFolder() / "games_saved.inc").string();
    for (auto _ : state) {
        const std::string error = qv::SaveGameRecords(records, options, host, quiet.regional,
                                                      quiet.log);
        benchmark::DoNotOptimize(error);
    }
}
BENCHMARK(BM_SaveGameRecords10k)->Unit(benchmark::kMillisecond);

}  // namespace
