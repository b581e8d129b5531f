// Users' stories of dragging, through real presses, moves and releases on the headless desktop:
// splitter bars, tabs and whole frames docked at frame and window edges, in frame bodies and tab
// rows, torn off into floating windows, and the overlays that show where they would go. After each
// story the saved document must survive a save, restore and save unchanged.
#include "WorkspaceDoubles.h"

#include "frames/TablessWorkspaceFrame.h"
#include "host/core/PropList.h"
#include "layout/Splitter.h"
#include "persistence/WorkspaceDocument.h"
#include "workspace/TabDragger.h"
#include "workspace/Tracker.h"

using namespace orvtest;
using orvcore::proplist::PropList;
using orvui::ui::PointT;
using orvui::ui::RectT;

namespace {

class Dragging : public WorkspaceTest {
protected:
    void SetUp() override {
        WorkspaceTest::SetUp();
        workspace->log.clear();
        BuildTwoFrames();
        mixer = right->AddTab("mixer", true);
        Desktop::Get().Activate(appWindow);
    }
    void TearDown() override {
        // Every story leaves a workspace whose document survives a round trip.
        if (!HasFailure()) {
            PropList first, again;
            SaveWorkspace(*workspace, first, u"Drag");
            ASSERT_TRUE(RestoreWorkspace(*workspace, first, true, true, false));
            SaveWorkspace(*workspace, again, u"Drag");
            std::string a, b;
            first.OutputAsXMLFragment(a);
            again.OutputAsXMLFragment(b);
            EXPECT_EQ(a, b);
        }
        WorkspaceTest::TearDown();
    }

    static void Press(PointT p) {
        Desktop::Get().MouseMove(p);
        Desktop::Get().MouseDown(p);
    }
    static void MoveTo(PointT p) { Desktop::Get().MouseMove(p); }
    static void Release(PointT p) {
        Desktop::Get().MouseMove(p);
        Desktop::Get().MouseUp(p);
    }
    TabDragger* Dragger() const { return dynamic_cast<TabDragger*>(workspace->GetTracker()); }

    static PointT InZone(DropZoneOverlayWindow* overlay, DropZone::DropType type) {
        PointT point;
        EXPECT_TRUE(overlay->PointInZone(type, point)) << "no zone of type " << int(type);
        return point;
    }

    // Drags the front tab of a frame over another frame and drops it in the zone of a type.
    void DropTabInZone(WorkspaceFrame* from, long tab, WorkspaceFrame* onto, DropZone::DropType type) {
        Press(OnTab(from, tab));
        MoveTo(Middle(onto->UI_GetGlobalRect()));
        ASSERT_NE(main->GetFrameDropZoneOverlay(), nullptr);
        PointT target = InZone(main->GetDropZoneOverlay(), type);
        MoveTo(target);
        ASSERT_EQ(main->GetDropZoneOverlay()->GetActiveDropZone(), type);
        Release(target);
    }

    std::vector<std::string> TabTypes(WorkspaceFrame* frame) const {
        std::vector<std::string> types;
        for (long i = 0; i < frame->GetTabCount(); ++i) {
            types.push_back(frame->GetTabPanel(i)->GetTabType());
        }
        return types;
    }
    WorkspaceFrame* FrameHolding(TabPanel* panel) const {
        return dynamic_cast<WorkspaceFrame*>(panel->GetFrame());
    }
    // Whether one frame lies against a side of another (and alongside it).
    static bool Beside(WorkspaceFrame* frame, WorkspaceFrame* other, DropZone::DropType side) {
        RectT a = frame->UI_GetGlobalRect(), b = other->UI_GetGlobalRect();
        bool rows = a.top < b.Bottom() && b.top < a.Bottom();
        bool columns = a.left < b.Right() && b.left < a.Right();
        constexpr int gap = 12;
        switch (side) {
        case DropZone::Left:
            return rows && a.Right() <= b.left && a.Right() + gap >= b.left;
        case DropZone::Right:
            return rows && a.left >= b.Right() && a.left <= b.Right() + gap;
        case DropZone::Top:
            return columns && a.Bottom() <= b.top && a.Bottom() + gap >= b.top;
        case DropZone::Bottom:
            return columns && a.top >= b.Bottom() && a.top <= b.Bottom() + gap;
        default:
            return false;
        }
    }
    PointT Bar() const {
        RectT l = left->UI_GetGlobalRect(), r = right->UI_GetGlobalRect();
        return PointT((l.Right() + r.left) / 2, l.top + l.height / 2);
    }

    TabPanel* mixer = nullptr;
};

} // namespace

// --- Splitter bars ---

