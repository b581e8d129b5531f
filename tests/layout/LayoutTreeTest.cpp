// The split tree's edits, walks, hit tests and dump.
#include "layout/LayoutDoubles.h"

#include <gtest/gtest.h>

using namespace orvtest;

namespace {

class LayoutTree : public ::testing::Test, public LayoutFixture {
protected:
    void ExpectWellFormed() { EXPECT_EQ(layout->StructureProblem(), "") << Shape(); }
    RectT const window800{0, 0, 800, 600};
};

} // namespace

TEST_F(LayoutTree, InsertionSidesPutTheNewFrameWhereAsked) {
    Frame* t = NewFrame("t");
    layout->SetRootFrame(t, window800);
    Frame* l = NewFrame("l");
    layout->AddFrame(t, LayoutManager::Left, l);
    EXPECT_EQ(Shape(), "V(l,t)");
    Frame* top = NewFrame("top");
    layout->AddFrame(t, LayoutManager::Top, top);
    EXPECT_EQ(Shape(), "V(l,H(top,t))");
    Frame* r = NewFrame("r");
    layout->AddFrame(t, LayoutManager::Right, r);
    EXPECT_EQ(Shape(), "V(l,H(top,V(t,r)))");
    Frame* b = NewFrame("b");
    layout->AddFrame(l, LayoutManager::Bottom, b);
    EXPECT_EQ(Shape(), "V(H(l,b),H(top,V(t,r)))");
    ExpectWellFormed();
    // The new splitter under t's old parent starts in the middle of what it splits.
    Splitter* s = t->GetParent();
    EXPECT_TRUE(s->IsVertical());
    EXPECT_EQ(RectOf(t).width, RectOf(r).width);
}

TEST_F(LayoutTree, NullTargetSplitsTheWholeLayout) {
    Frame* a = NewFrame("a");
    layout->SetRootFrame(a, window800);
    Frame* b = NewFrame("b");
    layout->AddFrame(a, LayoutManager::Right, b);
    Frame* c = NewFrame("c");
    layout->AddFrame(nullptr, LayoutManager::Bottom, c);
    EXPECT_EQ(Shape(), "H(V(a,b),c)");
    EXPECT_EQ(RectOf(c), RectT(0, 300, 800, 300));
    EXPECT_EQ(RectOf(a), RectT(0, 0, 400, 300));
    ExpectWellFormed();
}

TEST_F(LayoutTree, CollapseLiftsTheSiblingAndEmptiesTheLastFrame) {
    Frame* a = NewFrame("a");
    layout->SetRootFrame(a, window800);
    Frame* b = NewFrame("b");
    Frame* c = NewFrame("c");
    layout->AddFrame(a, LayoutManager::Right, b);
    layout->AddFrame(b, LayoutManager::Bottom, c);
    EXPECT_EQ(Shape(), "V(a,H(b,c))");
    layout->RemoveFrame(a, false, false);
    EXPECT_EQ(Shape(), "H(b,c)");
    EXPECT_EQ(a->GetParent(), nullptr);
    EXPECT_EQ(RectOf(b), RectT(0, 0, 800, 300));
    ExpectWellFormed();
    layout->RemoveFrame(b, false, false);
    EXPECT_EQ(Shape(), "c");
    EXPECT_EQ(RectOf(c), window800);
    layout->RemoveFrame(c, false, false);
    EXPECT_EQ(Shape(), "0");
    EXPECT_TRUE(layout->GetFrames().empty());
    ExpectWellFormed();
}

TEST_F(LayoutTree, PlaceholderKeepsTheShapeAndGivesItsSpaceAway) {
    Frame* a = NewFrame("a");
    layout->SetRootFrame(a, window800);
    Frame* b = NewFrame("b");
    layout->AddFrame(a, LayoutManager::Right, b);
    Host(b).first = {{"media", "s1"}};
    Host(b).second = {{"bins", "s2"}};
    Host(b).third = {{"log", "s3"}};
    layout->RemoveFrame(b, true, false);
    EXPECT_EQ(Shape(), "V(a,_)");
    EXPECT_EQ(RectOf(a), window800);
    EXPECT_TRUE(layout->GetSplitters().empty()); // the splitter now has a hidden branch
    EXPECT_EQ(layout->GetFrames(), std::vector<Frame*>{a});
    ASSERT_TRUE(layout->HasAnyReanimatableFrames());
    FrameDataProxy* proxy = layout->FindFrameForReanimation(std::string("bins"));
    ASSERT_NE(proxy, nullptr);
    EXPECT_EQ(proxy->GetTabData(), (TabDataList{{"media", "s1"}, {"bins", "s2"}, {"log", "s3"}}));
    EXPECT_EQ(layout->FindFrameForReanimation(b), nullptr); // the frame itself was not remembered
    ExpectWellFormed();

    // Put a frame back in the slot: same neighbour, same side.
    Frame* back = NewFrame("back");
    layout->ReanimateFrame(proxy, back);
    layout->LayoutNewFrame(back);
    EXPECT_EQ(Shape(), "V(a,back)");
    EXPECT_FALSE(layout->HasAnyReanimatableFrames());
    EXPECT_EQ(RectOf(back).Right(), 800);
    ExpectWellFormed();
}

