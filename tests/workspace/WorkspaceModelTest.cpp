// The workspace's rules with sharp edges: identity and touch stamps, the counters, creator
// registration, windows that may or may not go, closing panels (cached, hidden, obliterated) and what
// empties out after them, focus after a removal, detaching tabs, and the edge drop zones.
#include "WorkspaceDoubles.h"

#include <algorithm>

using namespace orvtest;
using orvui::ui::PointT;
using orvui::ui::RectT;

namespace {

std::vector<std::string> TabTypes(WorkspaceFrame const* frame) {
    std::vector<std::string> types;
    for (long i = 0; i < frame->GetTabCount(); ++i) {
        types.push_back(frame->GetTabPanel(i)->GetTabType());
    }
    return types;
}

bool IsChildOf(orvui::ui::UI_Container const& parent, orvui::ui::UI_Node const* node) {
    for (std::size_t i = 0; i < parent.ChildSize(); ++i) {
        if (parent.ChildGet(i) == node) {
            return true;
        }
    }
    return false;
}

} // namespace

using WorkspaceModel = WorkspaceTest;

TEST_F(WorkspaceModel, PanelsGetDistinctIdentifiersAndOnlyFramedPanelsAreStamped) {
    BuildTwoFrames();
    TabPanel* editor = left->GetFrontTabPanel();
    TabPanel* browser = right->GetFrontTabPanel();
    EXPECT_NE(editor->GetID(), browser->GetID());
    EXPECT_GT(browser->GetTouchStamp(), editor->GetTouchStamp());

    // A panel made without a frame has no stamp and touching it gives it none.
    boost::intrusive_ptr<TabPanel> loose =
        workspace->FindCreator("mixer")->CreateTabPanel(workspace.get(), nullptr);
    EXPECT_EQ(loose->GetTouchStamp(), 0u);
    loose->Touch();
    EXPECT_EQ(loose->GetTouchStamp(), 0u);
    EXPECT_GT(loose->GetID(), browser->GetID());

    // The last touched panel is the newest stamp over every window.
    EXPECT_EQ(workspace->GetLastTouchedTabPanel(), browser);
    editor->Touch();
    EXPECT_EQ(workspace->GetLastTouchedTabPanel(), editor);
    auto floating = workspace->AddTopLevelWindow(false, nullptr);
    TabPanel* mixer = floating->CreateRootFrame("mixer", false, true)->GetFrontTabPanel();
    EXPECT_EQ(workspace->GetLastTouchedTabPanel(), mixer);
    EXPECT_EQ(main->GetLastTouchedTabPanel(), editor);

    // Restoring a document may set the stamp counter back; later stamps continue from there.
    workspace->SetFreshTabTimeStamp(100);
    browser->Touch();
    EXPECT_EQ(browser->GetTouchStamp(), 101u);
}

TEST_F(WorkspaceModel, CountersNestAndTheFirstCreatorForATypeWins) {
    workspace->SetLayoutEnabled(false);
    workspace->SetLayoutEnabled(false);
    workspace->SetLayoutEnabled(true);
    EXPECT_FALSE(workspace->GetLayoutEnabled());
    EXPECT_FALSE(main->GetLayoutEnabled());
    workspace->SetLayoutEnabled(true);
    EXPECT_TRUE(main->GetLayoutEnabled());

    workspace->SetCreateTabPanelAssertionMode(true);
    workspace->SetCreateTabPanelAssertionMode(true);
    workspace->SetCreateTabPanelAssertionMode(false);
    EXPECT_TRUE(workspace->GetCreateTabPanelAssertionMode());
    workspace->SetCreateTabPanelAssertionMode(false);
    EXPECT_FALSE(workspace->GetCreateTabPanelAssertionMode());

    TabCreator* first = workspace->FindCreator("editor");
    auto second = std::make_unique<PaintedPanelCreator>(PanelKind{"editor", MixerPaint, true}, nullptr);
    workspace->RegisterTabCreator(second.get());
    EXPECT_EQ(workspace->FindCreator("editor"), first);
    EXPECT_FALSE(workspace->TabTypeHidesWhenClosed("editor"));
    EXPECT_EQ(workspace->FindCreator("nothing"), nullptr);

    // Unregistering hands the creator back; a type without a creator adds nothing.
    std::unique_ptr<TabCreator> returned(workspace->FindCreator("mixer"));
    workspace->UnregisterTabCreator("mixer");
    EXPECT_EQ(workspace->FindCreator("mixer"), nullptr);
    WorkspaceFrame* root = main->CreateRootFrame("editor", true, true);
    EXPECT_EQ(root->AddTab("mixer", true), nullptr);
    EXPECT_EQ(root->GetTabCount(), 1);
}

