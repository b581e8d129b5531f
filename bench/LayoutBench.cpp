// Relayout (a window resize) of balanced trees and of degenerate chains of 16 to 1024 frames, with
// hosts that do nothing. Prints nanoseconds per frame (medians of five repetitions), and how chain
// relayout grows from 256 to 1024 frames (linear growth is 4).
#include "MedianCollector.h"
#include "layout/Frame.h"
#include "layout/LayoutManager.h"
#include "layout/ProxyMgrHostInterface.h"
#include "layout/Splitter.h"

#include <benchmark/benchmark.h>
#include <cstdio>
#include <deque>
#include <memory>

using namespace orvworkspace::workspace;

namespace {

class NullFrameHost : public FrameHostInterface {
public:
    void SetSizeAndPos(FrameZones const& z) override { rect = z[FrameZones::Whole]; }
    void ShowFrame(bool) override {}
    bool IsFrameShown() const override { return true; }
    PointT GetMinimumSize() const override { return PointT(4, 4); }
    void GetSnapSizes(std::vector<PointT>&) const override {}
    RectT FrameRectToTabPanelRect(RectT const& r) const override { return r; }
    RectT FrameRectToTabWellRect(RectT const& r) const override { return r; }
    RectT GetTabPanelFrameGlobalRect() const override { return rect; }
    RectT GetFrameLocalRect() const override { return rect; }
    RectT GetTabWellGlobalRect() const override { return rect; }
    void* GetHostData() override { return nullptr; }
    void DoGetTabData(TabDataList&, TabDataList&, TabDataList&) const override {}
    RectT rect;
};

// A layout over n frames, built directly as a balanced tree or as a chain in which every splitter
// holds one frame and the rest of the chain, orientations alternating.
class BenchLayout {
public:
    BenchLayout(int n, bool chain)
        : layout(std::make_unique<LayoutManager>(&window)) {
        auto* root = new Splitter(layout.get(), false);
        LayoutManagerElement* top = chain ? Chain(n, true) : Balanced(n, true);
        root->SetLeftOrTop(top);
        top->SetParent(root);
        layout->SwapRoot(root);
        layout->Layout(RectT(0, 0, 1920, 1080), false, true, false);
    }
    ~BenchLayout() { layout.reset(); }

    LayoutManagerElement* NewFrame() {
        hosts.push_back(std::make_unique<NullFrameHost>());
        frames.push_back(std::make_unique<Frame>(layout.get(), hosts.back().get()));
        return frames.back().get();
    }
    LayoutManagerElement* Join(bool vertical, LayoutManagerElement* a, LayoutManagerElement* b) {
        auto* s = new Splitter(layout.get(), vertical);
        s->SetLeftOrTop(a);
        s->SetRightOrBottom(b);
        a->SetParent(s);
        b->SetParent(s);
        return s;
    }
    LayoutManagerElement* Balanced(int n, bool vertical) {
        if (n == 1) {
            return NewFrame();
        }
        return Join(vertical, Balanced(n / 2, !vertical), Balanced(n - n / 2, !vertical));
    }
    LayoutManagerElement* Chain(int n, bool vertical) {
        LayoutManagerElement* tail = NewFrame();
        for (int i = 1; i < n; ++i) {
            tail = Join(vertical, NewFrame(), tail);
            vertical = !vertical;
        }
        return tail;
    }