TEST_F(Dragging, ABarFollowsThePointerWithinItsLimits) {
    int leftWidth = left->UI_GetGlobalRect().width;
    PointT bar = Bar();
    Press(bar);
    ASSERT_NE(dynamic_cast<SplitterDragger*>(workspace->GetTracker()), nullptr);
    EXPECT_EQ(Desktop::Get().GetCapture(), main->GetPlatformWindow());
    MoveTo(PointT(bar.x + 100, bar.y + 40)); // along the bar's axis only
    EXPECT_EQ(left->UI_GetGlobalRect().width, leftWidth + 100);
    MoveTo(PointT(bar.x - 5000, bar.y)); // far past the left end: the frame keeps its minimum
    int minimum = left->UI_GetGlobalRect().width;
    EXPECT_GT(minimum, 0);
    EXPECT_LT(minimum, leftWidth);
    MoveTo(PointT(bar.x - 6000, bar.y));
    EXPECT_EQ(left->UI_GetGlobalRect().width, minimum);
    Release(PointT(bar.x - 6000, bar.y));
    EXPECT_EQ(workspace->GetTracker(), nullptr);
    EXPECT_EQ(Desktop::Get().GetCapture(), 0u);
    EXPECT_EQ(left->UI_GetGlobalRect().width, minimum);
}

TEST_F(Dragging, EscapeEndsABarDragWithABeepAndKeepsWhereTheBarIs) {
    PointT bar = Bar();
    int beeps = Desktop::Get().GetBeepCount();
    Press(bar);
    MoveTo(PointT(bar.x + 60, bar.y));
    int moved = left->UI_GetGlobalRect().width;
    Desktop::Get().KeyDown(orvui::ui::key::Escape);
    EXPECT_EQ(workspace->GetTracker(), nullptr);
    EXPECT_EQ(Desktop::Get().GetBeepCount(), beeps + 1);
    EXPECT_EQ(Desktop::Get().GetCapture(), 0u);
    EXPECT_EQ(left->UI_GetGlobalRect().width, moved); // nothing restored
    MoveTo(PointT(bar.x + 200, bar.y));
    EXPECT_EQ(left->UI_GetGlobalRect().width, moved); // and nothing follows any more
    Desktop::Get().MouseUp(PointT(bar.x + 200, bar.y));
}

TEST_F(Dragging, ABarSnapsToAPanelsSizeWithinNineteenPixelsButNotTwenty) {
    // The right frame's panel likes to be 300 wide.
    boost::intrusive_ptr<TabPanel> sized(new SizedPanel(workspace.get(), {PointT(300, 0)}));
    right->AddTab(sized, true);
    PointT wish(300, 0);
    right->ConvertTabToFrameSize(wish);
    RectT r = right->UI_GetGlobalRect();
    PointT bar = Bar();
    // Where the pointer puts the bar when the right frame is exactly as wide as it likes.
    int snapX = bar.x + (r.width - wish.x);
    Press(bar);
    MoveTo(PointT(snapX + 19, bar.y));
    EXPECT_EQ(right->UI_GetGlobalRect().width, wish.x);
    MoveTo(PointT(snapX + 20, bar.y));
    EXPECT_EQ(right->UI_GetGlobalRect().width, wish.x - 20);
    MoveTo(PointT(snapX - 19, bar.y));
    EXPECT_EQ(right->UI_GetGlobalRect().width, wish.x);
    MoveTo(PointT(snapX - 20, bar.y));
    EXPECT_EQ(right->UI_GetGlobalRect().width, wish.x + 20);
    Release(PointT(snapX - 20, bar.y));
}

TEST_F(Dragging, TwoCrossingBarsMoveTogether) {
    WorkspaceFrame* bottomLeft = main->AddTabbedFrame(left, "mixer", LayoutManager::Bottom);
    WorkspaceFrame* bottomRight = main->AddTabbedFrame(right, "editor", LayoutManager::Bottom);
    // Line the two horizontal bars up, then press where all the bars cross.
    RectT l = left->UI_GetGlobalRect(), bl = bottomLeft->UI_GetGlobalRect();
    RectT r = right->UI_GetGlobalRect(), br = bottomRight->UI_GetGlobalRect();
    ASSERT_EQ(l.Bottom(), r.Bottom());
    PointT crossing((l.Right() + r.left) / 2, (l.Bottom() + bl.top) / 2);
    Press(crossing);
    ASSERT_NE(workspace->GetTracker(), nullptr);
    EXPECT_EQ(Desktop::Get().GetCursor(), orvui::ui::cursor::SplitterCrossing);
    MoveTo(PointT(crossing.x + 50, crossing.y + 30));
    Release(PointT(crossing.x + 50, crossing.y + 30));
    EXPECT_EQ(left->UI_GetGlobalRect().width, l.width + 50);
    EXPECT_EQ(bottomLeft->UI_GetGlobalRect().width, bl.width + 50);
    EXPECT_EQ(left->UI_GetGlobalRect().height, l.height + 30);
    EXPECT_EQ(right->UI_GetGlobalRect().height, r.height + 30);
    EXPECT_EQ(bottomRight->UI_GetGlobalRect().top, br.top + 30);
}

// --- Tabs: the threshold ---