TEST_F(WorkspaceModel, TheMainWindowStaysAndAFloatingWindowGoes) {
    BuildTwoFrames();
    EXPECT_FALSE(workspace->RemoveWindow(main, true) && !IsChildOf(*workspace, main));
    EXPECT_TRUE(IsChildOf(*workspace, main));
    EXPECT_EQ(workspace->GetMainTopLevelWindow(), main);

    auto floating = workspace->AddTopLevelWindow(false, nullptr);
    floating->CreateRootFrame("mixer", true, true);
    EXPECT_EQ(workspace->GetWindows().size(), 2u);
    EXPECT_TRUE(workspace->RemoveWindow(floating.get(), true));
    EXPECT_EQ(workspace->GetWindows().size(), 1u);

    // A floating window whose panel refuses to close stays.
    auto stubborn = workspace->AddTopLevelWindow(false, nullptr);
    Painted(stubborn->CreateRootFrame("mixer", true, true)->GetFrontTabPanel())->allowClose = false;
    EXPECT_FALSE(workspace->RemoveWindow(stubborn.get(), true));
    EXPECT_TRUE(IsChildOf(*workspace, stubborn.get()));
}

TEST_F(WorkspaceModel, ClosingAPanelRemembersItInItsFrame) {
    BuildTwoFrames();
    right->AddTab("mixer", true);
    Painted(right->GetTabPanel(0))->state = "scrolled to bar 12";
    ASSERT_TRUE(workspace->RemoveTab(right, 0L, true, true));
    EXPECT_EQ(TabTypes(right), std::vector<std::string>{"mixer"});
    ASSERT_EQ(right->GetRemovedTabData().size(), 1u);
    EXPECT_EQ(right->GetRemovedTabData()[0].first, "browser");

    // Reopened in place, the panel gets its state back and the entry is used up.
    TabPanel* back = right->ReanimateTab("browser");
    ASSERT_NE(back, nullptr);
    EXPECT_EQ(Painted(back)->state, "scrolled to bar 12");
    EXPECT_FALSE(right->HasRemovedTabData());
    EXPECT_EQ(right->ReanimateTab("browser"), nullptr);

    // Without caching nothing is remembered.
    ASSERT_TRUE(workspace->RemoveTab(right, back, false, true));
    EXPECT_FALSE(right->HasRemovedTabData());
    EXPECT_FALSE(workspace->RemoveTab(right, 7L, true, true));
}

TEST_F(WorkspaceModel, HidingAndObliteratingPanelsFollowTheirCreators) {
    Register({"scope", MixerPaint, /*hides*/ true});
    Register({"render", MixerPaint, false, /*obliterates*/ true});
    Register({"meter", MixerPaint, false, /*obliterates*/ true, /*savesState*/ true});
    BuildTwoFrames();
    TabPanel* scope = right->AddTab("scope", true);
    right->AddTab("render", true);
    right->AddTab("meter", true);

    ASSERT_TRUE(workspace->RemoveTab(right, scope, true, true));
    ASSERT_EQ(right->HiddenTabs().size(), 1u);
    EXPECT_EQ(right->HiddenTabs().front().get(), scope);
    EXPECT_FALSE(right->HasRemovedTabData());

    ASSERT_TRUE(workspace->RemoveTab(right, right->GetTabPanel(1), true, true));
    EXPECT_EQ(workspace->log, std::vector<std::string>{"obliterating render"});
    EXPECT_FALSE(right->HasRemovedTabData()); // obliterated without its state

    ASSERT_TRUE(workspace->RemoveTab(right, right->GetTabPanel(1), true, true));
    ASSERT_EQ(right->GetRemovedTabData().size(), 1u);
    EXPECT_EQ(right->GetRemovedTabData()[0].first, "meter");

    // Ignoring obliteration caches as for any panel.
    TabPanel* render = right->AddTab("render", true);
    ASSERT_TRUE(workspace->RemoveTab(right, render, true, false));
    EXPECT_EQ(right->GetRemovedTabData().back().first, "render");
    EXPECT_TRUE(right->ReanimateTab(right->HiddenTabs().front()));
    EXPECT_EQ(right->GetFrontTabPanel(), scope);
}

