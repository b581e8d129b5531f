// Random sequences of edits and relayouts: after every step the tree is well formed and the shown
// frames, with the static border frames, tile the window exactly. A failure names its seed.
#include "layout/LayoutDoubles.h"

#include <algorithm>
#include <gtest/gtest.h>
#include <random>

using namespace orvtest;

namespace {

class RandomLayout : public LayoutFixture {
public:
    explicit RandomLayout(unsigned seed)
        : rng(seed) {}

    int Pick(int n) { return std::uniform_int_distribution<int>(0, n - 1)(rng); }
    bool Coin() { return Pick(2) == 0; }

    Frame* MakeFrame() {
        std::string name = "f" + std::to_string(hosts.size());
        Frame* f = NewFrame(name, PointT(10 + Pick(20), 10 + Pick(20)));
        if (Pick(3) == 0) {
            Host(f).snaps = {PointT(Coin() ? 60 + Pick(100) : 0, Coin() ? 60 + Pick(100) : 0)};
        }
        Host(f).second = {{"type-" + name, "state"}};
        return f;
    }

    std::vector<Frame*> InTree() { return layout->GetFrames(); }

    // One random step; returns its description for the failure message.
    std::string Step() {
        std::vector<Frame*> inTree = InTree();
        switch (Pick(11)) {
        case 0:
        case 1: {
            Frame* target = inTree.empty() || Pick(5) == 0 ? nullptr : inTree[Pick(int(inTree.size()))];
            auto side = static_cast<LayoutManager::InsertionType>(Pick(4));
            Frame* f = MakeFrame();
            if (inTree.empty() && !layout->GetRootSplitter()->GetLeftOrTop()) {
                layout->SetRootFrame(f, layout->GetContainingRect());
                return "SetRootFrame " + Host(f).name;
            }
            layout->AddFrame(target, side, f);
            return "AddFrame " + (target ? Host(target).name : std::string("null")) + " side " +
                   std::to_string(side) + " " + Host(f).name;
        }
        case 2: {
            if (inTree.empty()) {
                return "nothing to remove";
            }
            Frame* f = inTree[Pick(int(inTree.size()))];
            bool keep = Coin(), remember = Coin();
            layout->RemoveFrame(f, keep, remember);
            if (keep && remember) {
                remembered.push_back(f);
            }
            return "RemoveFrame " + Host(f).name + (keep ? " keep" : "") + (remember ? " remember" : "");
        }
        case 3: {
            if (!remembered.empty() && Coin()) {
                std::size_t i = std::size_t(Pick(int(remembered.size())));
                Frame* f = remembered[i];
                remembered.erase(remembered.begin() + long(i));
                FrameDataProxy* proxy = layout->FindFrameForReanimation(f);
                if (!proxy) {
                    return "remembered frame's placeholder is gone";
                }
                layout->ReanimateFrame(proxy, f);
                layout->LayoutNewFrame(f);
                return "Reanimate " + Host(f).name;
            }
            if (hosts.empty()) {
                return "nothing to reanimate";
            }
            std::string type = "type-" + hosts[std::size_t(Pick(int(hosts.size())))]->name;
            FrameDataProxy* proxy = layout->FindFrameForReanimation(type);
            if (!proxy) {
                return "no placeholder for " + type;
            }
            Frame* f = MakeFrame();
            layout->ReanimateFrame(proxy, f);
            layout->LayoutNewFrame(f);
            return "Reanimate " + type + " as " + Host(f).name;
        }
        case 4:
            if (layout->HasMaximizedFrame() || inTree.empty() || Coin()) {
                layout->SetMaximizedFrame(nullptr);
                return "Restore";
            } else {
                Frame* f = inTree[Pick(int(inTree.size()))];
                layout->SetMaximizedFrame(f);
                return "Maximise " + Host(f).name;
            }
        case 5: {
            auto type = static_cast<LayoutManager::InsertionType>(Pick(4));
            Frame* f = Coin() ? NewFrame("static", PointT(20 + Pick(30), 20 + Pick(30))) : nullptr;
            if (Pick(4) == 0) {
                layout->EnableLeftStaticBorderAsSecondTopFrame(
                    !layout->GetEnableLeftStaticBorderAsSecondTopFrame());
            }
            layout->SetStaticBorderFrame(f, layout->GetContainingRect(), type, true);
            return "Static " + std::to_string(type) + (f ? " set" : " cleared");
        }
        case 6: {
            if (inTree.empty() || layout->HasMaximizedFrame()) {
                return "nothing to toggle";
            }
            Frame* f = inTree[Pick(int(inTree.size()))];
            Host(f).shown = !Host(f).shown;
            layout->ReLayout(Coin(), true, false);
            return "Toggle " + Host(f).name;
        }
        case 8: {
            // Previews must leave the tree and every real host as they were.
            if (inTree.empty()) {
                return "nothing to preview";
            }
            std::string dump = Dump();
            std::vector<std::pair<int, int>> calls;
            for (auto const& h : hosts) {
                calls.emplace_back(h->placements, h->showCalls);
            }
            Frame* f = inTree[Pick(int(inTree.size()))];
            Frame* n = MakeFrame();
            layout->PreviewAddFrame(Coin() ? f : nullptr, static_cast<LayoutManager::InsertionType>(Pick(4)),
                                    n);
            layout->PreviewRemoveFrame(f, Coin() ? inTree[Pick(int(inTree.size()))] : nullptr);
            calls.emplace_back(0, 0); // the new frame's host
            for (std::size_t i = 0; i < hosts.size(); ++i) {
                if (calls[i] != std::make_pair(hosts[i]->placements, hosts[i]->showCalls)) {
                    previewProblem = "a preview touched the real frame " + hosts[i]->name;
                }
            }
            if (Dump() != dump) {
                previewProblem = "a preview changed the real tree";
            }
            return "Preview around " + Host(f).name;
        }
        case 9: {
            // A user's drag of a bar (or a crossing), as the splitter dragger runs it.
            std::vector<Splitter*> bars = layout->GetSplitters();
            if (bars.empty()) {
                return "no bar to drag";
            }
            RectT bar = bars[std::size_t(Pick(int(bars.size())))]->GetDrawRect();
            PointT press(bar.left + bar.width / 2, bar.top + bar.height / 2);
            orvcore::utility::ScopedPtr<LayoutManager::Tracker> tracker;
            layout->AcquireTracker(press.x, press.y, tracker);
            if (!tracker) {
                return "no tracker";
            }
            layout->SetUserAdjustingSplitter(true);
            tracker->TrackBegin(press);
            RectT area = layout->GetContainingRect();
            for (int move = 0; move < 3; ++move) {
                tracker->TrackMove(PointT(area.left + Pick(area.width), area.top + Pick(area.height)));
            }
            tracker->TrackEnd();
            layout->SetUserAdjustingSplitter(false);
            return "Drag bar at " + std::to_string(press.x) + "," + std::to_string(press.y);
        }
        default: {
            RectT r(Pick(50), Pick(50), 400 + Pick(1200), 300 + Pick(900));
            bool distribute = Coin(), keep = Pick(4) == 0;
            layout->Layout(r, distribute, true, keep);
            return "Layout " + std::to_string(r.width) + "x" + std::to_string(r.height) +
                   (distribute ? " distribute" : "") + (keep ? " keep" : "");
        }
        }
    }