TEST_F(Dragging, ATabStartsMovingOnlyPastFivePixels) {
    PointT start = OnTab(right, 0);
    Press(start);
    ASSERT_NE(Dragger(), nullptr);
    EXPECT_EQ(right->GetFrontTabPanel()->GetTabType(), "browser"); // pressed to the front
    MoveTo(PointT(start.x + 3, start.y + 4));                      // exactly 5.0 away
    EXPECT_FALSE(Dragger()->HasStarted());
    EXPECT_NE(Desktop::Get().GetCursor(), orvui::ui::cursor::DragTab);
    MoveTo(PointT(start.x + 5, start.y)); // 5.0 again
    EXPECT_FALSE(Dragger()->HasStarted());
    MoveTo(PointT(start.x + 4, start.y + 4)); // 5.66
    EXPECT_TRUE(Dragger()->HasStarted());
    EXPECT_EQ(Desktop::Get().GetCursor(), orvui::ui::cursor::DragTab);
    Release(PointT(start.x + 4, start.y + 4));
    EXPECT_EQ(workspace->GetTracker(), nullptr);
    EXPECT_EQ(TabTypes(right), (std::vector<std::string>{"browser", "mixer"}));
    EXPECT_EQ(workspace->GetFocusedTabPanel(), right->GetTabPanel(0));
}

// --- Tabs docked on another frame ---

TEST_F(Dragging, ATabDroppedOnAFramesBodyJoinsItsTabs) {
    DropTabInZone(right, 1, left, DropZone::Center);
    EXPECT_EQ(TabTypes(left), (std::vector<std::string>{"editor", "mixer"}));
    EXPECT_EQ(TabTypes(right), (std::vector<std::string>{"browser"}));
    EXPECT_EQ(left->GetFrontTabPanel(), mixer);
    EXPECT_EQ(workspace->GetFocusedTabPanel(), mixer);
    EXPECT_EQ(main->GetDropZoneOverlay(), nullptr);
    EXPECT_EQ(workspace->GetTracker(), nullptr);
}

TEST_F(Dragging, ATabDroppedOnEachEdgeBandOfAFrameMakesAFrameOnThatSide) {
    for (auto side : {DropZone::Left, DropZone::Right, DropZone::Top, DropZone::Bottom}) {
        SCOPED_TRACE(int(side));
        DropTabInZone(right, 1, left, side);
        WorkspaceFrame* made = FrameHolding(mixer);
        ASSERT_NE(made, nullptr);
        ASSERT_NE(made, left);
        EXPECT_EQ(TabTypes(made), std::vector<std::string>{"mixer"});
        EXPECT_EQ(main->GetFrameCount(), 3u);
        EXPECT_TRUE(Beside(made, left, side));
        // Back home for the next side.
        DropTabInZone(made, 0, right, DropZone::Center);
        ASSERT_EQ(main->GetFrameCount(), 2u);
    }
}

TEST_F(Dragging, ATabDroppedInAnotherTabRowGoesWhereThePointerIs) {
    left->AddTab("mixer", true);
    left->AddTab("browser", true); // left: editor, mixer, browser
    TabPanel* browser = right->GetTabPanel(0);
    Press(OnTab(right, 0));
    MoveTo(Middle(left->UI_GetGlobalRect()));
    PointT onSecond = OnTab(left, 1);
    MoveTo(onSecond);
    ASSERT_NE(main->GetDropZoneOverlay(), nullptr);
    EXPECT_EQ(main->GetDropZoneOverlay()->GetActiveDropZone(), DropZone::TabWell);
    Release(onSecond);
    EXPECT_EQ(TabTypes(left), (std::vector<std::string>{"editor", "browser", "mixer", "browser"}));
    EXPECT_EQ(left->GetTabPanel(1), browser);
    EXPECT_EQ(left->GetFrontTabPanel(), browser);
    EXPECT_EQ(TabTypes(right), std::vector<std::string>{"mixer"});
}

TEST_F(Dragging, ATabDroppedOnAWindowEdgeSplitsTheWholeWindow) {
    for (auto side : {DropZone::Left, DropZone::Top, DropZone::Right, DropZone::Bottom}) {
        SCOPED_TRACE(int(side));
        RectT edge;
        main->GetEdgeDropZoneRect(side, edge, true);
        PointT onEdge = Middle(edge);
        Press(OnTab(right, 1));
        MoveTo(Middle(left->UI_GetGlobalRect()));
        MoveTo(onEdge);
        ASSERT_NE(main->GetEdgeDropZoneOverlay(), nullptr);
        EXPECT_EQ(main->GetDropZoneOverlay()->GetActiveDropZone(), side);
        Release(onEdge);
        WorkspaceFrame* made = FrameHolding(mixer);
        ASSERT_NE(made, nullptr);
        // The new frame sits beside everything else, directly under the root.
        Splitter* parent = made->GetLMFrame()->GetParent();
        Splitter* root = main->GetLayoutManager()->GetRootSplitter();
        EXPECT_TRUE(parent == root || parent->GetParent() == root);
        bool vertical = side == DropZone::Left || side == DropZone::Right;
        EXPECT_EQ(parent->IsVertical(), vertical);
        bool first = side == DropZone::Left || side == DropZone::Top;
        EXPECT_EQ(parent->GetLeftOrTop() == made->GetLMFrame(), first);
        DropTabInZone(made, 0, right, DropZone::Center);
        ASSERT_EQ(main->GetFrameCount(), 2u);
    }
}

// --- Tabs within their own row ---