TEST_F(WorkspaceModel, AnEmptiedFrameKeepsItsPlaceOnlyWhileItRemembersPanels) {
    Register({"scope", MixerPaint, /*hides*/ true});
    BuildTwoFrames();
    WorkspaceFrame* bottom = main->AddTabbedFrame(left, "scope", LayoutManager::Bottom);
    ASSERT_EQ(main->GetFrameCount(), 3u);
    boost::intrusive_ptr<WorkspaceFrame> keepBottom(bottom);

    // The hiding panel's frame goes out of the window but is kept, hidden, to come back.
    TabPanel* scope = bottom->GetFrontTabPanel();
    ASSERT_TRUE(workspace->RemoveTab(bottom, 0L, true, true));
    EXPECT_FALSE(IsChildOf(*main, bottom));
    ASSERT_EQ(main->HiddenFrames().size(), 1u);
    EXPECT_TRUE(main->CanReanimateFrame(boost::intrusive_ptr<TabPanel>(scope)));
    EXPECT_TRUE(main->ReanimateFrame(boost::intrusive_ptr<TabPanel>(scope)));
    EXPECT_EQ(scope->GetFrame()->GetTopLevelWindow(), main);
    EXPECT_EQ(main->GetFrameCount(), 3u);

    // A closed frame with cached data keeps a placeholder that brings it back by tab type.
    ASSERT_TRUE(workspace->RemoveTab(right, 0L, true, true));
    EXPECT_EQ(main->GetFrameCount(), 2u);
    EXPECT_TRUE(main->HasReanimatableFrames());
    EXPECT_TRUE(main->CanReanimateFrame("browser"));
    EXPECT_TRUE(main->ReanimateFrame("browser"));
    EXPECT_EQ(main->GetFrameCount(), 3u);

    // Without caching the frame is simply gone.
    WorkspaceFrame* gone = main->GetFrame(main->GetFrameCount() - 1);
    std::string goneType = gone->GetFrontTabPanel()->GetTabType();
    ASSERT_TRUE(workspace->RemoveTab(gone, 0L, false, true));
    EXPECT_EQ(main->GetFrameCount(), 2u);
    EXPECT_FALSE(main->CanReanimateFrame(goneType));
}

TEST_F(WorkspaceModel, AnEmptiedFloatingWindowGoesAndFocusReturnsToTheMainWindow) {
    BuildTwoFrames();
    auto floating = workspace->AddTopLevelWindow(false, nullptr);
    floating->UI_Show(true);
    WorkspaceFrame* frame = floating->CreateRootFrame("mixer", true, true);
    workspace->SetFocusedTabPanel(frame->GetFrontTabPanel());
    ASSERT_EQ(workspace->GetFocusedTabPanel(), frame->GetFrontTabPanel());

    ASSERT_TRUE(workspace->RemoveTab(frame, 0L, false, true));
    EXPECT_FALSE(IsChildOf(*workspace, floating.get()));
    TabPanel* focused = workspace->GetFocusedTabPanel();
    ASSERT_NE(focused, nullptr);
    EXPECT_EQ(focused->GetFrame()->GetTopLevelWindow(), main);
    EXPECT_EQ(focused, main->GetRootFrame()->GetFrontTabPanel());
}

TEST_F(WorkspaceModel, ClosingTheFocusedPanelFocusesTheNextOneInItsFrame) {
    BuildTwoFrames();
    TabPanel* mixer = right->AddTab("mixer", true);
    ASSERT_EQ(workspace->GetFocusedTabPanel(), mixer);
    ASSERT_TRUE(workspace->RemoveTab(right, mixer, true, true));
    EXPECT_EQ(workspace->GetFocusedTabPanel(), right->GetFrontTabPanel());
    EXPECT_EQ(right->GetFrontTabPanel()->GetTabType(), "browser");
}

