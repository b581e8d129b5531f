// Bar arithmetic, frame zones, the relayout with constrained and stretchy frames, static border
// frames and the layout after a new frame.
#include "layout/LayoutDoubles.h"

#include <gtest/gtest.h>
#include <limits>

using namespace orvtest;

namespace {

class LayoutSizing : public ::testing::Test, public LayoutFixture {
protected:
    // A vertical splitter over (0, 0, 800, 600) with two frames of the given minimum widths,
    // standing alone (not in the layout's tree).
    Splitter& Standalone(int minA, int minB) {
        splitter = std::make_unique<Splitter>(layout.get(), true);
        Frame* a = NewFrame("a", PointT(minA, 10));
        Frame* b = NewFrame("b", PointT(minB, 10));
        splitter->SetLeftOrTop(a);
        splitter->SetRightOrBottom(b);
        a->SetParent(splitter.get());
        b->SetParent(splitter.get());
        splitter->SetLocation(RectT(0, 0, 800, 600));
        return *splitter;
    }
    // Two frames side by side in an 800 × 600 window; the left one prefers the given width.
    void SideBySide(int leftSnapWidth) {
        left = NewFrame("left");
        if (leftSnapWidth) {
            Host(left).snaps = {PointT(leftSnapWidth, 0)};
        }
        right = NewFrame("right");
        layout->SetRootFrame(left, RectT(0, 0, 800, 600));
        layout->AddFrame(left, LayoutManager::Right, right);
    }
    Splitter* Bar() { return left->GetParent(); }

    std::unique_ptr<Splitter> splitter;
    Frame* left = nullptr;
    Frame* right = nullptr;
};

} // namespace

TEST_F(LayoutSizing, PlacementArithmeticWithMinimumSizes) {
    Splitter& s = Standalone(10, 10);
    s.SetPlacement(0.25f);
    EXPECT_EQ(s.GetPixelPlacement(), 200);
    long a = 0, b = 0;
    s.GetPlacementSizes(a, b);
    EXPECT_EQ(a, 200);
    EXPECT_EQ(b, 600);

    Splitter& t = Standalone(300, 300);
    t.SetPlacement(0.25f);
    EXPECT_FLOAT_EQ(t.GetPlacement(), 0.375f); // first child raised to its minimum
    EXPECT_EQ(t.GetPixelPlacement(), 300);
    EXPECT_FLOAT_EQ(t.GetStoredPlacement(), 0.25f); // the correction is not stored
    t.SetPlacement(0.9f);
    EXPECT_FLOAT_EQ(t.GetPlacement(), 500.0f / 800.0f); // second child raised to its minimum

    Splitter& u = Standalone(500, 400);
    u.SetPlacement(0.1f);
    EXPECT_FLOAT_EQ(u.GetPlacement(), 0.5f); // both cannot fit: the middle
}

TEST_F(LayoutSizing, PixelPlacementClampsAndIgnoresEmptySplitters) {
    Splitter& s = Standalone(0, 0);
    s.SetPixelPlacement(900);
    EXPECT_FLOAT_EQ(s.GetStoredPlacement(), 1.0f);
    s.SetPixelPlacement(-5);
    EXPECT_FLOAT_EQ(s.GetStoredPlacement(), 0.0f);
    float f = 0.7f;
    EXPECT_TRUE(s.CalcPlacement(1000, f));
    EXPECT_FLOAT_EQ(f, 1.25f); // not clamped
    s.SetPlacement(0.4f);
    s.SetLocation(RectT(10, 10, 0, 600));
    s.SetPixelPlacement(300);
    EXPECT_FLOAT_EQ(s.GetStoredPlacement(), 0.4f);
    EXPECT_FALSE(s.CalcPlacement(300, f));
    EXPECT_FLOAT_EQ(f, 1.25f);
    s.SetPlacement(std::numeric_limits<float>::quiet_NaN());
    EXPECT_FLOAT_EQ(s.GetStoredPlacement(), 0.5f);
    s.SetPlacementNormalize(-3.0f);
    EXPECT_FLOAT_EQ(s.GetStoredPlacement(), 0.0f);
    // Rounding adds one half and truncates, in single precision.
    s.SetLocation(RectT(0, 0, 3, 10));
    EXPECT_EQ(s.CalcPixelPlacement(0.5f, RectT(0, 0, 3, 10)), 2);
    EXPECT_EQ(s.CalcPixelPlacement(0.5f, RectT(-9, 0, 3, 10)), -7); // -7.5 + 0.5 truncates to -7
}