TEST_F(Dragging, ATabReordersLiveInItsOwnRowAndDroppedInPlaceChangesNothing) {
    right->AddTab("editor", true); // right: browser, mixer, editor
    right->BringTabToFront(0L);    // as pressing it will
    PropList before;
    SaveWorkspace(*workspace, before, u"");
    PointT start = OnTab(right, 0);
    Press(start);
    MoveTo(PointT(start.x + 3, start.y));
    MoveTo(PointT(start.x, start.y + 6)); // started, still over its own tab
    ASSERT_TRUE(Dragger()->HasStarted());
    Release(PointT(start.x, start.y + 6));
    PropList after;
    SaveWorkspace(*workspace, after, u"");
    EXPECT_TRUE(before == after);

    TabPanel* browser = right->GetTabPanel(0);
    Press(OnTab(right, 0));
    MoveTo(OnTab(right, 2));
    // Moved while the button is still down.
    EXPECT_EQ(TabTypes(right), (std::vector<std::string>{"mixer", "editor", "browser"}));
    EXPECT_EQ(main->GetDropZoneOverlay(), nullptr);
    MoveTo(OnTab(right, 1));
    EXPECT_EQ(right->GetTabPanel(1), browser);
    Release(OnTab(right, 1));
    EXPECT_EQ(TabTypes(right), (std::vector<std::string>{"mixer", "browser", "editor"}));
    EXPECT_EQ(right->GetFrontTabPanel(), browser);
}

// --- Whole frames ---

TEST_F(Dragging, AWholeFrameDraggedByItsGripperDocksAtAnotherFramesEdge) {
    WorkspaceFrame* bottom = main->AddTabbedFrame(left, "editor", LayoutManager::Bottom);
    PointT grip = Middle(right->GetTabWell()->GetFlyout()->GetGlobalGripperRect());
    Press(grip);
    ASSERT_NE(Dragger(), nullptr);
    EXPECT_TRUE(Dragger()->IsWholeFrame());
    MoveTo(Middle(bottom->UI_GetGlobalRect()));
    EXPECT_EQ(Desktop::Get().GetCursor(), orvui::ui::cursor::DragFrame);
    ASSERT_NE(main->GetFrameDropZoneOverlay(), nullptr);
    PointT target = InZone(main->GetDropZoneOverlay(), DropZone::Bottom);
    MoveTo(target);
    Release(target);
    // The same frame object, with both its tabs, now under the bottom frame.
    EXPECT_EQ(FrameHolding(mixer), right);
    EXPECT_EQ(TabTypes(right), (std::vector<std::string>{"browser", "mixer"}));
    EXPECT_TRUE(Beside(right, bottom, DropZone::Bottom));
    EXPECT_EQ(main->GetFrameCount(), 3u);
}

// --- Tearing off ---

TEST_F(Dragging, ATabTornOffFloatsAndBecomesPermanentOnRelease) {
    RectT outer = main->UI_GetGlobalStructureRect();
    PointT outside(outer.Right() + 150, outer.top + 200);
    Press(OnTab(right, 1));
    MoveTo(PointT(outside.x - 40, outside.y));
    MoveTo(outside);
    TopLevelWindow* floating = Dragger() ? Dragger()->GetDragWindow() : nullptr;
    ASSERT_NE(floating, nullptr);
    EXPECT_TRUE(floating->IsInterim());
    EXPECT_FLOAT_EQ(Desktop::Get().Record(floating->GetPlatformWindow())->opacity, 0.8f);
    EXPECT_EQ(FrameHolding(mixer)->GetTopLevelWindow(), floating);
    // It follows the pointer.
    RectT at = floating->UI_GetGlobalStructureRect();
    MoveTo(PointT(outside.x + 30, outside.y + 20));
    EXPECT_EQ(floating->UI_GetGlobalStructureRect().left, at.left + 30);
    EXPECT_EQ(floating->UI_GetGlobalStructureRect().top, at.top + 20);
    Release(PointT(outside.x + 30, outside.y + 20));
    EXPECT_FALSE(floating->IsInterim());
    EXPECT_FLOAT_EQ(Desktop::Get().Record(floating->GetPlatformWindow())->opacity, 1.0f);
    EXPECT_EQ(workspace->GetWindows().size(), 2u);
    EXPECT_EQ(TabTypes(right), std::vector<std::string>{"browser"});
    EXPECT_EQ(workspace->GetFocusedTabPanel(), mixer);
}

TEST_F(Dragging, HoldingControlMakesNoWindowATarget) {
    Press(OnTab(right, 1));
    Desktop::Get().SetModifiers(4);
    MoveTo(Middle(left->UI_GetGlobalRect()));
    EXPECT_EQ(main->GetDropZoneOverlay(), nullptr);
    ASSERT_NE(Dragger()->GetDragWindow(), nullptr);
    Release(Middle(left->UI_GetGlobalRect()));
    Desktop::Get().SetModifiers(0);
    EXPECT_EQ(TabTypes(left), std::vector<std::string>{"editor"});
    ASSERT_EQ(workspace->GetWindows().size(), 2u);
    EXPECT_EQ(FrameHolding(mixer)->GetTopLevelWindow(), workspace->GetWindows()[1]);
}