    // The rectangles that must tile the window: placed static frames and shown frames of the tree.
    std::string TilingProblem() {
        if (!previewProblem.empty()) {
            return previewProblem;
        }
        RectT bounds = layout->GetContainingRect();
        std::vector<RectT> pieces;
        bool secondTop = layout->GetEnableLeftStaticBorderAsSecondTopFrame();
        for (auto type :
             {LayoutManager::Top, LayoutManager::Left, LayoutManager::Bottom, LayoutManager::Right}) {
            Frame* f = layout->GetStaticBorderFrame(type);
            if (f && !(secondTop && type == LayoutManager::Right)) {
                pieces.push_back(RectOf(f));
            }
        }
        bool anyShown = false;
        for (Frame* f : InTree()) {
            if (Host(f).shown) {
                anyShown = true;
                pieces.push_back(RectOf(f));
            }
        }
        if (!anyShown) {
            return {};
        }
        long long area = 0;
        for (std::size_t i = 0; i < pieces.size(); ++i) {
            RectT const& p = pieces[i];
            if (p.width < 0 || p.height < 0 || !bounds.Contains(p)) {
                return "a piece lies outside the window";
            }
            area += (long long)p.width * p.height;
            for (std::size_t j = i + 1; j < pieces.size(); ++j) {
                if (p.Intersects(pieces[j])) {
                    return "two pieces overlap";
                }
            }
        }
        if (area != (long long)bounds.width * bounds.height) {
            return "the pieces leave a gap (area " + std::to_string(area) + " of " +
                   std::to_string((long long)bounds.width * bounds.height) + ")";
        }
        return {};
    }

    std::mt19937 rng;
    std::vector<Frame*> remembered;
    std::string previewProblem;
};

} // namespace

TEST(LayoutProperty, RandomEditsKeepTheTreeWellFormedAndTheWindowTiled) {
    for (unsigned seed = 1; seed <= 300; ++seed) {
        RandomLayout run(seed);
        run.layout->SetContainingRect(RectT(0, 0, 1000, 700));
        std::vector<std::string> history;
        for (int step = 0; step < 60; ++step) {
            history.push_back(run.Step());
            std::string problem = run.layout->StructureProblem();
            if (problem.empty()) {
                problem = run.TilingProblem();
            }
            if (!problem.empty()) {
                std::string log;
                for (std::string const& h : history) {
                    log += "  " + h + "\n";
                }
                FAIL() << "seed " << seed << ", step " << step << ": " << problem << "\nshape " << run.Shape()
                       << "\nsteps:\n"
                       << log;
            }
        }
    }
}

TEST(LayoutProperty, RememberingSubtreeReportsChangesNoResult) {
    // The same random runs with and without the per-pass memory of subtree reports must place every
    // frame identically after every step.
    auto run = [](unsigned seed, bool remember) {
        LayoutManager::SetReportCacheEnabled(remember);
        RandomLayout layout(seed);
        layout.layout->SetContainingRect(RectT(0, 0, 1000, 700));
        std::vector<std::string> trace;
        for (int step = 0; step < 60; ++step) {
            std::string line = layout.Step() + " ->";
            for (auto const& host : layout.hosts) {
                RectT r = host->Rect();
                line += " " + std::to_string(r.left) + "," + std::to_string(r.top) + "," +
                        std::to_string(r.width) + "," + std::to_string(r.height);
            }
            trace.push_back(line + " | " + layout.Dump());
        }
        LayoutManager::SetReportCacheEnabled(true);
        return trace;
    };
    for (unsigned seed = 1; seed <= 100; ++seed) {
        std::vector<std::string> plain = run(seed, false);
        std::vector<std::string> remembered = run(seed, true);
        for (std::size_t i = 0; i < plain.size(); ++i) {
            ASSERT_EQ(plain[i], remembered[i]) << "seed " << seed << ", step " << i;
        }
    }
}
