// Drop regions of a frame, and splitter drags through the tracker: ranges, snapping, crossings.
#include "layout/DropZone.h"
#include "layout/LayoutDoubles.h"
#include "layout/SnapPoint.h"
#include "layout/SplitterTrackerMark2.h"

#include <gtest/gtest.h>

using namespace orvtest;

namespace {

class LayoutDrag : public ::testing::Test, public LayoutFixture {
protected:
    // The frame rectangle whose tab panel (the fake host insets by one pixel) is `panel`.
    static RectT AroundPanel(RectT panel) { return panel.Inset(-1, -1); }

    std::vector<DropZone> Zones(RectT panel, std::vector<long> ex = {0, 0, 0, 0}) {
        if (!zoneFrame) {
            zoneFrame = NewFrame("z");
        }
        return layout->GetDropZones(zoneFrame, AroundPanel(panel), ex);
    }
    static long Thickness(std::vector<DropZone> const& zones) {
        std::vector<PointT> top = zones[0].GetArea();
        return top[1].x - top[0].x;
    }
    // Two frames side by side in an 800 × 600 window, and a tracker begun on their bar.
    void Drag(PointT from) {
        layout->AcquireTracker(from.x, from.y, tracker);
        ASSERT_NE(tracker, nullptr);
        tracker->TrackBegin(from);
    }
    void SideBySide() {
        a = NewFrame("a");
        b = NewFrame("b");
        layout->SetRootFrame(a, RectT(0, 0, 800, 600));
        layout->AddFrame(a, LayoutManager::Right, b);
    }

    Frame* zoneFrame = nullptr;
    Frame* a = nullptr;
    Frame* b = nullptr;
    orvcore::utility::ScopedPtr<LayoutManager::Tracker> tracker;
};

} // namespace

TEST_F(LayoutDrag, BandThicknessIsAFifthOfThePanelAtMostFifty) {
    EXPECT_EQ(Thickness(Zones(RectT(10, 20, 400, 300))), 50);
    EXPECT_EQ(Thickness(Zones(RectT(10, 20, 200, 120))), 24);
    EXPECT_EQ(Thickness(Zones(RectT(10, 20, 9, 9))), 1);
    EXPECT_EQ(Thickness(Zones(RectT(10, 20, 4, 4))), 0);
}

TEST_F(LayoutDrag, SixRegionsInOrderTilingThePanel) {
    std::vector<DropZone> zones = Zones(RectT(10, 20, 400, 300));
    ASSERT_EQ(zones.size(), 6u);
    DropZone::DropType order[] = {DropZone::Top,   DropZone::Left,   DropZone::Bottom,
                                  DropZone::Right, DropZone::Center, DropZone::TabWell};
    for (int i = 0; i < 6; ++i) {
        EXPECT_EQ(zones[i].GetType(), order[i]);
        EXPECT_EQ(zones[i].GetFrame(), zoneFrame);
        EXPECT_EQ(zones[i].GetLayoutManager(), layout.get());
        EXPECT_EQ(zones[i].GetPositionOfFrameIfDropped(zoneFrame), RectT());
    }
    EXPECT_EQ(zones[0].GetArea(), (std::vector<PointT>{{10, 20}, {60, 70}, {360, 70}, {410, 20}}));
    EXPECT_EQ(zones[1].GetArea(), (std::vector<PointT>{{10, 20}, {60, 70}, {60, 270}, {10, 320}}));
    EXPECT_EQ(zones[2].GetArea(), (std::vector<PointT>{{10, 320}, {60, 270}, {360, 270}, {410, 320}}));
    EXPECT_EQ(zones[3].GetArea(), (std::vector<PointT>{{410, 320}, {360, 270}, {360, 70}, {410, 20}}));
    EXPECT_EQ(zones[4].GetArea(),
              (std::vector<PointT>{{60, 70}, {360, 70}, {360, 270}, {60, 270}, {60, 70}}));
    // The fake tab row is the frame's top 24 pixels.
    EXPECT_EQ(zones[5].GetArea(), (std::vector<PointT>{{9, 19}, {411, 19}, {411, 43}, {9, 43}}));
    DropZone empty;
    EXPECT_EQ(empty.GetType(), DropZone::None);
    EXPECT_TRUE(empty.GetArea().empty());
}