TEST_F(Dragging, TheOnlyTabOfAFloatingWindowMovesThatWindow) {
    RectT start(1200, 200, 300, 250);
    auto floating = workspace->AddTopLevelWindow(false, &start);
    floating->UI_Show(true);
    WorkspaceFrame* frame = floating->CreateRootFrame("editor", true, true);
    TabPanel* editor = frame->GetFrontTabPanel();
    PointT grab = OnTab(frame, 0);
    Press(grab);
    MoveTo(PointT(grab.x + 40, grab.y + 30));
    MoveTo(PointT(grab.x + 80, grab.y + 60));
    Release(PointT(grab.x + 80, grab.y + 60));
    // Still one floating window, holding the same panel, now further down and right.
    ASSERT_EQ(workspace->GetWindows().size(), 2u);
    TopLevelWindow* now = workspace->GetWindows()[1];
    EXPECT_EQ(FrameHolding(editor)->GetTopLevelWindow(), now);
    EXPECT_GT(now->UI_GetGlobalStructureRect().left, start.left + 40);
    EXPECT_GT(now->UI_GetGlobalStructureRect().top, start.top + 30);
    EXPECT_FALSE(now->IsInterim());
    EXPECT_EQ(main->GetFrameCount(), 2u);
}

TEST_F(Dragging, ADropIntoAnEmptyMainWindowMakesTheContentItsRoot) {
    RectT start(1200, 200, 300, 250);
    auto floating = workspace->AddTopLevelWindow(false, &start);
    floating->UI_Show(true);
    WorkspaceFrame* frame = floating->CreateRootFrame("editor", true, true);
    frame->AddTab("mixer", true);
    // Empty the main window.
    workspace->RemoveTab(left, 0L, false, false);
    workspace->RemoveTab(right, 0L, false, false);
    workspace->RemoveTab(right, 0L, false, false);
    ASSERT_EQ(main->GetRootFrame(), nullptr);
    TabPanel* moved = frame->GetTabPanel(1);
    Press(OnTab(frame, 1));
    MoveTo(Middle(main->UI_GetGlobalClientRect()));
    Release(Middle(main->UI_GetGlobalClientRect()));
    ASSERT_NE(main->GetRootFrame(), nullptr);
    EXPECT_EQ(main->GetRootFrame()->GetFrontTabPanel(), moved);
    EXPECT_EQ(TabTypes(frame), std::vector<std::string>{"editor"});
}

// --- Overlays ---

TEST_F(Dragging, TheOverlayTintsTheTargetFrameAndGoesWhenThePointerLeaves) {
    Press(OnTab(right, 1));
    MoveTo(Middle(left->UI_GetGlobalRect()));
    DropZoneOverlayWindow* overlay = main->GetFrameDropZoneOverlay();
    ASSERT_NE(overlay, nullptr);
    EXPECT_FLOAT_EQ(Desktop::Get().Record(overlay->GetPlatformWindow())->opacity, 0.15f);
    EXPECT_EQ(overlay->GetActiveDropZone(), DropZone::Center);
    // The active zone is a 15% tint of dark blue over the editor's red.
    PointT probe = InZone(overlay, DropZone::Center);
    canvasor::ColorRGBA seen = SeenAt(probe);
    canvasor::ColorRGBA expected{0.85f * EditorPaint.r, 0.85f * EditorPaint.g,
                                 0.85f * EditorPaint.b + 0.15f * 0.6f, 1};
    EXPECT_TRUE(Looks(seen, expected, 0.02f)) << seen.r << "," << seen.g << "," << seen.b;
    WriteSnapshot();
    // An inactive zone is a white tint.
    PointT edgeBand = InZone(overlay, DropZone::Left);
    canvasor::ColorRGBA white{0.85f * EditorPaint.r + 0.15f, 0.85f * EditorPaint.g + 0.15f,
                              0.85f * EditorPaint.b + 0.15f, 1};
    EXPECT_TRUE(Looks(SeenAt(PointT(edgeBand.x, edgeBand.y)), white, 0.02f));
    // Into the right frame (the source, one tab would stay): the overlay moves there; out of the
    // window altogether it goes.
    RectT outer = main->UI_GetGlobalStructureRect();
    MoveTo(PointT(outer.Right() + 200, outer.top + 100));
    EXPECT_EQ(main->GetDropZoneOverlay(), nullptr);
    Release(PointT(outer.Right() + 200, outer.top + 100));
}

