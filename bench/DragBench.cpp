// One step of a drag, as the pointer delivers it (a mouse move through the headless desktop):
// - a tab drag over a 4K window of 64 frames with a drop-zone overlay shown, the pointer moving
//   between two zones of the target frame (the active zone changes every step and is repainted);
// - the same with the pointer crossing between two frames (the overlay is remade every step);
// - a splitter bar dragged one pixel to and fro over 256 frames: the root's bar and a bar between
//   two frames.
// Each step includes painting what it marked, as a display would.
// Prints medians in microseconds.
#include "BenchWorkspace.h"
#include "MedianCollector.h"
#include "workspace/DropZoneOverlay.h"
#include "workspace/TabDragger.h"

#include <benchmark/benchmark.h>
#include <cstdio>

using namespace orvworkspace::workspace;
using orvbench::BenchWorkspace;
using orvui::ui::Desktop;

namespace {

// What a display does after each event: paint whatever is marked in every window.
void Present() {
    Desktop& desktop = Desktop::Get();
    for (orvui::ui::NativeWindow w : desktop.EnumerateWindows()) {
        desktop.PaintDirty(w);
    }
}

// One pointer move, then the painting it caused.
void Step(PointT p) {
    Desktop::Get().MouseMove(p);
    Present();
}

PointT Middle(RectT const& r) {
    return PointT(r.left + r.width / 2, r.top + r.height / 2);
}

PointT InZone(DropZoneOverlayWindow const& overlay, DropZone::DropType type) {
    for (DropZone const& zone : overlay.GetZones()) {
        if (zone.GetType() == type) {
            long x = 0, y = 0;
            for (PointT const& p : zone.GetArea()) {
                x += p.x;
                y += p.y;
            }
            long n = long(zone.GetArea().size());
            return PointT(std::int32_t(x / n), std::int32_t(y / n));
        }
    }
    return PointT();
}

// Presses on the first frame's front tab and drags it over another frame until its overlay shows.
TopLevelWindow* StartTabDrag(BenchWorkspace& bench, WorkspaceFrame*& target) {
    TopLevelWindow* main = bench.workspace->GetMainTopLevelWindow();
    WorkspaceFrame* source = main->GetFrame(0);
    target = main->GetFrame(main->GetFrameCount() / 2);
    PointT tab = Middle(source->GetTabWell()->GetTabGlobalRect(0));
    Desktop::Get().MouseMove(tab);
    Desktop::Get().MouseDown(tab);
    Desktop::Get().MouseMove(PointT(tab.x + 10, tab.y + 10));
    Desktop::Get().MouseMove(Middle(target->UI_GetGlobalRect()));
    return main;
}

void BM_TabDragStepWithinOverlay(benchmark::State& state) {
    BenchWorkspace bench(int(state.range(0)), {"first", "second"});
    WorkspaceFrame* target = nullptr;
    TopLevelWindow* main = StartTabDrag(bench, target);
    DropZoneOverlayWindow* overlay = main->GetDropZoneOverlay();
    if (!overlay) {
        state.SkipWithError("no overlay over the target frame");
        return;
    }
    PointT a = InZone(*overlay, DropZone::Center);
    PointT b = InZone(*overlay, DropZone::Left);
    bool flip = false;
    for (auto _ : state) {
        flip = !flip;
        Step(flip ? a : b);
    }
    if (main->GetDropZoneOverlay() != overlay) {
        state.SkipWithError("the overlay did not stay");
    }
    Desktop::Get().KeyDown(orvui::ui::key::Escape);
}

void BM_TabDragStepAcrossFrames(benchmark::State& state) {
    BenchWorkspace bench(int(state.range(0)), {"first", "second"});
    WorkspaceFrame* target = nullptr;
    TopLevelWindow* main = StartTabDrag(bench, target);
    WorkspaceFrame* other = main->GetFrame(main->GetFrameCount() / 2 + 1);
    PointT a = Middle(target->UI_GetGlobalRect());
    PointT b = Middle(other->UI_GetGlobalRect());
    bool flip = false;
    for (auto _ : state) {
        flip = !flip;
        Step(flip ? b : a);
    }
    if (!main->GetDropZoneOverlay()) {
        state.SkipWithError("no overlay shown");
    }
    Desktop::Get().KeyDown(orvui::ui::key::Escape);
}

// Drags a bar one pixel to and fro: the root's bar (every frame changes size) or the bar between
// the last two frames made (two frames change).
void BM_SplitterDragStep(benchmark::State& state) {
    BenchWorkspace bench(int(state.range(0)), {"plain"});
    TopLevelWindow* main = bench.workspace->GetMainTopLevelWindow();
    bool root = state.range(1) != 0;
    LayoutManager* layout = main->GetLayoutManager();
    PointT bar;
    if (root) {
        // The root's bar splits the window in two halves, near its middle.
        RectT client = main->UI_GetGlobalClientRect();
        PointT middle(client.width / 2, client.height / 3);
        for (int dx = 0; dx < 40; ++dx) {
            for (int x : {middle.x - dx, middle.x + dx}) {
                if (bar == PointT() &&
                    layout->HitCheckCursor(x, middle.y) == LayoutManager::VerticalSplitter) {
                    bar = main->UI_LocalToGlobal(PointT(x, middle.y));
                }
            }
        }
    } else {
        // The last frame made was split off below or right of another: its bar is on its top or left.
        RectT r = main->GetFrame(main->GetFrameCount() - 1)->UI_GetGlobalRect();
        for (PointT p : {PointT(r.left - 2, r.top + r.height / 2), PointT(r.left + r.width / 2, r.top - 2)}) {
            PointT local = main->UI_GlobalToLocal(p);
            if (bar == PointT() && layout->HitCheckCursor(local.x, local.y) != LayoutManager::NoSplitter) {
                bar = p;
            }
        }
    }
    Present();
    Desktop::Get().MouseMove(bar);
    Desktop::Get().MouseDown(bar);
    if (!bench.workspace->GetTracker()) {
        state.SkipWithError("no bar under the pointer");
        return;
    }
    bool flip = false;
    PointT local = main->UI_GlobalToLocal(bar);
    bool vertical = layout->HitCheckCursor(local.x, local.y) == LayoutManager::VerticalSplitter;
    for (auto _ : state) {
        flip = !flip;
        int d = flip ? 10 : 11;
        Step(vertical ? PointT(bar.x + d, bar.y) : PointT(bar.x, bar.y + d));
    }
    Desktop::Get().MouseUp(bar);
}

BENCHMARK(BM_TabDragStepWithinOverlay)
    ->Arg(64)
    ->Repetitions(5)
    ->ReportAggregatesOnly(true)
    ->Unit(benchmark::kMicrosecond);
BENCHMARK(BM_TabDragStepAcrossFrames)
    ->Arg(64)
    ->Repetitions(5)
    ->ReportAggregatesOnly(true)
    ->Unit(benchmark::kMicrosecond);
BENCHMARK(BM_SplitterDragStep)
    ->Args({256, 1})
    ->Args({256, 0})
    ->Repetitions(5)
    ->ReportAggregatesOnly(true)
    ->Unit(benchmark::kMicrosecond);

} // namespace

int main(int argc, char** argv) {
    benchmark::Initialize(&argc, argv);
    orvbench::MedianCollector reporter;
    benchmark::RunSpecifiedBenchmarks(&reporter);
    double within = reporter.Seconds("BM_TabDragStepWithinOverlay/64") * 1e6;
    double across = reporter.Seconds("BM_TabDragStepAcrossFrames/64") * 1e6;
    double rootBar = reporter.Seconds("BM_SplitterDragStep/256/1") * 1e6;
    double leafBar = reporter.Seconds("BM_SplitterDragStep/256/0") * 1e6;
    std::printf("\none drag step, microseconds (median):\n");
    std::printf("  tab drag over 64 frames, overlay shown, zone changing: %8.1f us (target under 200)\n",
                within);
    std::printf("  tab drag over 64 frames, crossing frames (overlay remade): %8.1f us\n", across);
    std::printf("  splitter drag over 256 frames, the root's bar (every frame resized): %8.1f us\n", rootBar);
    std::printf("  splitter drag over 256 frames, a bar between two frames: %8.1f us\n", leafBar);
    benchmark::Shutdown();
    return 0;
}