TEST_F(WorkspaceModel, DetachingTabsKeepsASensibleFrontTab) {
    WorkspaceFrame* frame = main->CreateRootFrame("editor", true, true);
    frame->AddTabs(std::vector<std::string>{"browser", "mixer"});
    TabPanel* r = frame->GetTabPanel(2);

    frame->BringTabToFront(1);
    boost::intrusive_ptr<TabPanel> q = frame->DetachTabPanel(1);
    EXPECT_EQ(q->GetFrame(), nullptr);
    EXPECT_FALSE(q->UI_IsShown());
    EXPECT_EQ(frame->GetFrontTabIndex(), 1);
    EXPECT_EQ(frame->GetFrontTabPanel(), r);

    frame->AddTab(q, 1, true); // editor, browser, mixer again
    frame->BringTabToFront(2);
    boost::intrusive_ptr<TabPanel> last = frame->DetachTabPanel(2);
    EXPECT_EQ(frame->GetFrontTabPanel(), q.get());

    frame->AddTabs(std::vector<boost::intrusive_ptr<TabPanel>>{last});
    frame->AddTab("editor", true);
    frame->BringTabToFront(2);
    TabPanel* shown = frame->GetFrontTabPanel();
    // Closing a tab behind the front one does not change what the user is looking at.
    frame->DetachTabPanel(0);
    EXPECT_EQ(frame->GetFrontTabIndex(), 1);
    EXPECT_EQ(frame->GetFrontTabPanel(), shown);
    EXPECT_TRUE(shown->UI_IsShown());
    EXPECT_EQ(frame->GetTabCount(), 3);
    EXPECT_EQ(frame->DetachTabPanel(9), nullptr);
}

TEST_F(WorkspaceModel, MovingAFramesTabsKeepsTheirOrderAndAppendsWhatItRemembers) {
    Register({"scope", MixerPaint, /*hides*/ true});
    BuildTwoFrames();
    left->AddTabs(std::vector<std::string>{"scope"});
    workspace->RemoveTab(left, left->GetTabPanel(1), true, true); // hidden
    left->AddTab("mixer", true);
    left->AddTab("browser", true);
    left->AddRemovedTabData("mixer", "");
    right->AddRemovedTabData("editor", "");
    boost::intrusive_ptr<TabPanel> ownHidden = right->AddTab("scope", true);
    workspace->RemoveTab(right, ownHidden.get(), true, true);
    TabPanel* scope = left->HiddenTabs().front().get();

    right->AddTabs(left);
    EXPECT_EQ(TabTypes(right), (std::vector<std::string>{"browser", "editor", "mixer", "browser"}));
    EXPECT_EQ(left->GetTabCount(), 0);
    ASSERT_EQ(right->GetRemovedTabData().size(), 2u);
    EXPECT_EQ(right->GetRemovedTabData()[0].first, "editor");
    EXPECT_EQ(right->GetRemovedTabData()[1].first, "mixer");
    ASSERT_EQ(right->HiddenTabs().size(), 2u);
    EXPECT_EQ(right->HiddenTabs().front(), ownHidden);
    EXPECT_EQ(right->HiddenTabs().back().get(), scope);
    EXPECT_TRUE(right->ReanimateTab(right->HiddenTabs().back()));
    EXPECT_EQ(scope->GetFrame(), right);
    EXPECT_FALSE(left->HasRemovedTabData() || left->HasHiddenTabs());
}

TEST_F(WorkspaceModel, RemovingOnlyObliteratingTabsLeavesTheOthers) {
    Register({"render", MixerPaint, false, /*obliterates*/ true});
    BuildTwoFrames();
    right->AddTabs(std::vector<std::string>{"render", "mixer", "render"});
    right->RemoveAllTabs(true);
    EXPECT_EQ(TabTypes(right), (std::vector<std::string>{"browser", "mixer"}));
    EXPECT_EQ(std::count(panelLog.begin(), panelLog.end(), "render: frame closing"), 2);
    EXPECT_EQ(std::count(panelLog.begin(), panelLog.end(), "browser: frame closing"), 1);

    right->RemoveAllTabs(false);
    EXPECT_EQ(main->GetFrameCount(), 1u);
}