TEST_F(Dragging, AWindowsOnlyFrameIsNotOfferedThatWindowsEdges) {
    RectT start(1200, 200, 400, 300);
    auto floating = workspace->AddTopLevelWindow(false, &start);
    floating->UI_Show(true);
    WorkspaceFrame* frame = floating->CreateRootFrame("editor", true, true);
    frame->AddTab("mixer", true);
    PointT grip = Middle(frame->GetTabWell()->GetFlyout()->GetGlobalGripperRect());
    Press(grip);
    RectT edge;
    floating->GetEdgeDropZoneRect(DropZone::Bottom, edge, true);
    // The whole frame is the window's only content: it moves the window, offering nothing.
    MoveTo(PointT(grip.x + 10, grip.y + 10));
    EXPECT_EQ(floating->GetDropZoneOverlay(), nullptr);
    Release(PointT(grip.x + 10, grip.y + 10));
    // A single tab of two may go to an edge of its own window.
    Press(OnTab(frame, 1));
    frame = FrameHolding(frame->GetTabPanel(0));
    TopLevelWindow* window = frame->GetTopLevelWindow();
    window->GetEdgeDropZoneRect(DropZone::Bottom, edge, true);
    MoveTo(Middle(frame->UI_GetGlobalRect()));
    MoveTo(Middle(edge));
    ASSERT_NE(window->GetEdgeDropZoneOverlay(), nullptr);
    Release(Middle(edge));
    EXPECT_EQ(window->GetFrameCount(), 2u);
}

// --- Bars along the window's edges ---

TEST_F(Dragging, ABarTornOffByItsGripperFollowsThePointerAndStaysWhereDropped) {
    main->SetStaticElement(new ToolBar(workspace.get(), true), LayoutManager::Top, true);
    TabPanel* bar = main->GetStaticElement(LayoutManager::Top);
    auto* holder = dynamic_cast<TablessWorkspaceFrame*>(bar->GetFrame());
    ASSERT_NE(holder, nullptr);
    PointT grip = Middle(holder->GetDragger()->UI_GetGlobalRect());
    Press(grip);
    // The bar left its edge at once and rides in an interim window under the pointer.
    EXPECT_FALSE(main->HasStaticElement(LayoutManager::Top));
    ASSERT_NE(Dragger(), nullptr);
    TopLevelWindow* floating = Dragger()->GetDragWindow();
    ASSERT_NE(floating, nullptr);
    EXPECT_EQ(Desktop::Get().GetCapture(), main->GetPlatformWindow());
    RectT outer = main->UI_GetGlobalStructureRect();
    PointT away(outer.Right() + 200, outer.top + 300);
    MoveTo(PointT(away.x - 20, away.y));
    MoveTo(away);
    RectT at = floating->UI_GetGlobalStructureRect();
    EXPECT_TRUE(at.Contains(away));
    Release(away);
    EXPECT_FALSE(floating->IsInterim());
    EXPECT_EQ(FrameHolding(bar)->GetTopLevelWindow(), floating);
    EXPECT_EQ(workspace->GetWindows().size(), 2u);
}

TEST_F(Dragging, ABarDroppedOnTheMainWindowsTopEdgeBecomesItsToolBar) {
    boost::intrusive_ptr<TabPanel> toolbar(new ToolBar(workspace.get(), true));
    right->AddTab(toolbar, true); // right: browser, mixer, toolbar
    RectT edge;
    main->GetEdgeDropZoneRect(DropZone::Top, edge, true);
    Press(OnTab(right, 2));
    MoveTo(Middle(left->UI_GetGlobalRect()));
    MoveTo(Middle(edge));
    ASSERT_NE(main->GetEdgeDropZoneOverlay(), nullptr);
    Release(Middle(edge));
    EXPECT_EQ(main->GetStaticElement(LayoutManager::Top), toolbar.get());
    EXPECT_EQ(TabTypes(right), (std::vector<std::string>{"browser", "mixer"}));
    EXPECT_EQ(main->GetFrameCount(), 2u);
}

// --- Ending ---

TEST_F(Dragging, EscapeOrALostCaptureEndsATabDragWithoutDocking) {
    int beeps = Desktop::Get().GetBeepCount();
    Press(OnTab(right, 1));
    MoveTo(Middle(left->UI_GetGlobalRect()));
    ASSERT_NE(main->GetDropZoneOverlay(), nullptr);
    Desktop::Get().KeyDown(orvui::ui::key::Escape);
    EXPECT_EQ(workspace->GetTracker(), nullptr);
    EXPECT_EQ(Desktop::Get().GetBeepCount(), beeps + 1);
    EXPECT_EQ(main->GetDropZoneOverlay(), nullptr);
    Desktop::Get().MouseUp(Middle(left->UI_GetGlobalRect()));
    EXPECT_EQ(TabTypes(right), (std::vector<std::string>{"browser", "mixer"}));
    EXPECT_EQ(TabTypes(left), std::vector<std::string>{"editor"});

    // Torn off, then the capture is lost: the floating window stays, made permanent.
    RectT outer = main->UI_GetGlobalStructureRect();
    Press(OnTab(right, 1));
    MoveTo(PointT(outer.Right() + 100, outer.top + 100));
    TopLevelWindow* floating = Dragger()->GetDragWindow();
    ASSERT_NE(floating, nullptr);
    Desktop::Get().ReleaseCapture();
    EXPECT_EQ(workspace->GetTracker(), nullptr);
    EXPECT_EQ(Desktop::Get().GetBeepCount(), beeps + 2);
    EXPECT_FALSE(floating->IsInterim());
    EXPECT_EQ(FrameHolding(mixer)->GetTopLevelWindow(), floating);
    Desktop::Get().MouseUp(PointT(outer.Right() + 100, outer.top + 100));
}