TEST_F(LayoutDrag, ExclusionsShortenSideBandsAndTabRowButNeverTheTopBand) {
    std::vector<DropZone> left = Zones(RectT(10, 20, 400, 300), {0, 10, 0, 0});
    EXPECT_EQ(left[1].GetArea()[0], PointT(20, 20)); // the left band's outer edge moved in
    EXPECT_EQ(left[0].GetArea()[0], PointT(20, 20)); // and the top band starts there too
    EXPECT_EQ(left[5].GetArea()[0], PointT(19, 19)); // the tab row starts 10 further right
    std::vector<DropZone> top = Zones(RectT(10, 20, 400, 300), {15, 0, 7, 5});
    EXPECT_EQ(top[0].GetArea()[0], PointT(10, 20)); // the top band ignores the top exclusion
    EXPECT_EQ(top[5].GetArea()[0], PointT(9, 34));  // the tab row does not
    EXPECT_EQ(top[5].GetArea()[2], PointT(406, 43));
    EXPECT_EQ(top[2].GetArea()[0], PointT(10, 313)); // bottom and right exclusions
    EXPECT_EQ(top[3].GetArea()[0], PointT(405, 313));
}

TEST_F(LayoutDrag, BarStaysInItsRange) {
    window.tabMinWidth = 40;
    SideBySide();
    Drag(PointT(400, 300));
    tracker->TrackMove(PointT(5, 300));
    EXPECT_EQ(RectOf(a).width, 40);
    tracker->TrackMove(PointT(795, 300));
    EXPECT_EQ(RectOf(a).width, 760);
    EXPECT_EQ(RectOf(b), RectT(760, 0, 40, 600));
    tracker->TrackEnd();
    EXPECT_EQ(layout->StructureProblem(true), "");
}

TEST_F(LayoutDrag, EveryBarBehindTheDraggedOneKeepsATabOfRoom) {
    window.tabMinWidth = 40;
    a = NewFrame("a");
    b = NewFrame("b");
    Frame* c = NewFrame("c");
    layout->SetRootFrame(a, RectT(0, 0, 800, 600));
    layout->AddFrame(a, LayoutManager::Right, c);
    layout->AddFrame(a, LayoutManager::Right, b);
    long bar = RectOf(c).left;
    Drag(PointT(std::int32_t(bar), 300));
    EXPECT_EQ(Shape(), "V(V(a,b),c)"); // the grabbed bar was majorized
    auto const& record = static_cast<SplitterTrackerMark2&>(*tracker).GetRecords().front();
    EXPECT_EQ(record.countFirst, 1);
    EXPECT_EQ(record.rangeMin, 80);
    EXPECT_EQ(record.rangeMax, 760);
    // The bar behind gives way (its frames are stretchy), so its frames are not looked at.
    EXPECT_EQ(record.nearestFirstFrame, nullptr);
    EXPECT_EQ(record.nearestSecondFrame, c);
}

TEST_F(LayoutDrag, SnapsWithinNineteenPixelsNotTwenty) {
    SideBySide();
    Host(b).snaps = {PointT(300, 0)}; // b prefers 300 wide: its bar at 500
    layout->ReLayout(false, true, false);
    long start = RectOf(b).left;
    Drag(PointT(std::int32_t(start), 300));
    tracker->TrackMove(PointT(600, 300));
    EXPECT_EQ(RectOf(b).left, 600);
    tracker->TrackMove(PointT(519, 300));
    EXPECT_EQ(RectOf(b).left, 500);
    EXPECT_EQ(RectOf(a).width, 500);
    tracker->TrackMove(PointT(520, 300));
    EXPECT_EQ(RectOf(b).left, 520);
    tracker->TrackMove(PointT(481, 300));
    EXPECT_EQ(RectOf(b).left, 500);
}