TEST_F(WorkspaceModel, EdgeDropZonesLieAlongTheClientArea) {
    BuildTwoFrames();
    RectT client = main->UI_GetGlobalClientRect();
    RectT r;
    main->GetEdgeDropZoneRect(DropZone::Left, r, true);
    EXPECT_EQ(r, RectT(client.left - 1, client.top, 11, client.height));
    main->GetEdgeDropZoneRect(DropZone::Left, r, false);
    EXPECT_EQ(r, RectT(client.left - 1, client.top, 21, client.height));
    main->GetEdgeDropZoneRect(DropZone::Top, r, true);
    EXPECT_EQ(r, RectT(client.left, client.top, client.width, 7));
    main->GetEdgeDropZoneRect(DropZone::Top, r, false);
    EXPECT_EQ(r.height, 12);
    main->GetEdgeDropZoneRect(DropZone::Bottom, r, true);
    EXPECT_EQ(r, RectT(client.left, client.Bottom() - 10, client.width, 11));
    main->GetEdgeDropZoneRect(DropZone::Right, r, false);
    EXPECT_EQ(r, RectT(client.Right() - 20, client.top, 21, client.height));
    RectT untouched(1, 2, 3, 4);
    main->GetEdgeDropZoneRect(DropZone::None, untouched, true);
    EXPECT_EQ(untouched, RectT(1, 2, 3, 4));

    // The top-left corner is in both the left and the top zones: left wins.
    std::vector<PointT> polygon;
    EXPECT_EQ(main->GetEdgeDropZone(PointT(client.left + 2, client.top + 2), r, polygon), DropZone::Left);
    ASSERT_EQ(polygon.size(), 4u);
    EXPECT_EQ(polygon[1], PointT(r.left + r.width, r.top + r.width));
    polygon.clear();
    EXPECT_EQ(main->GetEdgeDropZone(PointT(client.left + 300, client.top + 6), r, polygon), DropZone::Top);
    polygon.clear();
    EXPECT_EQ(main->GetEdgeDropZone(PointT(client.left + 300, client.top + 7), r, polygon), DropZone::None);
    EXPECT_EQ(main->GetEdgeDropZone(PointT(client.Right() - 1, client.top + 300), r, polygon),
              DropZone::Right);

    // A frame in the left half: its left edge yields to the window's zone, its right edge not.
    std::vector<long> exclusions{42};
    RectT frameRect(client.left, client.top, 300, client.height);
    main->CalculateDropZoneExclusionsForEdges(frameRect, exclusions);
    EXPECT_EQ(exclusions, (std::vector<long>{42, 6, 9, 9, 0}));
}

TEST_F(WorkspaceModel, TheWindowUnderAPointIsFoundThroughFramesAndPanels) {
    BuildTwoFrames();
    RectT panel = right->GetFrontTabPanel()->UI_GetGlobalRect();
    PointT inPanel(panel.left + panel.width / 2, panel.top + panel.height / 2);
    EXPECT_EQ(workspace->GetTopLevelWindowFromPos(inPanel), main);
    EXPECT_EQ(workspace->GetTabPanelFromPos(inPanel), right->GetFrontTabPanel());
    EXPECT_EQ(main->GetFrameFromPos(inPanel), right);
    EXPECT_EQ(workspace->GetTopLevelWindowFromPos(PointT(5, 1070)), nullptr);

    // Another thread's window over ours is never taken for a workspace window.
    Desktop::Get().CreateForeignWindow(RectT(inPanel.x - 10, inPanel.y - 10, 40, 40), 77);
    EXPECT_EQ(workspace->GetTopLevelWindowFromPos(inPanel), nullptr);
    EXPECT_EQ(workspace->GetTabPanelFromPos(inPanel), nullptr);
}

