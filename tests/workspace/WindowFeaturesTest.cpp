// Frames without tabs and the static border elements they carry, snap sizes through the frame's
// chrome, mega zoom, and the library's images.
#include "WorkspaceDoubles.h"

#include "frames/TablessWorkspaceFrame.h"
#include "frames/WorkspaceBorderElement.h"
#include "host/core/Error.h"
#include "host/ui/ResourceManager.h"
#include "host/ui/controls/TabWell.h"

using namespace orvtest;
using orvui::ui::PointT;
using orvui::ui::RectF;
using orvui::ui::RectT;

namespace {

// A tool bar 30 units high that may be torn off.

using WindowFeatures = WorkspaceTest;

} // namespace

TEST_F(WindowFeatures, ATablessFrameHoldsAtMostOnePanelAndAddsNoChrome) {
    boost::intrusive_ptr<TablessWorkspaceFrame> frame = main->CreateTablessFrame(RectT(0, 0, 400, 40));
    EXPECT_EQ(frame->GetTabCount(), 0);
    EXPECT_EQ(frame->GetFrontTabPanel(), nullptr);
    EXPECT_EQ(frame->GetMinimumSize(), PointT(0, 0));
    EXPECT_EQ(frame->GetFrameLocalRect(), RectT());
    EXPECT_EQ(frame->DetachTabPanel(0), nullptr);

    boost::intrusive_ptr<TabPanel> first(new SizedPanel(workspace.get(), {PointT(0, 36), PointT(0, 60)}));
    frame->AddTab(first);
    EXPECT_EQ(frame->GetTabCount(), 1);
    EXPECT_EQ(frame->GetTabPanel(0), first.get());
    EXPECT_EQ(frame->GetTabPanel(1), nullptr);
    EXPECT_EQ(frame->GetMinimumSize(), PointT(0, 36));
    std::vector<PointT> sizes;
    frame->GetSnapSizes(sizes);
    EXPECT_EQ(sizes, (std::vector<PointT>{PointT(0, 36), PointT(0, 60)}));
    TabDataList visible, removed, hidden;
    frame->DoGetTabData(visible, removed, hidden);
    EXPECT_TRUE(visible.empty() && removed.empty() && hidden.empty());

    // A second panel replaces the first, which leaves the frame.
    TabPanel* second = frame->AddTab("editor");
    ASSERT_NE(second, nullptr);
    EXPECT_EQ(frame->GetTab(), second);
    EXPECT_EQ(first->GetFrame(), nullptr);
    EXPECT_EQ(first->UI_GetParentNode(), nullptr);
    EXPECT_EQ(frame->AddTab("no such type"), nullptr);
    EXPECT_EQ(frame->GetTab(), second);

    boost::intrusive_ptr<TabPanel> out = frame->DetachTabPanel(0);
    EXPECT_EQ(out.get(), second);
    EXPECT_EQ(frame->GetTabCount(), 0);
    EXPECT_FALSE(out->UI_IsShown());
}

TEST_F(WindowFeatures, ARippableElementLeavesItsLeftStripToTheGripper) {
    BuildTwoFrames();
    main->SetStaticElement(new ToolBar(workspace.get(), false), LayoutManager::Top, true);
    TabPanel* plain = main->GetStaticElement(LayoutManager::Top);
    ASSERT_NE(plain, nullptr);
    auto* frame = dynamic_cast<TablessWorkspaceFrame*>(plain->GetFrame());
    ASSERT_NE(frame, nullptr);
    EXPECT_FALSE(frame->IsGripperShown());
    EXPECT_EQ(plain->UI_GetRect(), frame->UI_GetLocalBounds());

    main->SetStaticElement(new ToolBar(workspace.get(), true), LayoutManager::Bottom, true);
    TabPanel* rippable = main->GetStaticElement(LayoutManager::Bottom);
    auto* ripFrame = dynamic_cast<TablessWorkspaceFrame*>(rippable->GetFrame());
    ASSERT_NE(ripFrame, nullptr);
    EXPECT_TRUE(ripFrame->IsGripperShown());
    RectF whole = ripFrame->UI_GetLocalBounds();
    EXPECT_EQ(rippable->UI_GetRect(), RectF(8, 0, whole.width - 8, whole.height));
    EXPECT_EQ(ripFrame->GetDragger()->UI_GetRect(), RectF(0, 0, 8, whole.height));
}