TEST_F(LayoutTree, RememberedFrameIsFoundByIdentity) {
    Frame* a = NewFrame("a");
    layout->SetRootFrame(a, window800);
    Frame* b = NewFrame("b");
    layout->AddFrame(a, LayoutManager::Bottom, b);
    Host(b).second = {{"bins", "state"}};
    Host(b).third = {{"later", "x"}};
    layout->RemoveFrame(b, true, true);
    FrameDataProxy* proxy = layout->FindFrameForReanimation(b);
    ASSERT_NE(proxy, nullptr);
    EXPECT_EQ(proxy->GetTabData(), (TabDataList{{"bins", "state"}, {"later", "x"}}));
    layout->ReanimateFrame(proxy, b);
    layout->LayoutNewFrame(b);
    EXPECT_EQ(Shape(), "H(a,b)");
    EXPECT_EQ(RectOf(b), RectT(0, 300, 800, 300));
    EXPECT_FALSE(layout->HasAnyReanimatableFrames());
    EXPECT_EQ(layout->StructureProblem(true), "");
}

TEST_F(LayoutTree, PlaceholderWithoutTheFrameIsFoundByAnyFormerTabType) {
    Frame* a = NewFrame("a");
    layout->SetRootFrame(a, window800);
    Frame* b = NewFrame("b");
    layout->AddFrame(a, LayoutManager::Right, b);
    Host(b).first = {{"first", ""}};
    Host(b).second = {{"second", ""}};
    Host(b).third = {{"third", ""}};
    layout->RemoveFrame(b, true, false);
    FrameDataProxy* proxy = layout->FindFrameForReanimation(std::string("first"));
    ASSERT_NE(proxy, nullptr);
    EXPECT_EQ(layout->FindFrameForReanimation(std::string("second")), proxy);
    EXPECT_EQ(layout->FindFrameForReanimation(std::string("third")), proxy);
    EXPECT_EQ(layout->FindFrameForReanimation(b), nullptr);
}

TEST_F(LayoutTree, ANewSplitterStartsInTheMiddle) {
    Frame* a = NewFrame("a");
    layout->SetRootFrame(a, window800);
    Frame* b = NewFrame("b");
    layout->AddFrame(a, LayoutManager::Bottom, b);
    EXPECT_FLOAT_EQ(a->GetParent()->GetStoredPlacement(), 0.5f);
    EXPECT_FALSE(a->GetParent()->IsVertical());
}

TEST_F(LayoutTree, SwappingTheTreeWhileMaximisedLosesNoFrame) {
    Frame* a = NewFrame("a");
    layout->SetRootFrame(a, window800);
    Frame* b = NewFrame("b");
    layout->AddFrame(a, LayoutManager::Right, b);
    layout->SetMaximizedFrame(a);
    ASSERT_FALSE(Host(b).shown);
    // A new tree holding b but not a: b must not stay hidden for good.
    auto* root = new Splitter(layout.get(), false);
    b->GetParent()->ReplaceElement(b, nullptr);
    root->SetLeftOrTop(b);
    b->SetParent(root);
    layout->SwapRoot(root);
    EXPECT_FALSE(layout->HasMaximizedFrame());
    EXPECT_TRUE(Host(b).shown);
    layout->ReLayout(false, true, false);
    EXPECT_EQ(RectOf(b), window800);
}

