// Relayout on a resize of a host's main window holding 64, 256 and 1024 real tabbed frames (one
// panel each, split into a balanced tree) on the headless desktop: the window is resized through
// the desktop, as a user's drag of its border would, and every frame, tab well and panel follows.
// Prints milliseconds per resize (medians of five repetitions) and how they grow from 256 to 1024.
#include "BenchWorkspace.h"
#include "MedianCollector.h"
#include "host/ui/Desktop.h"
#include "workspace/Workspace.h"

#include <benchmark/benchmark.h>
#include <cstdio>

using namespace orvworkspace::workspace;
using orvui::ui::Desktop;

using orvbench::BenchWorkspace;

namespace {

void BM_ResizeMainWindow(benchmark::State& state) {
    BenchWorkspace bench(int(state.range(0)), {"plain"});
    if (bench.frames != static_cast<unsigned long>(state.range(0))) {
        state.SkipWithError("the layout refused frames");
        return;
    }
    bool large = true;
    for (auto _ : state) {
        large = !large;
        Desktop::Get().SetWindowRect(bench.app, large ? BenchWorkspace::Large : BenchWorkspace::Smaller);
    }
}
BENCHMARK(BM_ResizeMainWindow)
    ->Arg(64)
    ->Arg(256)
    ->Arg(1024)
    ->Repetitions(5)
    ->ReportAggregatesOnly(true)
    ->Unit(benchmark::kMillisecond);

} // namespace

int main(int argc, char** argv) {
    benchmark::Initialize(&argc, argv);
    orvbench::MedianCollector reporter;
    benchmark::RunSpecifiedBenchmarks(&reporter);
    auto ms = [&](int n) { return reporter.Seconds("BM_ResizeMainWindow/" + std::to_string(n)) * 1e3; };
    std::printf("\nmain window resize, milliseconds (median):\n");
    for (int n : {64, 256, 1024}) {
        std::printf("  %5d frames: %8.3f ms  (%6.2f us per frame)\n", n, ms(n), ms(n) * 1e3 / n);
    }
    std::printf("1024 frames: %.2f ms (target at most 6)\n", ms(1024));
    if (ms(256) > 0) {
        std::printf("resize(1024) / resize(256): %.2f (linear is 4)\n", ms(1024) / ms(256));
    }
    benchmark::Shutdown();
    return 0;
}