TEST_F(WindowFeatures, StaticElementsTakeAWindowEdgeFromTheFramesAndTheDropZones) {
    BuildTwoFrames();
    RectT client = main->UI_GetGlobalClientRect();
    RectT before = left->UI_GetGlobalRect();
    main->SetStaticElement(new ToolBar(workspace.get(), false), LayoutManager::Top, true);

    EXPECT_TRUE(main->HasStaticElement(LayoutManager::Top));
    EXPECT_FALSE(main->HasStaticElement(LayoutManager::Left));
    EXPECT_EQ(main->GetStaticElement(LayoutManager::Left), nullptr);
    EXPECT_EQ(main->GetFrameCount(), 2u); // the tool bar's frame is no tabbed frame
    EXPECT_EQ(main->GetStaticElement(LayoutManager::Top)->UI_GetGlobalRect(),
              RectT(client.left, client.top, client.width, 30));
    RectT after = left->UI_GetGlobalRect();
    EXPECT_EQ(after.top, before.top + 30);
    EXPECT_EQ(after.height, before.height - 30);

    RectT zone;
    main->GetEdgeDropZoneRect(DropZone::Top, zone, true);
    EXPECT_EQ(zone, RectT(client.left, client.top + 30, client.width, 7));
    main->GetEdgeDropZoneRect(DropZone::Left, zone, true);
    EXPECT_EQ(zone, RectT(client.left - 1, client.top + 30, 11, client.height - 30));

    main->RemoveStaticElement(LayoutManager::Top, true);
    EXPECT_FALSE(main->HasStaticElement(LayoutManager::Top));
    EXPECT_EQ(left->UI_GetGlobalRect(), before);
}

TEST_F(WindowFeatures, PressingTheGripperTearsTheElementOffIntoAFloatingWindow) {
    BuildTwoFrames();
    boost::intrusive_ptr<ToolBar> bar(new ToolBar(workspace.get(), true));
    main->SetStaticElement(bar, LayoutManager::Bottom, true);
    auto* frame = dynamic_cast<TablessWorkspaceFrame*>(bar->GetFrame());
    ASSERT_NE(frame, nullptr);
    RectT grip = frame->GetDragger()->UI_GetGlobalRect();
    PointT p(grip.left + grip.width / 2, grip.top + grip.height / 2);
    Desktop::Get().MouseDown(p);
    Desktop::Get().MouseUp(p);

    EXPECT_EQ(bar->conversions, 1);
    EXPECT_FALSE(main->HasStaticElement(LayoutManager::Bottom));
    ASSERT_EQ(workspace->GetWindows().size(), 2u);
    TopLevelWindow* floating = workspace->GetWindows()[1];
    EXPECT_EQ(floating->GetRootFrame()->GetFrontTabPanel(), bar.get());
    EXPECT_TRUE(floating->UI_IsShown());
}

TEST_F(WindowFeatures, SnapSizesPassThroughTheFramesChromeKeepingNoWish) {
    WorkspaceFrame* frame =
        main->CreateRootFrame(new SizedPanel(workspace.get(), {PointT(0, 300), PointT(500, 0)}), true);
    std::vector<PointT> sizes;
    frame->GetSnapSizes(sizes);
    PointT chrome(0, 0);
    frame->ConvertTabToFrameSize(chrome);
    ASSERT_EQ(sizes.size(), 2u);
    EXPECT_EQ(sizes[0], PointT(0, 300 + chrome.y));
    EXPECT_EQ(sizes[1], PointT(500 + chrome.x, 0));
    EXPECT_GT(chrome.y, chrome.x); // the tab well is part of the vertical chrome

    // Frame and panel sizes convert back and forth.
    PointT size(640, 480);
    frame->ConvertTabToFrameSize(size);
    frame->ConvertFrameToTabSize(size);
    EXPECT_EQ(size, PointT(640, 480));
}

TEST_F(WindowFeatures, TheRootFrameIsTheFirstShownOneOrElseTheLast) {
    BuildTwoFrames();
    EXPECT_EQ(main->GetRootFrame(), left);
    left->ShowFrame(false);
    EXPECT_EQ(main->GetRootFrame(), right);
    right->ShowFrame(false);
    EXPECT_EQ(main->GetRootFrame(), right);
    auto empty = workspace->AddTopLevelWindow(false, nullptr);
    EXPECT_EQ(empty->GetRootFrame(), nullptr);
    EXPECT_EQ(empty->GetFrame(0), nullptr);
}

