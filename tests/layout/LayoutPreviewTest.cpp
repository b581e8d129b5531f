// What-if layouts report where a frame would land without touching the real frames, and free every
// copy they make (the sanitizer build reports any leak).
#include "layout/LayoutDoubles.h"

#include <gtest/gtest.h>

using namespace orvtest;

namespace {

class LayoutPreview : public ::testing::Test, public LayoutFixture {
protected:
    // Records what every real host has been told so far.
    std::vector<std::pair<int, int>> Calls() const {
        std::vector<std::pair<int, int>> calls;
        for (auto const& h : hosts) {
            calls.emplace_back(h->placements, h->showCalls);
        }
        return calls;
    }
};

} // namespace

TEST_F(LayoutPreview, AddReportsTheNewRectangleAndTouchesNoRealFrame) {
    Frame* a = NewFrame("a");
    layout->SetRootFrame(a, RectT(0, 0, 800, 600));
    Frame* b = NewFrame("b");
    layout->AddFrame(a, LayoutManager::Right, b);
    Frame* n = NewFrame("n", PointT(300, 300)); // minimum sizes do not count in a preview
    std::string dump = Dump();
    auto calls = Calls();
    EXPECT_EQ(layout->PreviewAddFrame(b, LayoutManager::Right, n), RectT(600, 0, 200, 600));
    EXPECT_EQ(layout->PreviewAddFrame(a, LayoutManager::Bottom, n), RectT(0, 300, 400, 300));
    EXPECT_EQ(layout->PreviewAddFrame(nullptr, LayoutManager::Top, n), RectT(0, 0, 800, 300));
    EXPECT_EQ(Dump(), dump);
    EXPECT_EQ(Calls(), calls);
    EXPECT_EQ(RectOf(b), RectT(400, 0, 400, 600));
    EXPECT_EQ(n->GetParent(), nullptr);
    EXPECT_EQ(layout->StructureProblem(true), "");
    Frame* stranger = NewFrame("stranger");
    EXPECT_EQ(layout->PreviewAddFrame(stranger, LayoutManager::Left, n), RectT());
    EXPECT_EQ(layout->PreviewAddFrame(a, LayoutManager::Left, nullptr), RectT());
}

TEST_F(LayoutPreview, RemoveReportsWhereThePartnerWouldGo) {
    Frame* a = NewFrame("a");
    layout->SetRootFrame(a, RectT(0, 0, 800, 600));
    Frame* b = NewFrame("b");
    Frame* c = NewFrame("c");
    layout->AddFrame(a, LayoutManager::Right, b);
    layout->AddFrame(b, LayoutManager::Bottom, c);
    Frame* stranger = NewFrame("stranger");
    // V(a,H(b,c))
    std::string dump = Dump();
    auto calls = Calls();
    EXPECT_EQ(layout->PreviewRemoveFrame(c, nullptr), RectT(400, 0, 400, 600)); // b fills its parent
    EXPECT_EQ(layout->PreviewRemoveFrame(a, nullptr), RectT());                 // the sibling is a splitter
    EXPECT_EQ(layout->PreviewRemoveFrame(a, c), RectT(0, 300, 800, 300));
    EXPECT_EQ(layout->PreviewRemoveFrame(stranger, nullptr), RectT());
    EXPECT_EQ(Dump(), dump);
    EXPECT_EQ(Calls(), calls);
}

TEST_F(LayoutPreview, ClosedSlotsDoNotExistInAPreview) {
    Frame* a = NewFrame("a");
    layout->SetRootFrame(a, RectT(0, 0, 800, 600));
    Frame* b = NewFrame("b");
    layout->AddFrame(a, LayoutManager::Right, b);
    layout->RemoveFrame(b, true, true);
    ASSERT_EQ(Shape(), "V(a,_)");
    Frame* n = NewFrame("n");
    EXPECT_EQ(layout->PreviewAddFrame(a, LayoutManager::Right, n), RectT(400, 0, 400, 600));
    EXPECT_EQ(Shape(), "V(a,_)");
    EXPECT_TRUE(layout->HasAnyReanimatableFrames());
}
