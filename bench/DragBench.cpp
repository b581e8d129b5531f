// One step of a drag, as the pointer delivers it (a mouse move through the headless desktop):
// - a tab drag over a 4K window of 64 frames with a drop-zone overlay shown, the pointer moving
//   between two zones of the target frame (the active zone changes every step and is repainted);
// - the same with the pointer crossing between two frames (the overlay is remade every step);
// - a splitter bar dragged one pixel to and fro over 256 frames (both sides laid out again).
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
        Desktop::Get().MouseMove(flip ? a : b);
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
        Desktop::Get().MouseMove(flip ? b : a);
    }
    if (!main->GetDropZoneOverlay()) {
        state.SkipWithError("no overlay shown");
    }
    Desktop::Get().KeyDown(orvui::ui::key::Escape);
}

void BM_SplitterDragStep(benchmark::State& state) {
    BenchWorkspace bench(int(state.range(0)), {"plain"});
    TopLevelWindow* main = bench.workspace->GetMainTopLevelWindow();
    // The root's bar lies between the two halves of the balanced tree: on the edge of frame 0.
    WorkspaceFrame* first = main->GetFrame(0);
    RectT r = first->UI_GetGlobalRect();
    PointT bar(r.Right() + 1, r.top + r.height / 2);
    Desktop::Get().MouseMove(bar);
    Desktop::Get().MouseDown(bar);
    if (!bench.workspace->GetTracker()) {
        state.SkipWithError("no bar under the pointer");
        return;
    }
    bool flip = false;
    for (auto _ : state) {
        flip = !flip;
        Desktop::Get().MouseMove(PointT(bar.x + (flip ? 40 : 41), bar.y));
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
    ->Arg(256)
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
    double splitter = reporter.Seconds("BM_SplitterDragStep/256") * 1e6;
    std::printf("\none drag step, microseconds (median):\n");
    std::printf("  tab drag over 64 frames, overlay shown, zone changing: %8.1f us (target under 200)\n",
                within);
    std::printf("  tab drag over 64 frames, crossing frames (overlay remade): %8.1f us\n", across);
    std::printf("  splitter drag over 256 frames: %8.1f us\n", splitter);
    benchmark::Shutdown();
    return 0;
}