TEST_F(WorkspaceModel, SavedPlacementsRestoreSafely) {
    orvcore::proplist::PropList saved;
    main->SaveWindowStateData(saved);
    for (char const* key : {"ShowCmd", "MinPos", "MaxPos", "NormalPos"}) {
        EXPECT_TRUE(saved.HasKey(key)) << key;
    }

    // A window saved minimised comes back normal, at its normal rectangle.
    orvcore::proplist::PropList minimised = saved;
    minimised.SetValue("ShowCmd", std::uint32_t(2));
    minimised.SetValue("NormalPos", std::vector<std::int32_t>{200, 150, 900, 650});
    ASSERT_TRUE(main->RestoreWindowStateData(minimised));
    auto placement = Desktop::Get().GetPlacement(main->GetPlatformWindow());
    EXPECT_EQ(placement.showCmd, 1u);
    EXPECT_FALSE(Desktop::Get().IsIconic(main->GetPlatformWindow()));
    EXPECT_EQ(main->UI_GetGlobalStructureRect(), RectT(200, 150, 700, 500));

    // Malformed lists change nothing.
    orvcore::proplist::PropList shortList = saved;
    shortList.SetValue("NormalPos", std::vector<std::int32_t>{1, 2, 3});
    EXPECT_FALSE(main->RestoreWindowStateData(shortList));
    orvcore::proplist::PropList wrongKind = saved;
    wrongKind.SetValue("MinPos", std::string("0,0"));
    EXPECT_FALSE(main->RestoreWindowStateData(wrongKind));
    EXPECT_EQ(main->UI_GetGlobalStructureRect(), RectT(200, 150, 700, 500));

    // A floating tool window keeps its own placement.
    auto floating = workspace->AddTopLevelWindow(false, nullptr);
    EXPECT_FALSE(floating->RestoreWindowStateData(saved));

    // With visibility delayed, a maximised placement waits to be shown later.
    orvcore::proplist::PropList maximised = saved;
    maximised.SetValue("ShowCmd", std::uint32_t(3));
    main->SetDelayWindowVisibility(true);
    ASSERT_TRUE(main->RestoreWindowStateData(maximised));
    EXPECT_TRUE(main->GetDelayedShowMaximized());
    EXPECT_FALSE(Desktop::Get().IsZoomed(main->GetPlatformWindow()));
}

TEST_F(WorkspaceModel, FloatingWindowsAreOwnedToolWindowsAtTheirRectangle) {
    RectT rect(300, 200, 500, 400);
    auto floating = workspace->AddTopLevelWindow(true, &rect);
    NativeWindow w = floating->GetPlatformWindow();
    EXPECT_EQ(Desktop::Get().GetStyle(w) & ~style::Visible, TopLevelWindow::FloatingStyle & ~style::Visible);
    EXPECT_TRUE(Desktop::Get().GetExStyle(w) & style::ToolWindow);
    EXPECT_EQ(Desktop::Get().GetOwner(w), appWindow);
    EXPECT_EQ(floating->UI_GetGlobalStructureRect(), rect);
    EXPECT_TRUE(floating->IsInterim());
    workspace->MakeWindowPermanent(floating);
    EXPECT_FALSE(floating->IsInterim());
}

TEST_F(WorkspaceModel, ClearingTheWorkspaceTellsPanelsAndEmptiesEveryWindow) {
    Register({"scope", MixerPaint, /*hides*/ true});
    BuildTwoFrames();
    auto floating = workspace->AddTopLevelWindow(false, nullptr);
    floating->UI_Show(true);
    floating->CreateRootFrame("mixer", true, true);
    right->AddTab("scope", true);

    workspace->RemoveTabPanels();
    EXPECT_EQ(std::count(panelLog.begin(), panelLog.end(), "editor: window closing"), 1);
    EXPECT_EQ(std::count(panelLog.begin(), panelLog.end(), "mixer: window closing"), 1);
    EXPECT_EQ(main->GetFrameCount(), 0u);
    EXPECT_TRUE(workspace->GetLayoutEnabled());
    // The hiding panel is kept with its frame, out of the layout, to come back.
    ASSERT_EQ(main->HiddenFrames().size(), 1u);
    EXPECT_EQ(main->HiddenFrames().front()->HiddenTabs().size(), 1u);
    EXPECT_FALSE(floating->UI_IsShown());

    workspace->DestroyTabPanels();
    EXPECT_TRUE(main->HiddenFrames().empty());
    EXPECT_EQ(main->GetRootFrame(), nullptr);
}

