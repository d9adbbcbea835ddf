#include <benchmark/benchmark.h>

#include <string>

#include "BenchData.h"
#include "catalogue/GameTreeBuilder.h"
#include "reference/TreeSearch.h"

namespace {

constexpr int kLibraryGames = 45000;

const std::string& SnapFolder() {
    static const std::string folder =
        qv::bench::WriteSnapshotFolder(qv::bench::BenchFolder(), kLibraryGames, 7).string();
    return folder;
}

// A rebuild as the window does it: list the snapshot folder, then build the user's tree.
void BM_BuildGameTree10k(benchmark::State& state) {
    qv::MyClass library;
    qv::bench::FillRomLibrary(library, kLibraryGames);
    qv::MyClass records;
    qv::bench::FillGameRecords(records, 10000, kLibraryGames);
    qv::Options options;
    const std::string& snap = SnapFolder();
    qv::GameTree tree;
    for (auto _ : state) {
        const qv::SnapshotIndex snapshots(snap);
        qv::BuildGameTree(tree, records, library, options, snapshots);
        benchmark::DoNotOptimize(tree.Count());
    }
    state.counters["nodes"] = tree.Count();
}
BENCHMARK(BM_BuildGameTree10k)->Unit(benchmark::kMillisecond);

void BM_AddAllEmulatedGames45k(benchmark::State& state) {
    qv::MyClass library;
    qv::bench::FillRomLibrary(library, kLibraryGames);
    qv::MyClass records;
    qv::bench::FillGameRecords(records, 10000, kLibraryGames);
    const qv::SnapshotIndex snapshots(SnapFolder());
    qv::NoStatusDisplay status;
    qv::NoEventYield yield;
    qv::GameTree tree;
    for (auto _ : state) {
        state.PauseTiming();
        tree.Clear();
        state.ResumeTiming();
        const bool added = qv::AddAllEmulatedGames(tree, library, records, snapshots, status, yield);
        benchmark::DoNotOptimize(added);
    }
    state.counters["nodes"] = tree.Count();
}
BENCHMARK(BM_AddAllEmulatedGames45k)->Unit(benchmark::kMillisecond);

// The only match is the last of 55,000 nodes: one full pass.
void BM_SearchTree55k(benchmark::State& state) {
    qv::GameTree tree;
    const qv::NodeId root = tree.Add(qv::NoNode, "MAME.ROMS", "All MAME ROMs", "fclosed", "fopen");
    for (int i = 1; i < 54999; ++i)
        tree.Add(root, "MAME.ROMS_game" + std::to_string(i) + ".zip",
                 "Generated Game " + std::to_string(i) + " (Set " + std::to_string(i % 5) + ")");
    tree.Add(root, "MAME.ROMS_needle.zip", "Galaxy Needle Wars");
    for (auto _ : state) {
        qv::TreeSearch search;
        const qv::SearchOutcome outcome = search.Search(tree, 0, "needle");
        if (outcome.select != tree.Count() - 1) state.SkipWithError("wrong match");
        benchmark::DoNotOptimize(outcome);
    }
    state.counters["nodes"] = tree.Count();
}
BENCHMARK(BM_SearchTree55k)->Unit(benchmark::kMillisecond);

}  // namespace