TEST_F(LayoutDrag, SnappingSwitchedOffTriesNoCandidateAndKeepsInnerBars) {
    a = NewFrame("a");
    b = NewFrame("b");
    Frame* c = NewFrame("c");
    layout->SetRootFrame(a, RectT(0, 0, 800, 600));
    layout->AddFrame(a, LayoutManager::Right, b);
    layout->AddFrame(b, LayoutManager::Bottom, c);
    Frame* d = NewFrame("d");
    layout->AddFrame(a, LayoutManager::Bottom, d);
    Host(b).snaps = {PointT(300, 0)};
    Host(a).snaps = {PointT(0, 250)};
    Host(d).snaps = {PointT(0, 250)};
    Host(b).snaps = {PointT(300, 0), PointT(0, 200)};
    Host(c).snaps = {PointT(0, 200)};
    layout->ReLayout(false, true, false);
    window.snapping = false;
    long rightRows = RectOf(c).top, leftRows = RectOf(d).top;
    Drag(PointT(std::int32_t(RectOf(b).left), 100));
    tracker->TrackMove(PointT(519, 100));
    EXPECT_EQ(RectOf(b).left, 519);
    EXPECT_EQ(RectOf(c).top, rightRows); // inner bars on both sides kept their absolute positions
    EXPECT_EQ(RectOf(d).top, leftRows);
}

TEST_F(LayoutDrag, CrossingDragsBothAxesAndSharesASnap) {
    a = NewFrame("a");
    b = NewFrame("b");
    Frame* c = NewFrame("c");
    Frame* d = NewFrame("d");
    layout->SetRootFrame(a, RectT(0, 0, 800, 600));
    layout->AddFrame(a, LayoutManager::Bottom, c);
    layout->AddFrame(a, LayoutManager::Right, b);
    layout->AddFrame(c, LayoutManager::Right, d);
    ASSERT_EQ(Shape(), "H(V(a,b),V(c,d))");
    Host(b).snaps = {PointT(300, 0)};
    ASSERT_EQ(layout->HitCheckCursor(400, 300), LayoutManager::SplitterCrossing);
    Drag(PointT(400, 300));
    EXPECT_EQ(static_cast<SplitterTrackerMark2&>(*tracker).GetRecords().size(), 3u);
    tracker->TrackMove(PointT(510, 350));
    EXPECT_EQ(RectOf(a), RectT(0, 0, 500, 350)); // the top bar snapped to b's 300 wide
    EXPECT_EQ(RectOf(d).left, 500);              // and the bottom bar took the same position
    EXPECT_EQ(RectOf(c).top, 350);
    EXPECT_EQ(layout->StructureProblem(true), "");
}

TEST_F(LayoutDrag, MovesThatChangeNothingDoNothing) {
    SideBySide();
    Drag(PointT(400, 300));
    tracker->TrackMove(PointT(450, 300));
    int placements = Host(a).placements;
    int updates = window.updates;
    tracker->TrackMove(PointT(450, 300)); // the last point again
    EXPECT_EQ(window.updates, updates);
    tracker->TrackMove(PointT(450, 200)); // along the bar: no new position
    EXPECT_EQ(Host(a).placements, placements);
    EXPECT_EQ(RectOf(a).width, 450);
}

TEST_F(LayoutDrag, NoTrackerAwayFromBarsOrWhileMaximised) {
    SideBySide();
    Drag(PointT(400, 300));
    layout->AcquireTracker(100, 100, tracker);
    EXPECT_EQ(tracker, nullptr);
    layout->SetMaximizedFrame(a);
    layout->AcquireTracker(400, 300, tracker);
    EXPECT_EQ(tracker, nullptr);
}

TEST(SnapPoint, CandidatesFromBarsAndScopedCounters) {
    FakeWindow window;
    LayoutManager layout(&window);
    Splitter bar(&layout, true);
    bar.SetLocation(RectT(100, 0, 600, 400));
    bar.SetPlacement(0.5f);
    PointT target(10, 390);
    // Another vertical bar's own position, along x.
    EXPECT_FALSE((SnapPoint{nullptr, 0, &bar, nullptr, true}.Snap(target)));
    target = PointT(381, 0);
    EXPECT_TRUE((SnapPoint{nullptr, 0, &bar, nullptr, true}.Snap(target)));
    EXPECT_EQ(target, PointT(400, 0));
    // A distance from a vertical splitter's top or bottom edge, along y.
    target = PointT(0, 140);
    EXPECT_TRUE((SnapPoint{nullptr, 150, &bar, nullptr, true}.Snap(target)));
    EXPECT_EQ(target.y, 150);
    target = PointT(0, 231);
    EXPECT_TRUE((SnapPoint{nullptr, 150, &bar, nullptr, false}.Snap(target)));
    EXPECT_EQ(target.y, 250);
    int count = 0;
    {
        ScIncDec guard(count);
        EXPECT_EQ(count, 1);
    }
    EXPECT_EQ(count, 0);
}