TEST_F(Dragging, TheHostHearsWhenDragsBeginAndEnd) {
    PointT bar = Bar();
    Press(bar);
    MoveTo(PointT(bar.x + 30, bar.y));
    Release(PointT(bar.x + 30, bar.y));
    PointT tab = OnTab(right, 0);
    Press(tab);
    Release(tab);
    EXPECT_EQ(workspace->log,
              (std::vector<std::string>{"bar begin", "bar end", "tab begin browser", "tab end browser"}));
    // A second drag replaces the first, which ends.
    Press(tab);
    ASSERT_NE(workspace->GetTracker(), nullptr);
    workspace->AcquireSplitterDragger(main, main->UI_GlobalToLocal(Bar()));
    EXPECT_EQ(workspace->log.back(), "tab end browser");
    workspace->ReleaseTracker(false);
    Desktop::Get().MouseUp(tab);
}

// --- Overlay hit tests ---

TEST(DropZoneOverlay, PointsOnAnEdgeAreInsideAndDegeneratePolygonsHoldLittle) {
    using Overlay = DropZoneOverlayWindow;
    std::vector<PointT> square{PointT(0, 0), PointT(10, 0), PointT(10, 10), PointT(0, 10)};
    EXPECT_TRUE(Overlay::PolygonContains(square, PointT(5, 5)));
    EXPECT_TRUE(Overlay::PolygonContains(square, PointT(10, 5))); // on the right edge
    EXPECT_TRUE(Overlay::PolygonContains(square, PointT(5, 10))); // on the bottom edge
    EXPECT_FALSE(Overlay::PolygonContains(square, PointT(11, 5)));
    EXPECT_FALSE(Overlay::PolygonContains(square, PointT(-1, 5)));
    std::vector<PointT> repeated{PointT(0, 0), PointT(0, 0), PointT(10, 0), PointT(10, 10), PointT(10, 10)};
    EXPECT_TRUE(Overlay::PolygonContains(repeated, PointT(8, 3)));
    EXPECT_FALSE(Overlay::PolygonContains(repeated, PointT(3, 8)));
    EXPECT_FALSE(Overlay::PolygonContains({}, PointT(0, 0)));
    EXPECT_TRUE(Overlay::PolygonContains({PointT(4, 4), PointT(4, 4)}, PointT(4, 4)));
    EXPECT_FALSE(Overlay::PolygonContains({PointT(4, 4)}, PointT(4, 5)));
    // A trapezoid like an edge band's.
    std::vector<PointT> band{PointT(0, 0), PointT(100, 0), PointT(90, 10), PointT(10, 10)};
    EXPECT_TRUE(Overlay::PolygonContains(band, PointT(50, 5)));
    EXPECT_FALSE(Overlay::PolygonContains(band, PointT(2, 9)));
    EXPECT_TRUE(Overlay::PolygonContains(band, PointT(5, 5))); // on the slanted side
}

TEST_F(Dragging, OverlaysKeepOffTheWindowsEdgeZonesAndPaintAnEdgeAsItsWholeRectangle) {
    Press(OnTab(right, 1));
    MoveTo(Middle(left->UI_GetGlobalRect()));
    FrameDropZoneOverlayWindow* overlay = main->GetFrameDropZoneOverlay();
    ASSERT_NE(overlay, nullptr);
    // The left frame lies along the window's left edge: its overlay starts where that edge's zone ends.
    RectT frame = left->UI_LocalToGlobal(left->GetFrameRect());
    RectT bounds;
    overlay->GetGlobalRect(&bounds);
    std::vector<long> exclusions;
    main->CalculateDropZoneExclusionsForEdges(frame, exclusions);
    ASSERT_GT(exclusions[1], 0);
    EXPECT_EQ(bounds.left, frame.left + exclusions[1]);
    EXPECT_EQ(Desktop::Get().Record(overlay->GetPlatformWindow())->rect.left, bounds.left);
    // Zones are tried in order: the first that holds the point wins.
    PointT centre = InZone(overlay, DropZone::Center);
    EXPECT_EQ(overlay->DropZoneFromPoint(centre), DropZone::Center);
    EXPECT_EQ(overlay->DropZoneFromPoint(PointT(-100, -100)), DropZone::None);

    RectT edge;
    main->GetEdgeDropZoneRect(DropZone::Left, edge, true);
    MoveTo(Middle(edge));
    EdgeDropZoneOverlayWindow* edgeOverlay = main->GetEdgeDropZoneOverlay();
    ASSERT_NE(edgeOverlay, nullptr);
    EXPECT_EQ(edgeOverlay->GetZoneCount(), 1u);
    RectT shown = Desktop::Get().Record(edgeOverlay->GetPlatformWindow())->rect;
    edgeOverlay->GetGlobalRect(&bounds);
    EXPECT_EQ(bounds, RectT(shown.left + 1, shown.top + 1, shown.width - 2, shown.height - 2));
    // The whole rectangle is filled green-blue, corners too, though the hit test is the trapezoid.
    canvasor::Image image(shown.width, shown.height);
    {
        canvasor::Canvasor c(image);
        edgeOverlay->UI_Draw(c);
    }
    canvasor::ColorRGBA corner = image.Pixel(shown.width / 2, 2);
    EXPECT_TRUE(Looks(corner, canvasor::ColorRGBA{0, 0.7f, 0.5f, 1}, 0.02f));
    Release(Middle(edge));
    DropTabInZone(FrameHolding(mixer), 0, right, DropZone::Center);
}

