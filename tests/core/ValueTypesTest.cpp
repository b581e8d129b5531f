// Rectangles, points, flags and the debug settings.
#include "host/core/DebugDatabase.h"
#include "host/core/Flags.h"
#include "host/core/Geometry.h"

#include <gtest/gtest.h>

using orvcore::geom::Point;
using orvcore::geom::Rect;
using orvcore::utility::Flags;

TEST(Rect, RightAndBottomEdgesAreOutside) {
    Rect r(10, 20, 30, 40);
    EXPECT_EQ(r.Right(), 40);
    EXPECT_EQ(r.Bottom(), 60);
    EXPECT_TRUE(r.Contains(Point(10, 20)));
    EXPECT_TRUE(r.Contains(Point(39, 59)));
    EXPECT_FALSE(r.Contains(Point(40, 30)));
    EXPECT_FALSE(r.Contains(Point(20, 60)));
    EXPECT_FALSE(Rect(0, 0, 0, 5).Contains(Point(0, 0)));
}

TEST(Rect, IntersectionAndUnion) {
    Rect a(0, 0, 10, 10), b(5, 5, 10, 10), c(10, 0, 5, 5);
    EXPECT_EQ(a.Intersection(b), Rect(5, 5, 5, 5));
    EXPECT_TRUE(a.Intersection(c).IsEmpty()); // touching edges do not overlap
    EXPECT_FALSE(a.Intersects(c));
    EXPECT_EQ(a.Union(b), Rect(0, 0, 15, 15));
    EXPECT_EQ(a.Union(Rect()), a);
    EXPECT_EQ(Rect().Union(b), b);
    EXPECT_EQ(Rect::FromEdges(10, 10, 0, 5), Rect(0, 5, 10, 5));
    EXPECT_EQ(a.Inset(2, 3), Rect(2, 3, 6, 4));
}

TEST(Flags, BitsByNumber) {
    Flags<unsigned char> f(0x03);
    EXPECT_TRUE(f.IsSet(0));
    EXPECT_TRUE(f.IsSet(1));
    EXPECT_FALSE(f.IsSet(2));
    f.Set(2);
    f.Clear(0);
    EXPECT_EQ(f.Get(), 0x06);
    f.Set(8); // beyond the width of the type: ignored, not undefined
    EXPECT_EQ(f.Get(), 0x06);
    EXPECT_FALSE(f.IsSet(9));
    f.Set(7);
    EXPECT_EQ(f.Get(), 0x86);
}

TEST(DebugDatabase, EntriesBySectionAndKey) {
    auto& db = orvcore::debug::DebugDatabase::Instance();
    db.Clear();
    EXPECT_EQ(db.GetEntry("workspace", "ORV_syncWindowEnablement"), "");
    db.SetEntry("workspace", "ORV_syncWindowEnablement", "1");
    EXPECT_EQ(db.GetEntry("workspace", "ORV_syncWindowEnablement"), "1");
    EXPECT_EQ(db.GetEntry("other", "ORV_syncWindowEnablement"), "");
    db.RemoveEntry("workspace", "ORV_syncWindowEnablement");
    EXPECT_EQ(db.GetEntry("workspace", "ORV_syncWindowEnablement"), "");
}
