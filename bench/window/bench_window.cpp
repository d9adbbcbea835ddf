// The game tree shown in the main window: 10,000 records of the user's own, and the all-games
// folder of a 45,000-game library, on the offscreen platform.
#include <benchmark/benchmark.h>

#include <QTreeView>

#include "BenchData.h"
#include "catalogue/GameTreeBuilder.h"
#include "platform/qt/QtEventYield.h"
#include "ui/GameTreeModel.h"
#include "ui/PlayForm.h"
#include "ui/Program.h"
#include "ui/TreePane.h"

namespace {

using namespace qv;

// Nobody answers questions in a benchmark.
class SilentPrompt final : public Prompt {
public:
    PromptAnswer Ask(const std::string&, const std::string&, PromptButtons, PromptIcon) override {
        return PromptAnswer::No;
    }
};

struct WindowBench {
    Program program;
    std::unique_ptr<PlayForm> form;
    QTreeView* view = nullptr;

    explicit WindowBench(int owned) {
        const auto folder = bench::BenchFolder();
        program.appFolder = folder / "window-home";
        std::filesystem::create_directories(program.appFolder);
        program.regional = std::make_unique<EnglishRegional>();
        program.clock = std::make_unique<SystemClock>();
        program.yield = std::make_unique<QtEventYield>();
        program.prompt = std::make_unique<SilentPrompt>();
        program.OpenLog();  // left disabled: nothing is written
        program.options.SnapDir = bench::WriteSnapshotFolder(folder, 45000, 3).string();
        program.options.ShowHidden = false;
        bench::FillRomLibrary(program.romLibrary, 45000);
        bench::FillGameRecords(program.gameRecords, owned, 45000);
        form = std::make_unique<PlayForm>(program, nullptr);
        form->resize(1280, 900);
        form->show();
        view = form->findChild<QTreeView*>("TreeView1");
    }

    // Opens a top-level folder and paints what the view shows.
    void ShowFolder(const char* key) {
        const QModelIndex folder = form->Pane().Model().IndexOf(form->Tree().Find(key));
        view->expand(folder);
        view->scrollTo(folder, QAbstractItemView::PositionAtTop);
        view->viewport()->repaint();
    }
};

void BM_ShowTreeInWindow10k(benchmark::State& run) {
    WindowBench bench(10000);
    for (auto _ : run) {
        bench.form->RebuildTree();
        bench.ShowFolder("alpha_");
    }
    run.counters["nodes"] = bench.form->Tree().Count();
}
BENCHMARK(BM_ShowTreeInWindow10k)->Unit(benchmark::kMillisecond);

void BM_ShowAllGamesInWindow45k(benchmark::State& run) {
    WindowBench bench(10000);
    for (auto _ : run) {
        run.PauseTiming();
        bench.form->RebuildTree();
        run.ResumeTiming();
        bench.form->AddAllEmulatedGames();
        bench.ShowFolder("MAME.ROMS");
    }
    run.counters["nodes"] = bench.form->Tree().Count();
}
BENCHMARK(BM_ShowAllGamesInWindow45k)->Unit(benchmark::kMillisecond);

}  // namespace
