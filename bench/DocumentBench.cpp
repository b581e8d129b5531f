// Saving and restoring a workspace of 16 to 1024 tabbed frames (two tabs each) on the headless
// desktop: as a property-list document in memory (restoring into the same workspace, so every panel
// comes back from the reuse pool) and as a file. Prints microseconds and document bytes (medians of
// five repetitions) and how save plus restore grows from 256 to 1024 frames.
#include "BenchWorkspace.h"
#include "MedianCollector.h"
#include "host/core/PropList.h"
#include "host/core/PropListUtils.h"
#include "host/ui/Desktop.h"
#include "persistence/WorkspaceDocument.h"
#include "workspace/Workspace.h"

#include <benchmark/benchmark.h>
#include <cstdio>
#include <filesystem>
#include <map>

using namespace orvworkspace::workspace;
using orvcore::proplist::PropList;
using orvui::ui::Desktop;

using orvbench::BenchWorkspace;

namespace {

std::map<int, std::size_t> documentBytes;

void BM_SaveAndRestore(benchmark::State& state) {
    int n = int(state.range(0));
    BenchWorkspace bench(n, {"first", "second"});
    if (bench.frames != static_cast<unsigned long>(n)) {
        state.SkipWithError("the layout refused frames");
        return;
    }
    for (auto _ : state) {
        PropList doc;
        SaveWorkspace(*bench.workspace, doc, u"Bench");
        RestoreWorkspace(*bench.workspace, doc, true, true, false);
    }
    PropList doc;
    SaveWorkspace(*bench.workspace, doc, u"Bench");
    documentBytes[n] = orvcore::proplist::utils::DocumentText(doc).size();
}

// Saving alone is one linear walk of the tree into a new document; how it grows from 256 to 1024
// frames shows what the machine's caches add to any linear pass over a workspace that size.
void BM_Save(benchmark::State& state) {
    int n = int(state.range(0));
    BenchWorkspace bench(n, {"first", "second"});
    for (auto _ : state) {
        PropList doc;
        SaveWorkspace(*bench.workspace, doc, u"Bench");
        benchmark::DoNotOptimize(doc);
    }
}

void BM_SaveAndRestoreFile(benchmark::State& state) {
    int n = int(state.range(0));
    BenchWorkspace bench(n, {"first", "second"});
    std::filesystem::path file = std::filesystem::temp_directory_path() / "orv-document-bench.xml";
    std::string s = file.string();
    std::u16string path(s.begin(), s.end());
    for (auto _ : state) {
        PropList doc;
        SaveWorkspace(*bench.workspace, doc, u"Bench");
        orvcore::proplist::utils::SavePropList(path, doc);
        PropList loaded;
        orvcore::proplist::utils::LoadPropList(path, loaded, true);
        RestoreWorkspace(*bench.workspace, loaded, true, true, false);
    }
    std::filesystem::remove(file);
}

BENCHMARK(BM_SaveAndRestore)
    ->RangeMultiplier(4)
    ->Range(16, 1024)
    ->Repetitions(5)
    ->ReportAggregatesOnly(true)
    ->Unit(benchmark::kMicrosecond);
BENCHMARK(BM_Save)->Arg(256)->Arg(1024)->Repetitions(5)->ReportAggregatesOnly(true)->Unit(
    benchmark::kMicrosecond);
BENCHMARK(BM_SaveAndRestoreFile)
    ->RangeMultiplier(4)
    ->Range(16, 1024)
    ->Repetitions(5)
    ->ReportAggregatesOnly(true)
    ->Unit(benchmark::kMicrosecond);

} // namespace

int main(int argc, char** argv) {
    benchmark::Initialize(&argc, argv);
    orvbench::MedianCollector reporter;
    benchmark::RunSpecifiedBenchmarks(&reporter);
    auto us = [&](char const* kind, int n) {
        return reporter.Seconds(std::string(kind) + "/" + std::to_string(n)) * 1e6;
    };
    std::printf("\nsave + restore, microseconds (median) and document bytes:\n");
    for (int n : {16, 64, 256, 1024}) {
        std::printf("  %5d frames: document %10.1f us, file %10.1f us, %9zu bytes\n", n,
                    us("BM_SaveAndRestore", n), us("BM_SaveAndRestoreFile", n), documentBytes[n]);
    }
    std::printf("256 frames, document: %.2f ms (target at most 9)\n", us("BM_SaveAndRestore", 256) / 1e3);
    if (us("BM_SaveAndRestore", 256) > 0) {
        std::printf("document(1024) / document(256): %.2f (linear is 4)\n",
                    us("BM_SaveAndRestore", 1024) / us("BM_SaveAndRestore", 256));
    }
    if (us("BM_Save", 256) > 0) {
        std::printf("save alone, a linear walk, for scale: %.0f us and %.0f us, ratio %.2f\n",
                    us("BM_Save", 256), us("BM_Save", 1024), us("BM_Save", 1024) / us("BM_Save", 256));
    }
    benchmark::Shutdown();
    return 0;
}