TEST_F(LayoutSizing, FrameZonesAtWindowEdgesAndAgainstBars) {
    layout->SetContainingRect(RectT(0, 0, 300, 50));
    FrameZones z = layout->ConstructFrameZones(RectT(0, 0, 100, 50));
    EXPECT_EQ(z.EdgeSize(FrameZones::Left), 1);
    EXPECT_EQ(z.EdgeSize(FrameZones::Top), 1);
    EXPECT_EQ(z.EdgeSize(FrameZones::Right), 2);
    EXPECT_EQ(z.EdgeSize(FrameZones::Bottom), 1);
    EXPECT_EQ(z[FrameZones::Interior], RectT(1, 1, 97, 48));
    EXPECT_EQ(z[FrameZones::Right], RectT(98, 0, 2, 50));
    EXPECT_EQ(z[FrameZones::Bottom], RectT(0, 49, 100, 1));
    EXPECT_EQ(z[FrameZones::Whole], RectT(0, 0, 100, 50));
    // A frame too small for its edges: strips become the frame itself and there is no content.
    FrameZones tiny = layout->ConstructFrameZones(RectT(150, 10, 1, 3));
    EXPECT_EQ(tiny[FrameZones::Left], RectT(150, 10, 1, 3));
    EXPECT_EQ(tiny[FrameZones::Interior], RectT());
}

TEST_F(LayoutSizing, FrameZonesCompareRectanglesOnly) {
    FrameZones a, b;
    a[FrameZones::Whole] = b[FrameZones::Whole] = RectT(0, 0, 10, 10);
    a.SetEdgeSize(FrameZones::Left, 1);
    b.SetEdgeSize(FrameZones::Left, 2);
    EXPECT_EQ(a, b);
    b[FrameZones::Interior] = RectT(1, 1, 1, 1);
    EXPECT_NE(a, b);
    EXPECT_EQ(a.EdgeSize(FrameZones::Interior), 0);
    a.SetEdgeSize(FrameZones::Interior, 7);
    EXPECT_EQ(a.EdgeSize(FrameZones::Interior), 0);
    EXPECT_TRUE(FrameZones::IsBorder(3));
    EXPECT_FALSE(FrameZones::IsBorder(4));
}

TEST_F(LayoutSizing, ConstrainedFrameKeepsItsSizeWhileTheStretchyOneGrows) {
    SideBySide(200);
    EXPECT_EQ(RectOf(left).width, 200);
    layout->Layout(RectT(0, 0, 1000, 600), true, true, false);
    EXPECT_EQ(RectOf(left).width, 200);
    EXPECT_EQ(RectOf(right), RectT(200, 0, 800, 600));
    layout->Layout(RectT(0, 0, 700, 600), true, true, false);
    EXPECT_EQ(RectOf(left).width, 200);
    EXPECT_EQ(RectOf(right).width, 500);
}

TEST_F(LayoutSizing, DistributionMovesNoFurtherThanTheChangeAndNeverAgainstIt) {
    SideBySide(200);
    Bar()->SetPlacement(0.3f);
    layout->Layout(RectT(0, 0, 800, 600), false, false, false);
    ASSERT_EQ(RectOf(left).width, 240); // 40 above its wish
    layout->Layout(RectT(0, 0, 770, 600), true, true, false);
    EXPECT_EQ(RectOf(left).width, 210); // shrinking by 30 moves the bar by 30, not 40
    layout->Layout(RectT(0, 0, 800, 600), true, true, false);
    EXPECT_EQ(RectOf(left).width, 210); // growing moves nothing toward the wish
}