TEST_F(LayoutTree, SetRootFrameOverAHiddenTreeStacksAboveIt) {
    Frame* a = NewFrame("a");
    layout->SetRootFrame(a, window800);
    Frame* ignored = NewFrame("x");
    layout->SetRootFrame(ignored, window800); // a visible root: nothing changes
    EXPECT_EQ(Shape(), "a");
    EXPECT_EQ(ignored->GetParent(), nullptr);

    Frame* b = NewFrame("b");
    layout->AddFrame(a, LayoutManager::Right, b);
    layout->RemoveFrame(a, true, true);
    layout->RemoveFrame(b, false, false);
    EXPECT_EQ(Shape(), "_");
    Frame* c = NewFrame("c");
    layout->SetRootFrame(c, window800);
    EXPECT_EQ(Shape(), "H(c,_)");
    EXPECT_EQ(RectOf(c), window800);
    ExpectWellFormed();
}

TEST_F(LayoutTree, MaximiseHidesOthersAndRestoreShowsThemInOrder) {
    Frame* a = NewFrame("a");
    layout->SetRootFrame(a, window800);
    Frame* b = NewFrame("b");
    Frame* c = NewFrame("c");
    Frame* d = NewFrame("d");
    layout->AddFrame(a, LayoutManager::Right, b);
    layout->AddFrame(b, LayoutManager::Bottom, c);
    layout->AddFrame(a, LayoutManager::Bottom, d);
    Host(d).shown = false; // already hidden before the maximise
    layout->ReLayout(false, true, false);
    RectT cBefore = RectOf(c);

    layout->SetMaximizedFrame(b);
    EXPECT_TRUE(layout->IsTheMaximizedFrame(b));
    EXPECT_FALSE(Host(a).shown);
    EXPECT_FALSE(Host(c).shown);
    EXPECT_EQ(RectOf(b), window800);
    EXPECT_EQ(RectOf(c), cBefore); // hidden frames keep their last rectangles
    EXPECT_EQ(layout->HitCheckCursor(400, 100), LayoutManager::NoSplitter);
    EXPECT_TRUE(layout->FindSplittersContainingPoint(400, 100).empty());

    std::vector<std::string> shownOrder;
    for (auto& h : hosts) {
        h->showLog = &shownOrder;
    }
    layout->SetMaximizedFrame(nullptr);
    EXPECT_EQ(shownOrder, (std::vector<std::string>{"a+", "c+"})); // left to right, as they were hidden
    EXPECT_TRUE(Host(a).shown);
    EXPECT_TRUE(Host(c).shown);
    EXPECT_FALSE(Host(d).shown); // stays hidden
    EXPECT_EQ(Host(d).showCalls, 0);
    EXPECT_FALSE(layout->HasMaximizedFrame());
    ExpectWellFormed();
}

TEST_F(LayoutTree, MaximisingAnotherFrameDirectlyLosesNoFrame) {
    Frame* a = NewFrame("a");
    layout->SetRootFrame(a, window800);
    Frame* b = NewFrame("b");
    Frame* c = NewFrame("c");
    layout->AddFrame(a, LayoutManager::Right, b);
    layout->AddFrame(b, LayoutManager::Bottom, c);
    layout->SetMaximizedFrame(a);
    layout->SetMaximizedFrame(c);
    EXPECT_TRUE(Host(c).shown);
    EXPECT_FALSE(Host(a).shown);
    EXPECT_FALSE(Host(b).shown);
    layout->SetMaximizedFrame(nullptr);
    EXPECT_TRUE(Host(a).shown && Host(b).shown && Host(c).shown);
}

TEST_F(LayoutTree, EditsEndTheMaximisedState) {
    Frame* a = NewFrame("a");
    layout->SetRootFrame(a, window800);
    Frame* b = NewFrame("b");
    layout->AddFrame(a, LayoutManager::Right, b);
    layout->SetMaximizedFrame(a);
    Frame* c = NewFrame("c");
    layout->AddFrame(a, LayoutManager::Top, c);
    EXPECT_FALSE(layout->HasMaximizedFrame());
    EXPECT_TRUE(Host(b).shown);
    layout->SetMaximizedFrame(c);
    layout->RemoveFrame(a, false, false);
    EXPECT_FALSE(layout->HasMaximizedFrame());
    EXPECT_TRUE(Host(b).shown);
}