TEST_F(WorkspaceModel, APanelAnnouncedAsDestroyedIsNeverKeptHidden) {
    Register({"probe", MixerPaint, /*hides*/ true, /*obliterates*/ true});
    Register({"logger", MixerPaint, /*hides*/ true, /*obliterates*/ true, /*savesState*/ true});
    BuildTwoFrames();
    boost::intrusive_ptr<TabPanel> probe(right->AddTab("probe", true));
    ASSERT_TRUE(workspace->RemoveTab(right, probe.get(), true, true));
    EXPECT_FALSE(right->HasHiddenTabs());
    EXPECT_FALSE(right->HasRemovedTabData());
    EXPECT_EQ(probe->GetFrame(), nullptr);

    right->AddTab("logger", true);
    ASSERT_TRUE(workspace->RemoveTab(right, 1L, true, true));
    EXPECT_FALSE(right->HasHiddenTabs());
    ASSERT_EQ(right->GetRemovedTabData().size(), 1u);
    EXPECT_EQ(right->GetRemovedTabData()[0].first, "logger");
    EXPECT_EQ(workspace->log, (std::vector<std::string>{"obliterating probe", "obliterating logger"}));
}

TEST_F(WorkspaceModel, AWindowThatRefusesToCloseKeepsAllItsPanels) {
    Register({"render", MixerPaint, false, /*obliterates*/ true});
    auto floating = workspace->AddTopLevelWindow(false, nullptr);
    WorkspaceFrame* frame = floating->CreateRootFrame("render", true, true);
    Painted(frame->AddTab("mixer", true))->allowClose = false;
    EXPECT_FALSE(workspace->RemoveWindow(floating.get(), true));
    EXPECT_EQ(TabTypes(frame), (std::vector<std::string>{"render", "mixer"}));
    EXPECT_TRUE(workspace->log.empty());
}

TEST_F(WorkspaceModel, ReopeningWithoutACreatorChangesNothing) {
    BuildTwoFrames();
    right->AddRemovedTabData("gone", "");
    EXPECT_EQ(right->ReanimateTab("gone"), nullptr);
    EXPECT_TRUE(right->CanReanimateTab("gone")); // the state waits for a creator

    // A closed frame whose panel type lost its creator does not come back empty.
    ASSERT_TRUE(workspace->RemoveTab(right, 0L, true, true));
    std::unique_ptr<TabCreator> browserCreator(workspace->FindCreator("browser"));
    workspace->UnregisterTabCreator("browser");
    EXPECT_FALSE(main->ReanimateFrame("browser"));
    EXPECT_EQ(main->GetFrameCount(), 1u);
    workspace->RegisterTabCreator(browserCreator.release());
    EXPECT_TRUE(main->ReanimateFrame("browser"));
    EXPECT_EQ(main->GetFrameCount(), 2u);
}

TEST_F(WorkspaceModel, PanelsThatOutliveTheirFrameForgetIt) {
    BuildTwoFrames();
    boost::intrusive_ptr<TabPanel> held(right->GetFrontTabPanel());
    boost::intrusive_ptr<TabPanel> bar(
        workspace->FindCreator("mixer")->CreateTabPanel(workspace.get(), nullptr));
    main->SetStaticElement(bar, LayoutManager::Top, true);
    ASSERT_NE(bar->GetFrame(), nullptr);
    main->RemoveStaticElement(LayoutManager::Top, true);
    EXPECT_EQ(bar->GetFrame(), nullptr);
    bar->SetName(u"renamed"); // reaches no frame

    main->RemoveFrame(boost::intrusive_ptr<WorkspaceFrameBase>(right), false);
    right = nullptr;
    EXPECT_EQ(held->GetFrame(), nullptr);
    held->SetTabColor(canvasor::ColorRGBA(1, 0, 0, 1));
}

TEST_F(WorkspaceModel, FocusGivenToAFrameGoesOnToItsFrontPanel) {
    BuildTwoFrames();
    workspace->SetFocusedTabPanel(left->GetFrontTabPanel());
    right->UI_GainKeyboardFocus(orvui::ui::FocusByProgram);
    EXPECT_EQ(workspace->GetFocusedTabPanel(), right->GetFrontTabPanel());
    EXPECT_TRUE(right->GetTabWell()->GetFocusedLook());
    EXPECT_FALSE(left->GetTabWell()->GetFocusedLook());
}