TEST_F(LayoutSizing, SameRectangleSnapsConstrainedFramesStraightToTheirWish) {
    SideBySide(200);
    Bar()->SetPlacement(0.5f);
    layout->Layout(RectT(0, 0, 800, 600), false, false, false);
    ASSERT_EQ(RectOf(left).width, 400);
    layout->Layout(RectT(0, 0, 800, 600), true, true, false);
    EXPECT_EQ(RectOf(left).width, 200);
}

TEST_F(LayoutSizing, TwoStretchyFramesScaleWithTheSplitter) {
    SideBySide(0);
    Bar()->SetPlacement(0.25f);
    layout->Layout(RectT(0, 0, 800, 600), false, true, false);
    layout->Layout(RectT(0, 0, 1600, 600), true, true, false);
    EXPECT_EQ(RectOf(left).width, 400);
    EXPECT_FLOAT_EQ(Bar()->GetStoredPlacement(), 0.25f);
}

TEST_F(LayoutSizing, KeepBarPositionsStopsAtTheOtherOrientationWhileDragging) {
    Frame* a = NewFrame("a");
    layout->SetRootFrame(a, RectT(0, 0, 800, 600));
    Frame* b = NewFrame("b");
    Frame* c = NewFrame("c");
    layout->AddFrame(a, LayoutManager::Right, b);
    layout->AddFrame(b, LayoutManager::Bottom, c);
    // Rows that are not stretchy in height, so only the keep flag decides their bar.
    Host(b).snaps = {PointT(0, 300)};
    Host(c).snaps = {PointT(0, 300)};
    Splitter* rows = b->GetParent();
    rows->SetPlacement(0.5f);
    layout->Layout(RectT(0, 0, 800, 600), false, true, false);
    ASSERT_EQ(rows->GetPixelPlacement(), 300);

    layout->Layout(RectT(0, 0, 800, 800), false, true, true);
    EXPECT_EQ(rows->GetPixelPlacement(), 300); // kept in absolute pixels

    layout->Layout(RectT(0, 0, 800, 600), false, true, false);
    rows->SetPlacement(0.5f);
    layout->Layout(RectT(0, 0, 800, 600), false, true, false);
    layout->SetUserAdjustingSplitter(true);
    layout->Layout(RectT(0, 0, 800, 800), false, true, true);
    EXPECT_EQ(rows->GetPixelPlacement(), 400); // the horizontal bar below a vertical one scales
    layout->SetUserAdjustingSplitter(false);
    EXPECT_FALSE(layout->GetUserAdjustingSplitter());
}

TEST_F(LayoutSizing, StaticBorderFramesAlongTheEdges) {
    Frame* a = NewFrame("a");
    layout->SetRootFrame(a, RectT(0, 0, 800, 600));
    Frame* top = NewFrame("top", PointT(0, 30));
    Frame* bottom = NewFrame("bottom", PointT(0, 20));
    Frame* leftBar = NewFrame("left", PointT(50, 25));
    Frame* rightBar = NewFrame("right", PointT(60, 0));
    layout->SetStaticBorderFrame(top, RectT(0, 0, 800, 600), LayoutManager::Top, false);
    layout->SetStaticBorderFrame(bottom, RectT(0, 0, 800, 600), LayoutManager::Bottom, false);
    layout->SetStaticBorderFrame(leftBar, RectT(0, 0, 800, 600), LayoutManager::Left, false);
    layout->SetStaticBorderFrame(rightBar, RectT(0, 0, 800, 600), LayoutManager::Right, true);
    EXPECT_TRUE(layout->HasStaticBorderFrame(LayoutManager::Right));
    EXPECT_EQ(RectOf(top), RectT(0, 0, 800, 30));
    EXPECT_EQ(RectOf(bottom), RectT(0, 580, 800, 20));
    EXPECT_EQ(RectOf(leftBar), RectT(0, 30, 50, 550));
    EXPECT_EQ(RectOf(rightBar), RectT(740, 30, 60, 550));
    EXPECT_EQ(RectOf(a), RectT(50, 30, 690, 550));

    layout->EnableLeftStaticBorderAsSecondTopFrame(true);
    int rightPlacements = Host(rightBar).placements;
    layout->ReLayout(false, true, false);
    EXPECT_EQ(RectOf(leftBar), RectT(0, 30, 800, 25));
    EXPECT_EQ(RectOf(bottom), RectT(0, 580, 800, 20));
    EXPECT_EQ(RectOf(a), RectT(0, 55, 800, 525));
    EXPECT_EQ(Host(rightBar).placements, rightPlacements); // not placed in this arrangement

    layout->EnableLeftStaticBorderAsSecondTopFrame(false);
    Frame* b = NewFrame("b");
    layout->AddFrame(a, LayoutManager::Right, b);
    layout->SetMaximizedFrame(b);
    EXPECT_EQ(RectOf(b), RectT(50, 30, 690, 550)); // the area the static frames leave
    layout->SetStaticBorderFrame(nullptr, RectT(0, 0, 800, 600), LayoutManager::Right, true);
    EXPECT_FALSE(layout->HasStaticBorderFrame(LayoutManager::Right));
    EXPECT_EQ(RectOf(b), RectT(50, 30, 750, 550));
}