TEST_F(LayoutTree, WalksSkipPlaceholdersAndHalfVisibleSplitters) {
    Frame* a = NewFrame("a");
    layout->SetRootFrame(a, window800);
    Frame* b = NewFrame("b");
    Frame* c = NewFrame("c");
    Frame* d = NewFrame("d");
    layout->AddFrame(a, LayoutManager::Right, b);
    layout->AddFrame(b, LayoutManager::Bottom, c);
    layout->AddFrame(a, LayoutManager::Bottom, d);
    EXPECT_EQ(Shape(), "V(H(a,d),H(b,c))");
    EXPECT_EQ(layout->GetFrames(), (std::vector<Frame*>{a, d, b, c}));
    EXPECT_EQ(layout->GetSplitters().size(), 3u);
    Host(c).shown = false;
    layout->ReLayout(false, true, false);
    EXPECT_EQ(layout->GetFrames(), (std::vector<Frame*>{a, d, b, c})); // hidden frames are listed
    EXPECT_EQ(layout->GetSplitters().size(), 2u);
    EXPECT_EQ(RectOf(b).height, 600);
    EXPECT_EQ(layout->StructureProblem(true), "");
    layout->RemoveFrame(d, true, true);
    EXPECT_EQ(layout->GetFrames(), (std::vector<Frame*>{a, b, c}));
    EXPECT_EQ(layout->GetSplitters().size(), 1u);
}

TEST_F(LayoutTree, HitTestingFindsBarsAndCrossings) {
    Frame* a = NewFrame("a");
    layout->SetRootFrame(a, window800);
    Frame* b = NewFrame("b");
    Frame* c = NewFrame("c");
    layout->AddFrame(a, LayoutManager::Right, b);
    layout->AddFrame(nullptr, LayoutManager::Bottom, c);
    // H(V(a,b),c): a vertical bar at x = 400 over the top half, a horizontal bar at y = 300.
    Splitter* v = a->GetParent();
    Splitter* h = v->GetParent();
    EXPECT_EQ(v->GetDrawRect(), RectT(398, -2, 4, 304));
    EXPECT_EQ(h->GetDrawRect(), RectT(-2, 298, 804, 4));
    EXPECT_EQ(layout->HitCheckCursor(400, 100), LayoutManager::VerticalSplitter);
    EXPECT_EQ(layout->HitCheckCursor(398, 100), LayoutManager::VerticalSplitter);
    EXPECT_EQ(layout->HitCheckCursor(402, 100), LayoutManager::NoSplitter);
    EXPECT_EQ(layout->HitCheckCursor(100, 299), LayoutManager::HorizontalSplitter);
    EXPECT_EQ(layout->HitCheckCursor(400, 299), LayoutManager::SplitterCrossing);
    EXPECT_EQ(layout->HitCheckCursor(100, 100), LayoutManager::NoSplitter);
    EXPECT_EQ(layout->FindSplittersContainingPoint(400, 299), (std::vector<Splitter*>{h, v}));
}

TEST_F(LayoutTree, SplittersInTheSameRowOrColumn) {
    Frame* a = NewFrame("a");
    layout->SetRootFrame(a, window800);
    Frame* b = NewFrame("b");
    Frame* c = NewFrame("c");
    Frame* d = NewFrame("d");
    layout->AddFrame(a, LayoutManager::Bottom, b);
    layout->AddFrame(a, LayoutManager::Right, c);
    layout->AddFrame(b, LayoutManager::Right, d);
    EXPECT_EQ(Shape(), "H(V(a,c),V(b,d))");
    Splitter* top = a->GetParent();
    Splitter* bottom = b->GetParent();
    Splitter* rows = top->GetParent();
    // The two vertical bars span different rows; the horizontal bar spans the columns of both.
    EXPECT_TRUE(layout->FindAllSplittersInSameRowCol(top).empty());
    EXPECT_EQ(layout->FindAllSplittersInSameRowCol(rows), (std::vector<Splitter*>{top, bottom}));
    // A vertical bar over the whole height shares its span with the horizontal splitter beside it,
    // whatever that one's orientation.
    Frame* e = NewFrame("e");
    layout->AddFrame(nullptr, LayoutManager::Right, e);
    Splitter* whole = e->GetParent();
    EXPECT_EQ(layout->FindAllSplittersInSameRowCol(whole), std::vector<Splitter*>{rows});
    EXPECT_TRUE(layout->FindAllSplittersInSameRowCol(nullptr).empty());
}