TEST_F(WindowFeatures, MegaZoomCyclesFitContentAndPreferredSize) {
    RectT start(300, 200, 500, 400);
    auto floating = workspace->AddTopLevelWindow(false, &start);
    floating->UI_Show(true);
    WorkspaceFrame* frame = floating->CreateRootFrame(
        new SizedPanel(workspace.get(), {PointT(400, 300), PointT(200, 150)}), true);
    RectT monitor(0, 0, 1920, 1080);
    ASSERT_EQ(floating->GetMegaZoomMonitor(true), monitor);

    floating->MegaZoomToggle(true);
    EXPECT_EQ(floating->UI_GetGlobalStructureRect(), monitor);
    EXPECT_TRUE(floating->IsMegaZoomedToWindow());

    floating->MegaZoomToggle(true); // the panel now covers the monitor exactly
    EXPECT_EQ(frame->UI_LocalToGlobal(frame->GetTabPanelRect()), monitor);
    EXPECT_FALSE(floating->IsMegaZoomedToWindow());

    floating->MegaZoomToggle(true); // the preferred (greatest) panel size, centred
    RectT preferred = floating->UI_GetGlobalStructureRect();
    RectT panel = frame->GetTabPanelRect();
    EXPECT_EQ(panel.width, 400);
    EXPECT_GE(panel.height, 300); // room for a tab-well scroll bar is kept
    EXPECT_LT(preferred.width, monitor.width);
    EXPECT_EQ(preferred.left + preferred.width / 2, 960);
    EXPECT_EQ(preferred.top + preferred.height / 2, 540);

    floating->MegaZoomToggle(true);
    EXPECT_EQ(floating->UI_GetGlobalStructureRect(), monitor);

    // Without a preferred size, content zoom is followed by fitting again.
    BuildTwoFrames();
    main->MegaZoom(TopLevelWindow::FitToMonitor, true);
    main->MegaZoomToggle(true);
    RectT client = main->UI_GetGlobalClientRect();
    EXPECT_EQ(client.top, monitor.top + orvui::ui::MenuBarHeight); // room left for a menu bar
    EXPECT_EQ(client.width, monitor.width);
    main->MegaZoomToggle(true);
    EXPECT_EQ(main->UI_GetGlobalStructureRect(), monitor);
}

TEST_F(WindowFeatures, TheLibrarysImagesComeFromItsResources) {
    for (auto image : {Workspace::CloseBox, Workspace::Gripper, Workspace::DownArrow}) {
        canvasor::FileImageP picture = workspace->GetImage(image);
        ASSERT_TRUE(picture) << int(image);
        EXPECT_EQ(workspace->GetImage(image), picture); // made once
    }
    EXPECT_FALSE(workspace->GetImage(Workspace::WorkspaceImage(7)));
}

TEST_F(WindowFeatures, TheNearestShownNeighbourIsFoundAcrossTheBars) {
    BuildTwoFrames(); // editor | browser
    WorkspaceFrame* bottom = main->AddTabbedFrame(right, "mixer", LayoutManager::Bottom);
    long side = 0;
    EXPECT_EQ(left->GetNearestVisibleSibling(side), right); // the first shown frame across the bar
    EXPECT_EQ(side, 4);
    EXPECT_EQ(bottom->GetNearestVisibleSibling(side), right);
    EXPECT_EQ(side, 1);
    EXPECT_EQ(right->GetNearestVisibleSibling(side), bottom);
    EXPECT_EQ(side, 3);

    long count = 0;
    left->RecurseCountVisibleFrames(left->GetLMFrame()->GetParent(), count);
    EXPECT_EQ(count, 2);
    right->ShowFrame(false);
    count = 0;
    left->RecurseCountVisibleFrames(left->GetLMFrame()->GetParent(), count);
    EXPECT_EQ(count, 1);
    EXPECT_EQ(bottom->GetNearestVisibleSibling(side), nullptr);
    EXPECT_EQ(left->GetNearestVisibleSibling(side), bottom);
}

TEST_F(WindowFeatures, AWorkspaceWithoutResourcesSaysSoAndKeepsWorking) {
    BuildTwoFrames();
    workspace->SetResourceManager(nullptr);
    try {
        workspace->GetResourceManager();
        ADD_FAILURE() << "no error without resources";
    } catch (orvcore::config::Error const& e) {
        EXPECT_EQ(e.Facility(), 105);
        EXPECT_EQ(e.Code(), 20);
    }
    EXPECT_FALSE(workspace->GetImage(Workspace::CloseBox));

    // The bar between the frames still shows its cursor.
    RectT l = left->UI_GetGlobalRect();
    RectT r = right->UI_GetGlobalRect();
    Desktop::Get().MouseMove(PointT((l.Right() + r.left) / 2, l.top + l.height / 2));
    EXPECT_EQ(Desktop::Get().GetCursor(), orvui::ui::cursor::VerticalSplitter);
}
