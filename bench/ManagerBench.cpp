// The workspace manager's start-up over a folder of 1000 workspace files, cold (no settings
// document: every file is read) and warm (valid cached records after a flush: no file is read),
// and one switch between two workspaces of 64 frames (save the outgoing one, load the other).
#include "BenchWorkspace.h"
#include "MedianCollector.h"
#include "host/core/FileUtils.h"
#include "host/core/PropList.h"
#include "host/core/PropListUtils.h"
#include "manager/Manager.h"
#include "persistence/WorkspaceDocument.h"

#include <benchmark/benchmark.h>
#include <cstdio>
#include <cstdlib>
#include <filesystem>

using namespace orvworkspace::workspace;
using orvbench::BenchWorkspace;

namespace {

std::u16string U16(std::filesystem::path const& p) {
    std::string s = p.string();
    return std::u16string(s.begin(), s.end());
}

// A preferences folder holding n small workspace files, removed afterwards.
struct Folders {
    explicit Folders(int n, orvworkspace::workspace::Workspace& workspace) {
        root = std::filesystem::temp_directory_path() / ("orv-manager-bench-" + std::to_string(::getpid()));
        std::filesystem::remove_all(root);
        std::filesystem::create_directories(root / "SavedWorkspaces");
        std::filesystem::create_directories(root / "ArchivedWorkspaces");
        saved = U16(root / "SavedWorkspaces");
        archived = U16(root / "ArchivedWorkspaces");
        settings = U16(root / "WSMgrCfg");
        for (int i = 0; i < n; ++i) {
            orvcore::proplist::PropList doc;
            std::string name = "Workspace " + std::to_string(i);
            SaveWorkspace(workspace, doc, std::u16string(name.begin(), name.end()));
            orvcore::proplist::utils::SavePropList(
                U16(root / "SavedWorkspaces" / ("W" + std::to_string(i) + ".xml")), doc);
        }
    }
    ~Folders() { std::filesystem::remove_all(root); }
    std::filesystem::path root;
    std::u16string saved, archived, settings;
};

void BM_InitializeCold(benchmark::State& state) {
    BenchWorkspace bench(4, {"plain"});
    Folders folders(int(state.range(0)), *bench.workspace);
    for (auto _ : state) {
        orvcore::utility::FileUtils::RemoveFile(folders.settings);
        Manager manager(*bench.workspace, folders.saved, folders.archived, folders.settings, nullptr, false);
        manager.Initialize();
        benchmark::DoNotOptimize(manager.GetNumberWorkspaces());
    }
}

void BM_InitializeWarm(benchmark::State& state) {
    BenchWorkspace bench(4, {"plain"});
    Folders folders(int(state.range(0)), *bench.workspace);
    {
        // A settings document with valid records for every file.
        orvcore::proplist::PropList empty;
        orvcore::proplist::utils::SavePropList(folders.settings, empty);
        Manager manager(*bench.workspace, folders.saved, folders.archived, folders.settings, nullptr, false);
        manager.Initialize();
        manager.FlushManagerSettings();
    }
    for (auto _ : state) {
        Manager manager(*bench.workspace, folders.saved, folders.archived, folders.settings, nullptr, false);
        manager.Initialize();
        if (manager.GetFilesRead() != 0) {
            state.SkipWithError("a warm start read workspace files");
            break;
        }
    }
}

void BM_SwitchWorkspaces(benchmark::State& state) {
    BenchWorkspace bench(int(state.range(0)), {"first", "second"});
    Folders folders(0, *bench.workspace);
    Manager manager(*bench.workspace, folders.saved, folders.archived, folders.settings, nullptr, false);
    manager.Initialize();
    manager.CreateUserWorkspace(u"A");
    manager.CreateUserWorkspace(u"B");
    bool toA = true;
    for (auto _ : state) {
        manager.SetCurrentWorkspace(toA ? u"A" : u"B");
        toA = !toA;
    }
}

BENCHMARK(BM_InitializeCold)
    ->Arg(1000)
    ->Repetitions(5)
    ->ReportAggregatesOnly(true)
    ->Unit(benchmark::kMillisecond);
BENCHMARK(BM_InitializeWarm)
    ->Arg(1000)
    ->Repetitions(5)
    ->ReportAggregatesOnly(true)
    ->Unit(benchmark::kMillisecond);
BENCHMARK(BM_SwitchWorkspaces)
    ->Arg(64)
    ->Repetitions(5)
    ->ReportAggregatesOnly(true)
    ->Unit(benchmark::kMillisecond);

} // namespace

int main(int argc, char** argv) {
    benchmark::Initialize(&argc, argv);
    orvbench::MedianCollector reporter;
    benchmark::RunSpecifiedBenchmarks(&reporter);
    double cold = reporter.Seconds("BM_InitializeCold/1000") * 1e3;
    double warm = reporter.Seconds("BM_InitializeWarm/1000") * 1e3;
    double sw = reporter.Seconds("BM_SwitchWorkspaces/64") * 1e3;
    std::printf("\nmanager, milliseconds (median):\n");
    std::printf("  Initialize over 1000 files, cold: %8.2f ms\n", cold);
    std::printf("  Initialize over 1000 files, warm: %8.2f ms\n", warm);
    if (warm > 0) {
        std::printf("  cold / warm: %.1f (target at least 10)\n", cold / warm);
    }
    std::printf("  switch between two workspaces of 64 frames: %8.2f ms\n", sw);
    benchmark::Shutdown();
    return 0;
}