TEST_F(LayoutTree, MajorizingRotatesAChainWithoutReorderingFrames) {
    Frame* a = NewFrame("a");
    layout->SetRootFrame(a, window800);
    Frame* b = NewFrame("b");
    Frame* c = NewFrame("c");
    layout->AddFrame(a, LayoutManager::Bottom, b);
    layout->AddFrame(b, LayoutManager::Bottom, c);
    // The splitter that received the new frame was majorized by the add.
    EXPECT_EQ(Shape(), "H(H(a,b),c)");
    Splitter* inner = a->GetParent();
    Splitter* outer = c->GetParent();
    EXPECT_EQ(layout->FindMajorSplitter(inner), outer);
    EXPECT_EQ(layout->FindMajorSplitter(outer), outer);
    RectT whole = outer->GetLocation();
    std::vector<RectT> before{RectOf(a), RectOf(b), RectOf(c)};
    layout->MajorizeSplitter(inner);
    EXPECT_EQ(Shape(), "H(a,H(b,c))");
    EXPECT_EQ(layout->FindMajorSplitter(outer), inner);
    EXPECT_EQ(inner->GetLocation(), whole);
    EXPECT_EQ(layout->GetFrames(), (std::vector<Frame*>{a, b, c}));
    EXPECT_EQ(RectOf(a).top, 0);
    EXPECT_EQ(RectOf(c).Bottom(), 600);
    ExpectWellFormed();
    // A splitter of the other orientation ends the chain.
    Frame* d = NewFrame("d");
    layout->AddFrame(c, LayoutManager::Right, d);
    EXPECT_EQ(layout->FindMajorSplitter(c->GetParent()), c->GetParent());
}

TEST_F(LayoutTree, SwapRootCollectsPlaceholdersAndFreesTheOldTree) {
    Frame* a = NewFrame("a");
    layout->SetRootFrame(a, window800);
    Frame* b = NewFrame("b");
    layout->AddFrame(a, LayoutManager::Right, b);
    layout->RemoveFrame(b, true, true);

    // A tree built elsewhere, as a restore does: root splitter, a splitter, a frame and a placeholder.
    Frame* c = NewFrame("c");
    auto* root = new Splitter(layout.get(), false);
    auto* s = new Splitter(layout.get(), true);
    auto* proxy = new FrameDataProxy(layout.get(), TabDataList{{"media", ""}});
    root->SetLeftOrTop(s);
    s->SetParent(root);
    s->SetLeftOrTop(c);
    c->SetParent(s);
    s->SetRightOrBottom(proxy);
    proxy->SetParent(s);
    layout->SwapRoot(root);
    EXPECT_EQ(Shape(), "V(c,_)");
    EXPECT_EQ(layout->GetRootSplitter(), root);
    EXPECT_EQ(a->GetParent(), nullptr); // no link into the freed tree
    EXPECT_EQ(layout->FindFrameForReanimation(std::string("media")), proxy);
    EXPECT_EQ(layout->FindFrameForReanimation(b), nullptr);
    ExpectWellFormed();
    layout->ReLayout(false, true, false);
    EXPECT_EQ(RectOf(c), window800);
}

TEST_F(LayoutTree, RequestsOutsideTheContractChangeNothing) {
    Frame* stray = NewFrame("stray");
    layout->RemoveFrame(stray, false, false); // not in the tree
    layout->RemoveFrame(nullptr, true, true);
    EXPECT_EQ(Shape(), "0");
    // Adding to an empty tree starts it.
    Frame* a = NewFrame("a");
    layout->SetContainingRect(window800);
    layout->AddFrame(nullptr, LayoutManager::Left, a);
    EXPECT_EQ(Shape(), "a");
    EXPECT_EQ(RectOf(a), window800);
    layout->AddFrame(a, LayoutManager::Left, a); // beside itself
    layout->AddFrame(stray, LayoutManager::Left, nullptr);
    EXPECT_EQ(Shape(), "a");
    // A target that is not in the tree: the frame still lands, beside the whole layout.
    Frame* b = NewFrame("b");
    layout->AddFrame(stray, LayoutManager::Right, b);
    EXPECT_EQ(Shape(), "V(a,b)");
    layout->AddFrame(a, LayoutManager::Top, b); // already in the tree
    EXPECT_EQ(Shape(), "V(a,b)");
    layout->SetMaximizedFrame(stray);
    EXPECT_FALSE(layout->HasMaximizedFrame());
    LayoutManager other(&window);
    Frame* foreign = NewFrame("foreign");
    other.SetRootFrame(foreign, window800);
    layout->ReanimateFrame(other.GetRootSplitter()->GetLeftOrTop(), b); // not our placeholder
    layout->MajorizeSplitter(nullptr);
    EXPECT_EQ(Shape(), "V(a,b)");
    ExpectWellFormed();
}

