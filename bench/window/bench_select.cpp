// Selecting a game: the details panel's state is computed and the panel widget shows it, with a
// library of 45,000 games and 10,000 records of the user's own.
#include <benchmark/benchmark.h>

#include <QApplication>

#include "BenchData.h"
#include "app/Options.h"
#include "catalogue/GameTreeBuilder.h"
#include "launch/DetailsSelection.h"
#include "launch/GameLog.h"
#include "reference/MakeSpeakable.h"
#include "ui/DetailsPanel.h"

namespace {

void BM_SelectGame(benchmark::State& run) {
    using namespace qv;
    MyClass library, records;
    bench::FillRomLibrary(library, 45000);
    bench::FillGameRecords(records, 10000, 45000);
    Options options;
    options.ArtworkDir = (bench::BenchFolder() / "artwork").string();
    GameTree tree;
    BuildGameTree(tree, records, library, options, SnapshotIndex());

    // Two owned games far apart in the tree, selected in turn so every pass changes the panel.
    std::vector<NodeId> games;
    for (NodeId id = tree.Count() - 1; id >= 0 && games.size() < 2; --id)
        if (!tree.Node(id).Tag.empty() && records.exists(tree.Node(id).Tag) &&
            (games.empty() || tree.Node(id).Tag != tree.Node(games[0]).Tag))
            games.push_back(id);
    if (games.size() < 2) {
        run.SkipWithError("no owned games in the generated tree");
        return;
    }

    const HostConventions host = HostConventions::Posix();
    EnglishRegional regional;
    const std::string appFolder = bench::BenchFolder().string();
    SelectionSources sources{records, library, options, host, regional,
                             [&](const std::string& key) {
                                 return ReadFrameRate(GameLogPath(appFolder, key, host), regional)
                                     .text;
                             },
                             true};
    DetailsState state;
    DetailsPanel panel;
    panel.show();
    std::size_t next = 0;
    for (auto _ : run) {
        const SelectionResult result = SelectNode(state, tree, games[next], sources);
        panel.Render(state);
        benchmark::DoNotOptimize(MakeSpeakable(result.titleToSpeak));
        next = 1 - next;
    }
}
BENCHMARK(BM_SelectGame)->Unit(benchmark::kMicrosecond);

}  // namespace
