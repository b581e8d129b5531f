// Test doubles of the layout's two host interfaces, and a fixture that owns a layout with frames.
#pragma once

#include "layout/Frame.h"
#include "layout/FrameDataProxy.h"
#include "layout/LayoutManager.h"
#include "layout/LayoutManagerHostInterface.h"
#include "layout/Splitter.h"

#include <deque>
#include <memory>
#include <sstream>
#include <string>

namespace orvtest {

using namespace orvworkspace::workspace;

// A window whose switches tests set, counting the calls it receives.
class FakeWindow : public LayoutManagerHostInterface {
public:
    void SuspendRedraws(bool suspend) override { suspendDepth += suspend ? 1 : -1; }
    void UpdateNow() override { ++updates; }
    bool GetSplitterSnappingEnabled() override { return snapping; }
    bool GetLayoutEnabled() override { return layoutEnabled; }
    long GetTabMinHeight() override { return tabMinHeight; }
    long GetTabMinWidth() override { return tabMinWidth; }

    bool snapping = true;
    bool layoutEnabled = true;
    long tabMinHeight = 0;
    long tabMinWidth = 0;
    int updates = 0;
    int suspendDepth = 0;
};

// A frame widget with a settable minimum size, snap sizes and shown flag, recording what it was given.
class FakeFrameHost : public FrameHostInterface {
public:
    explicit FakeFrameHost(std::string n, PointT min = PointT(20, 20))
        : name(std::move(n))
        , minimum(min) {}

    void SetSizeAndPos(FrameZones const& z) override {
        zones = z;
        ++placements;
    }
    void ShowFrame(bool show) override {
        shown = show;
        ++showCalls;
        if (showLog) {
            showLog->push_back(name + (show ? "+" : "-"));
        }
    }
    bool IsFrameShown() const override { return shown; }
    PointT GetMinimumSize() const override { return minimum; }
    void GetSnapSizes(std::vector<PointT>& sizes) const override {
        sizes.insert(sizes.end(), snaps.begin(), snaps.end());
    }
    RectT FrameRectToTabPanelRect(RectT const& r) const override { return r.Inset(1, 1); }
    RectT FrameRectToTabWellRect(RectT const& r) const override { return RectT(r.left, r.top, r.width, 24); }
    RectT GetTabPanelFrameGlobalRect() const override { return zones[FrameZones::Whole].Offset(100, 100); }
    RectT GetFrameLocalRect() const override { return zones[FrameZones::Whole]; }
    RectT GetTabWellGlobalRect() const override {
        return FrameRectToTabWellRect(GetTabPanelFrameGlobalRect());
    }
    void* GetHostData() override { return this; }
    void DoGetTabData(TabDataList& a, TabDataList& b, TabDataList& c) const override {
        a = first;
        b = second;
        c = third;
    }

    RectT Rect() const { return zones[FrameZones::Whole]; }

    std::string name;
    PointT minimum;
    std::vector<PointT> snaps;
    bool shown = true;
    FrameZones zones;
    int placements = 0;
    int showCalls = 0;
    std::vector<std::string>* showLog = nullptr;
    TabDataList first, second, third;
};

// Owns a window double, frames with their hosts and the layout; frames are declared before the
// layout so they outlive it, as frame widgets outlive their window's layout.
class LayoutFixture {
public:
    LayoutFixture()
        : layout(std::make_unique<LayoutManager>(&window)) {}

    Frame* NewFrame(std::string const& name, PointT min = PointT(20, 20)) {
        hosts.push_back(std::make_unique<FakeFrameHost>(name, min));
        frames.push_back(std::make_unique<Frame>(layout.get(), hosts.back().get()));
        return frames.back().get();
    }
    static FakeFrameHost& Host(Frame* f) { return *static_cast<FakeFrameHost*>(f->GetHostInterface()); }
    static RectT RectOf(Frame* f) { return Host(f).Rect(); }

    // The tree in a compact form: "V(a,H(b,c))", placeholders as "_", missing children as "0".
    std::string Shape() const { return ShapeOf(layout->GetRootSplitter()->GetLeftOrTop()); }
    static std::string ShapeOf(LayoutManagerElement* e) {
        if (!e) {
            return "0";
        }
        if (Frame* f = AsFrame(e)) {
            return Host(f).name;
        }
        if (AsPlaceholder(e)) {
            return "_";
        }
        Splitter* s = AsSplitter(e);
        return std::string(s->IsVertical() ? "V(" : "H(") + ShapeOf(s->GetLeftOrTop()) + "," +
               ShapeOf(s->GetRightOrBottom()) + ")";
    }
    std::string Dump() const {
        std::ostringstream out;
        layout->DumpToGraphvis(out);
        return out.str();
    }

    FakeWindow window;
    std::deque<std::unique_ptr<FakeFrameHost>> hosts;
    std::deque<std::unique_ptr<Frame>> frames;
    std::unique_ptr<LayoutManager> layout;
};

} // namespace orvtest