TEST_F(LayoutTree, EditsWithLayoutDisabledChangeTheTreeButPlaceNothing) {
    Frame* a = NewFrame("a");
    layout->SetRootFrame(a, window800);
    window.layoutEnabled = false;
    Frame* b = NewFrame("b");
    int placed = Host(a).placements;
    layout->AddFrame(a, LayoutManager::Right, b);
    layout->Layout(RectT(0, 0, 1000, 700), false, true, false);
    EXPECT_EQ(Shape(), "V(a,b)");
    EXPECT_EQ(Host(a).placements, placed);
    EXPECT_EQ(Host(b).placements, 0);
    window.layoutEnabled = true;
    layout->ReLayout(false, true, false);
    EXPECT_EQ(RectOf(b), RectT(400, 0, 400, 600));
}

TEST_F(LayoutTree, DumpDescribesEveryNode) {
    Frame* a = NewFrame("a");
    layout->SetRootFrame(a, window800);
    EXPECT_EQ(Dump(), "digraph ORVLayoutManager {\n1 [shape=box,label=\"Frame\"];\n}");
    Frame* b = NewFrame("b");
    layout->AddFrame(a, LayoutManager::Right, b);
    layout->RemoveFrame(b, true, false);
    EXPECT_EQ(Dump(), "digraph ORVLayoutManager {\n"
                      "1 [label=\"V Split s:400 l:0 t:0 b:600 r:800\"];\n"
                      "1 -> 2;\n"
                      "1 -> 3;\n"
                      "2 [shape=box,label=\"Frame\"];\n"
                      "3 [shape=box,style=dashed,label=\"Placeholder\"];\n"
                      "}");
}

TEST_F(LayoutTree, ReanimationReopensAFullyHiddenBranch) {
    Frame* a = NewFrame("a");
    layout->SetRootFrame(a, window800);
    Frame* b = NewFrame("b");
    Frame* c = NewFrame("c");
    layout->AddFrame(a, LayoutManager::Right, b);
    layout->AddFrame(b, LayoutManager::Bottom, c);
    layout->RemoveFrame(b, true, true);
    layout->RemoveFrame(c, true, true);
    EXPECT_EQ(Shape(), "V(a,H(_,_))");
    EXPECT_EQ(RectOf(a), window800);
    Splitter* rows = layout->FindFrameForReanimation(b)->GetParent();
    Splitter* columns = rows->GetParent();
    EXPECT_FALSE(columns->GetRightOrBottomVisibleFlag());

    layout->ReanimateFrame(layout->FindFrameForReanimation(b), b);
    EXPECT_TRUE(rows->GetLeftOrTopVisibleFlag());
    EXPECT_FALSE(rows->GetRightOrBottomVisibleFlag()); // c's slot stays closed
    EXPECT_TRUE(columns->IsVisible());                 // the way up is open again
    layout->LayoutNewFrame(b);
    EXPECT_EQ(Shape(), "V(a,H(b,_))");
    EXPECT_EQ(RectOf(b), RectT(400, 0, 400, 600));
    EXPECT_EQ(RectOf(a), RectT(0, 0, 400, 600));
    EXPECT_EQ(layout->StructureProblem(true), "");
}

TEST_F(LayoutTree, TheFirstMadePlaceholderOfATabTypeWins) {
    Frame* a = NewFrame("a");
    layout->SetRootFrame(a, window800);
    Frame* b = NewFrame("b");
    Frame* c = NewFrame("c");
    layout->AddFrame(a, LayoutManager::Right, b);
    layout->AddFrame(a, LayoutManager::Bottom, c);
    Host(c).first = {{"media", "older"}};
    Host(b).first = {{"media", "newer"}};
    layout->RemoveFrame(c, true, false);
    layout->RemoveFrame(b, true, false);
    FrameDataProxy* found = layout->FindFrameForReanimation(std::string("media"));
    ASSERT_NE(found, nullptr);
    EXPECT_EQ(found->GetTabData(), (TabDataList{{"media", "older"}}));
    EXPECT_EQ(layout->FindFrameForReanimation(std::string("med")), nullptr); // whole types only
}