    ProxyMgrHostInterface window; // layout on, nothing else
    std::deque<std::unique_ptr<NullFrameHost>> hosts;
    std::deque<std::unique_ptr<Frame>> frames;
    std::unique_ptr<LayoutManager> layout;
};

void Relayout(benchmark::State& state, bool chain) {
    int n = int(state.range(0));
    BenchLayout bench(n, chain);
    bool wide = false;
    for (auto _ : state) {
        wide = !wide;
        bench.layout->Layout(RectT(0, 0, wide ? 1920 : 1600, wide ? 1080 : 900), true, true, false);
    }
    state.counters["ns/frame"] = benchmark::Counter(
        double(state.iterations()) * n, benchmark::Counter::kIsRate | benchmark::Counter::kInvert);
}

void BM_RelayoutBalanced(benchmark::State& state) {
    Relayout(state, false);
}
void BM_RelayoutChain(benchmark::State& state) {
    Relayout(state, true);
}

// One move of the main bar of a balanced layout of 256 frames during a drag, snapping on.
void BM_TrackMove(benchmark::State& state) {
    BenchLayout bench(256, false);
    bench.layout->SetUserAdjustingSplitter(true);
    RectT bar = bench.layout->GetSplitters().front()->GetDrawRect();
    PointT press(bar.left + bar.width / 2, bar.top + bar.height / 2);
    orvcore::utility::ScopedPtr<LayoutManager::Tracker> tracker;
    bench.layout->AcquireTracker(press.x, press.y, tracker);
    tracker->TrackBegin(press);
    int step = 0;
    for (auto _ : state) {
        step = (step + 1) % 64;
        tracker->TrackMove(PointT(press.x - 32 + step, press.y));
    }
    tracker->TrackEnd();
}
BENCHMARK(BM_TrackMove)->Repetitions(5)->ReportAggregatesOnly(true)->Unit(benchmark::kMicrosecond);

// One what-if add beside a frame in the middle of a balanced layout of 256 frames.
void BM_PreviewAddFrame(benchmark::State& state) {
    BenchLayout bench(256, false);
    auto* target = static_cast<Frame*>(bench.frames[128].get());
    NullFrameHost newHost;
    Frame newFrame(nullptr, &newHost);
    for (auto _ : state) {
        benchmark::DoNotOptimize(bench.layout->PreviewAddFrame(target, LayoutManager::Right, &newFrame));
    }
}
BENCHMARK(BM_PreviewAddFrame)->Repetitions(5)->ReportAggregatesOnly(true)->Unit(benchmark::kMicrosecond);

BENCHMARK(BM_RelayoutBalanced)
    ->RangeMultiplier(4)
    ->Range(16, 1024)
    ->Repetitions(5)
    ->ReportAggregatesOnly(true);
BENCHMARK(BM_RelayoutChain)->RangeMultiplier(4)->Range(16, 1024)->Repetitions(5)->ReportAggregatesOnly(true);

} // namespace

int main(int argc, char** argv) {
    benchmark::Initialize(&argc, argv);
    orvbench::MedianCollector reporter;
    benchmark::RunSpecifiedBenchmarks(&reporter);
    std::printf("\nrelayout, nanoseconds per frame (median):\n");
    for (char const* kind : {"BM_RelayoutBalanced", "BM_RelayoutChain"}) {
        std::printf("%-20s", kind + 3);
        for (int n : {16, 64, 256, 1024}) {
            std::printf("  %5d: %8.1f", n,
                        reporter.Seconds(std::string(kind) + "/" + std::to_string(n)) * 1e9 / n);
        }
        std::printf("\n");
    }
    auto chain = [&](int n) { return reporter.Seconds("BM_RelayoutChain/" + std::to_string(n)); };
    if (chain(256) > 0) {
        std::printf("chain(1024) / chain(256): %.2f (target at most 5; linear is 4)\n",
                    chain(1024) / chain(256));
    }
    std::printf("balanced(1024): %.1f ns per frame (target at most 150)\n",
                reporter.Seconds("BM_RelayoutBalanced/1024") * 1e9 / 1024);
    std::printf("TrackMove over 256 frames: %.1f us (target under 100)\n",
                reporter.Seconds("BM_TrackMove/") * 1e6);
    std::printf("PreviewAddFrame over 256 frames: %.1f us (target under 200)\n",
                reporter.Seconds("BM_PreviewAddFrame/") * 1e6);
    benchmark::Shutdown();
    return 0;
}