TEST_F(LayoutSizing, EmptyOrDisabledLayoutsPlaceNothing) {
    Frame* a = NewFrame("a");
    layout->SetRootFrame(a, RectT(0, 0, 800, 600));
    int placed = Host(a).placements;
    layout->Layout(RectT(0, 0, 0, 600), false, true, false);
    layout->Layout(RectT(0, 0, 800, -1), false, true, false);
    EXPECT_EQ(Host(a).placements, placed);
    EXPECT_EQ(layout->GetContainingRect(), RectT(0, 0, 800, 600));
}

TEST_F(LayoutSizing, NewFrameTakesItsGreatestSnapSize) {
    Frame* a = NewFrame("a");
    layout->SetRootFrame(a, RectT(0, 0, 800, 600));
    Frame* n = NewFrame("n");
    Host(n).snaps = {PointT(150, 0), PointT(250, 0)};
    layout->AddFrame(a, LayoutManager::Right, n);
    EXPECT_EQ(RectOf(n), RectT(550, 0, 250, 600));
    EXPECT_EQ(RectOf(a), RectT(0, 0, 550, 600));
    EXPECT_EQ(n->GetConstraintSize(), PointT(250, 20));
}

TEST_F(LayoutSizing, SnapSizesAndSnappingPartners) {
    Frame* a = NewFrame("a", PointT(40, 30));
    Host(a).snaps = {PointT(0, 90), PointT(300, 0), PointT(200, 0), PointT(0, 100)};
    layout->SetRootFrame(a, RectT(0, 0, 260, 600));
    PointT nearest, greatest;
    a->GetNearestSnapSize(nearest);
    a->GetGreatestSnapSize(greatest);
    EXPECT_EQ(nearest, PointT(300, 100)); // 260 wide: 300 and 200 tie, the earlier wins; 600 high
    EXPECT_EQ(greatest, PointT(300, 100));
    a->SetConstraintSize(false);
    EXPECT_FALSE(a->IsStretchy(false));
    EXPECT_FALSE(a->IsStretchy(true));
    EXPECT_FALSE(a->AllowSnapping(false, nullptr)); // 260 is neither its minimum nor its wish
    EXPECT_TRUE(a->AllowSnapping(false, a));        // the dragged frame always may
    layout->Layout(RectT(0, 0, 300, 600), false, false, false);
    EXPECT_TRUE(a->AllowSnapping(false, nullptr)); // now at its wish
    a->ClearConstraintSize();
    EXPECT_TRUE(a->IsStretchy(false));
    EXPECT_FALSE(a->AllowSnapping(false, nullptr)); // stretchy frames never snap

    Frame* b = NewFrame("b");
    Host(b).snaps = {PointT(100, 0)};
    layout->AddFrame(a, LayoutManager::Right, b);
    std::vector<PointT> sizes;
    a->GetParent()->GetSnapSizes(sizes);
    long bar = a->GetParent()->GetPixelPlacement();
    ASSERT_EQ(sizes.size(), 5u);
    EXPECT_EQ(sizes[4], PointT(std::int32_t(100 + bar), 0)); // the second side's entries shifted by the bar
}