TEST_F(Dragging, AnOverlayWithoutANativeWindowIgnoresShowOpacityAndRepaints) {
    boost::intrusive_ptr<OverlayView> view(new OverlayView(main, main, nullptr, RectT(), true));
    EXPECT_FALSE(view->OSWindowBacked());
    EXPECT_EQ(view->GetPlatformWindow(), 0u);
    bool shown = view->UI_IsShown();
    view->UI_Show(!shown);
    EXPECT_EQ(view->UI_IsShown(), shown);
    view->UI_SetOpacity(0.3f);
    EXPECT_FLOAT_EQ(view->UI_GetOpacity(), 1.0f);
    view->UI_Invalidate();
    // A backed one does as it is told.
    boost::intrusive_ptr<OverlayWindow> backed(
        new OverlayWindow(main, main, nullptr, RectT(300, 300, 50, 50), false));
    backed->UI_SetOpacity(0.3f);
    EXPECT_FLOAT_EQ(Desktop::Get().Record(backed->GetPlatformWindow())->opacity, 0.3f);
    EXPECT_EQ(backed->UI_GetNodeID(), "OverlayWindow");
}

TEST_F(Dragging, ABarTornOffOverAnEmptyMainWindowDocksThereAndTheDragStillEnds) {
    boost::intrusive_ptr<TabPanel> bar(new ToolBar(workspace.get(), true));
    main->SetStaticElement(bar, LayoutManager::Bottom, true);
    workspace->RemoveTab(left, 0L, false, false);
    workspace->RemoveTab(right, 0L, false, false);
    workspace->RemoveTab(right, 0L, false, false);
    ASSERT_EQ(main->GetRootFrame(), nullptr);
    auto* holder = dynamic_cast<TablessWorkspaceFrame*>(bar->GetFrame());
    ASSERT_NE(holder, nullptr);
    PointT grip = Middle(holder->GetDragger()->UI_GetGlobalRect());
    Press(grip);
    PointT inside = Middle(main->UI_GetGlobalClientRect());
    MoveTo(inside); // over the empty main window: the bar becomes its content at once
    ASSERT_NE(main->GetRootFrame(), nullptr);
    EXPECT_EQ(main->GetRootFrame()->GetFrontTabPanel(), bar.get());
    EXPECT_EQ(workspace->GetWindows().size(), 1u);
    MoveTo(PointT(inside.x + 20, inside.y));
    Release(PointT(inside.x + 20, inside.y));
    EXPECT_EQ(workspace->GetTracker(), nullptr);
    EXPECT_EQ(Desktop::Get().GetCapture(), 0u);
    EXPECT_EQ(workspace->GetFocusedTabPanel(), bar.get());
}

TEST_F(Dragging, APanelThatEndsTheDragWhileItDocksDoesNotPullItFromUnderItself) {
    // A panel that ends the running drag the moment it is shown in its new place.
    class Impatient : public PaintedPanel {
    public:
        explicit Impatient(Workspace* ws)
            : PaintedPanel(ws, nullptr, "mixer", MixerPaint, nullptr) {}
        void UI_Show(bool show) override {
            PaintedPanel::UI_Show(show);
            if (show && armed && GetWorkspace()->GetTracker()) {
                armed = false;
                GetWorkspace()->ReleaseTracker(false);
            }
        }
        bool armed = false;
    };
    RectT start(1200, 200, 300, 250);
    auto floating = workspace->AddTopLevelWindow(false, &start);
    floating->UI_Show(true);
    WorkspaceFrame* frame = floating->CreateRootFrame("editor", true, true);
    boost::intrusive_ptr<Impatient> moved(new Impatient(workspace.get()));
    frame->AddTab(moved, true);
    workspace->RemoveTab(left, 0L, false, false);
    workspace->RemoveTab(right, 0L, false, false);
    workspace->RemoveTab(right, 0L, false, false);
    ASSERT_EQ(main->GetRootFrame(), nullptr);
    Press(OnTab(frame, 1));
    moved->armed = true;
    MoveTo(Middle(main->UI_GetGlobalClientRect())); // docks into the empty main window, showing it
    EXPECT_FALSE(moved->armed);
    EXPECT_EQ(workspace->GetTracker(), nullptr);
    ASSERT_NE(main->GetRootFrame(), nullptr);
    EXPECT_EQ(main->GetRootFrame()->GetFrontTabPanel(), moved.get());
    MoveTo(PointT(10, 10)); // nothing follows any more
    EXPECT_EQ(main->GetRootFrame()->GetFrontTabPanel(), moved.get());
    Release(PointT(10, 10));
}
