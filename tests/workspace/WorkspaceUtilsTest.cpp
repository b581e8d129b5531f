// What a host's Window menu does through the workspace utilities: finding panels, toggling them
// closed and back into their remembered places, the bars, maximising frames and cycling the focus.
#include "workspace/WorkspaceDoubles.h"

#include "host/ui/Dialogs.h"
#include "workspace/WorkspaceUtils.h"

#include <list>

using namespace orvtest;
namespace utils = orvworkspace::workspace::WorkspaceUtils;
using orvui::ui::RectT;

namespace {

class WorkspaceUtilsTest : public WorkspaceTest {
protected:
    // editor | browser, mixer (the mixer in front), and a floating window holding an editor.
    void BuildThreeTabs() {
        BuildTwoFrames();
        right->AddTab("mixer", true);
        RectT rect(300, 250, 500, 300);
        floating = workspace->AddTopLevelWindow(false, &rect).get();
        floating->UI_Show(true);
        floating->CreateRootFrame("editor", true, true);
    }
    std::vector<TabPanel*> Walked() {
        struct Collect : utils::ConstTabVisitor {
            bool VisitTab(TabPanel const* tab) override {
                seen.push_back(const_cast<TabPanel*>(tab));
                return true;
            }
            std::vector<TabPanel*> seen;
        } collect;
        EXPECT_TRUE(utils::VisitEachTab(*workspace, collect));
        return collect.seen;
    }
    TabPanel* Mixer() const { return right->GetTabPanel(1); }

    TopLevelWindow* floating = nullptr;
};

TEST_F(WorkspaceUtilsTest, SearchesFollowTheWalkAndReportIndicesWithinTheFrame) {
    BuildThreeTabs();
    main->SetStaticElement("mixer", LayoutManager::Bottom, true); // a bar: never found

    long index = -1;
    EXPECT_EQ(utils::FindFirstTabOfType(*workspace, "mixer", &index), Mixer());
    EXPECT_EQ(index, 1);
    EXPECT_EQ(utils::FindFirstTabOfType(*workspace, "nothing", &index), nullptr);
    std::list<TabPanel*> editors;
    std::list<long> indices;
    utils::FindAllTabsOfType(*workspace, "editor", editors, &indices);
    EXPECT_EQ(editors, (std::list<TabPanel*>{left->GetTabPanel(0), floating->GetFrame(0)->GetTabPanel(0)}));
    EXPECT_EQ(indices, (std::list<long>{0, 0}));
    std::list<TabPanel*> mixers;
    utils::FindAllTabsOfType(*workspace, "mixer", mixers);
    EXPECT_EQ(mixers, std::list<TabPanel*>{Mixer()});

    EXPECT_EQ(Walked(), (std::vector<TabPanel*>{left->GetTabPanel(0), right->GetTabPanel(0), Mixer(),
                                                floating->GetFrame(0)->GetTabPanel(0)}));

    // Node IDs: an empty one finds nothing even where a panel and a window have an empty ID.
    Mixer()->UI_SetNodeID("mixer-1");
    floating->UI_SetNodeID("floater");
    left->GetTabPanel(0)->UI_SetNodeID("");
    main->UI_SetNodeID("");
    EXPECT_EQ(utils::FindTabFromID(*workspace, "mixer-1"), Mixer());
    EXPECT_EQ(utils::FindTabFromID(*main, "mixer-1"), Mixer());
    EXPECT_EQ(utils::FindTabFromID(*floating, "mixer-1"), nullptr);
    EXPECT_EQ(utils::FindTabFromID(*workspace, ""), nullptr);
    EXPECT_EQ(utils::FindTopLevelWindowFromID(*workspace, "floater"), floating);
    EXPECT_EQ(utils::FindTopLevelWindowFromID(*workspace, ""), nullptr);
    EXPECT_EQ(utils::FindTabFromTabPanelID(*workspace, Mixer()->GetID()), Mixer());
    EXPECT_EQ(utils::FindTabFromTabPanelID(*workspace, 999999), nullptr);

    // A bar's panel is never found, by ID or by number either.
    TabPanel* bar = main->GetStaticElement(LayoutManager::Bottom);
    bar->UI_SetNodeID("bar");
    EXPECT_EQ(utils::FindTabFromID(*workspace, "bar"), nullptr);
    EXPECT_EQ(utils::FindTabFromTabPanelID(*workspace, bar->GetID()), nullptr);

    EXPECT_EQ(utils::FindMainTopLevelWindow(), main);
    EXPECT_EQ(utils::GetModalDialogParentNode(), main);
    EXPECT_EQ(utils::GetModalDialogParent(), appWindow);
    // While a modal window runs, dialogs are modal to it.
    orvui::ui::OS_Window* parentInside = nullptr;
    {
        orvui::ui::ScopedModalDriver driver([&](orvui::ui::UI_ModalWindow& modal) {
            parentInside = utils::GetModalDialogParentNode();
            EXPECT_EQ(utils::GetModalDialogParent(), modal.GetPlatformWindow());
            modal.EndModal(1);
        });
        orvui::ui::messagebox::ShowNote(nullptr, u"Note", u"text", main);
    }
    EXPECT_NE(parentInside, nullptr);
    EXPECT_NE(parentInside, main);
}

TEST_F(WorkspaceUtilsTest, AVisitorThatStopsSeesNoMoreAndMaySearchAgainInside) {
    BuildThreeTabs();
    struct StopAtThird : utils::TabVisitor {
        explicit StopAtThird(Workspace& w)
            : workspace(w) {}
        bool VisitTab(TabPanel* tab) override {
            // Searching from inside a walk takes the walk's lock again; it must not deadlock.
            found.push_back(utils::FindFirstTabOfType(workspace, tab->GetTabType()));
            return ++seen < 3;
        }
        Workspace& workspace;
        int seen = 0;
        std::vector<TabPanel*> found;
    } visitor(*workspace);
    EXPECT_FALSE(utils::VisitEachTab(*workspace, visitor));
    EXPECT_EQ(visitor.seen, 3);
    EXPECT_EQ(visitor.found, (std::vector<TabPanel*>{left->GetTabPanel(0), right->GetTabPanel(0), Mixer()}));
    // A copy of a visitor is a visitor of its own.
    StopAtThird copy = visitor;
    copy.seen = 2;
    EXPECT_FALSE(utils::VisitEachTab(*workspace, copy));
    EXPECT_EQ(copy.seen, 3);
}

TEST_F(WorkspaceUtilsTest, TogglingTheFocusedFrontPanelClosesItAndBringsItBackInItsPlace) {
    BuildThreeTabs();
    boost::intrusive_ptr<TabPanel> mixer(Mixer());
    workspace->SetFocusedTabPanel(mixer.get());
    bool front = false;
    ASSERT_TRUE(utils::TabIsShown(*workspace, "mixer", front));
    EXPECT_TRUE(front);

    utils::ToggleTabState(*workspace, "mixer", false);
    EXPECT_EQ(right->GetTabCount(), 1);
    EXPECT_FALSE(utils::TabIsShown(*workspace, "mixer", front));

    utils::ToggleTabState(*workspace, "mixer", false);
    ASSERT_EQ(right->GetTabCount(), 2); // the same frame, the same slot
    EXPECT_EQ(right->GetTabPanel(1)->GetTabType(), "mixer");
    EXPECT_EQ(main->GetFrameCount(), 2u);

    // Behind another panel, a toggle brings it forward with the focus rather than closing it.
    right->BringTabToFront(0L);
    ASSERT_TRUE(utils::TabIsShown(*workspace, "mixer", front));
    EXPECT_FALSE(front);
    utils::ToggleTabState(*workspace, "mixer", false);
    EXPECT_EQ(right->GetFrontTabIndex(), 1);
    EXPECT_EQ(workspace->GetFocusedTabPanel(), right->GetTabPanel(1));

    // With focusFirst, a front panel without the focus is focused first, then closed.
    workspace->SetFocusedTabPanel(left->GetTabPanel(0));
    utils::ToggleTabState(*workspace, "mixer", true);
    EXPECT_EQ(right->GetTabCount(), 2);
    EXPECT_EQ(workspace->GetFocusedTabPanel(), right->GetTabPanel(1));
    utils::ToggleTabState(*workspace, "mixer", true);
    EXPECT_EQ(right->GetTabCount(), 1);
}

TEST_F(WorkspaceUtilsTest, TogglingAPanelObjectClosesAndReopensThatVeryPanel) {
    Register({"scope", MixerPaint, /*hides*/ true}); // a panel that lives on while closed
    BuildThreeTabs();
    right->AddTab("scope", true);
    boost::intrusive_ptr<TabPanel> scope(right->GetTabPanel(2));
    workspace->SetFocusedTabPanel(scope.get());
    utils::ToggleTabState(*workspace, scope, false);
    bool front = false;
    EXPECT_FALSE(utils::TabIsShown(*workspace, scope, front));
    EXPECT_EQ(right->GetTabCount(), 2);
    EXPECT_FALSE(workspace->GetCreateTabPanelAssertionMode());
    utils::ToggleTabState(*workspace, scope, false);
    EXPECT_TRUE(utils::TabIsShown(*workspace, scope, front));
    EXPECT_EQ(scope->GetFrame(), right);
    EXPECT_EQ(right->IndexOf(scope.get()), 2);
    EXPECT_FALSE(workspace->GetCreateTabPanelAssertionMode());

    // A panel of a kind that is not kept still reopens as itself, in a window of its own.
    boost::intrusive_ptr<TabPanel> mixer(Mixer());
    utils::CloseTab(*workspace, mixer);
    EXPECT_EQ(right->GetTabCount(), 2);
    EXPECT_EQ(mixer->GetFrame(), nullptr);
    EXPECT_FALSE(workspace->GetCreateTabPanelAssertionMode());
    std::size_t windows = workspace->GetWindows().size();
    utils::ToggleTabState(*workspace, mixer, false);
    ASSERT_EQ(workspace->GetWindows().size(), windows + 1);
    EXPECT_EQ(mixer->GetFrame()->GetTopLevelWindow(), workspace->GetWindows().back());
}

TEST_F(WorkspaceUtilsTest, TogglingATypeOfAClosedFloatingWindowReopensTheWindow) {
    BuildTwoFrames();
    RectT rect(300, 250, 500, 300);
    auto window = workspace->AddTopLevelWindow(false, &rect);
    window->UI_Show(true);
    WorkspaceFrame* first = window->CreateRootFrame("mixer", true, true);
    window->AddTabbedFrame(first, "editor", LayoutManager::Right);
    ASSERT_TRUE(workspace->RemoveWindow(window.get(), true));
    ASSERT_EQ(workspace->GetWindows().size(), 1u);
    ASSERT_TRUE(workspace->CanReanimateWindow("mixer"));
    ASSERT_FALSE(main->CanReanimateFrame("mixer"));

    utils::ToggleTabState(*workspace, "mixer", false);
    ASSERT_EQ(workspace->GetWindows().size(), 2u);
    TopLevelWindow* back = workspace->GetWindows()[1];
    ASSERT_EQ(back->GetFrameCount(), 1u); // the editor's frame waits in its place
    EXPECT_EQ(back->GetFrame(0)->GetFrontTabPanel()->GetTabType(), "mixer");
    EXPECT_TRUE(back->CanReanimateFrame("editor"));

    // A type remembered nowhere gets a window of its own.
    utils::ToggleTabState(*workspace, "browser", false); // the main window's browser closes
    EXPECT_EQ(main->GetFrameCount(), 1u);
    Register({"scope", MixerPaint});
    TabPanel* scope = utils::CreateOrReanimateTab(*workspace, "scope");
    ASSERT_NE(scope, nullptr);
    ASSERT_EQ(workspace->GetWindows().size(), 3u);
    EXPECT_EQ(scope->GetFrame()->GetTopLevelWindow(), workspace->GetWindows()[2]);
}

TEST_F(WorkspaceUtilsTest, CreateOrReanimateTabPrefersTheRememberedFrame) {
    BuildThreeTabs();
    workspace->SetFocusedTabPanel(Mixer());
    utils::ToggleTabState(*workspace, "mixer", false);
    std::size_t windows = workspace->GetWindows().size();
    TabPanel* mixer = utils::CreateOrReanimateTab(*workspace, "mixer");
    ASSERT_NE(mixer, nullptr);
    EXPECT_EQ(mixer->GetFrame(), right);
    EXPECT_EQ(workspace->GetWindows().size(), windows);
    // It always adds: a second call makes a second mixer even though one is shown.
    TabPanel* another = utils::CreateOrReanimateTab(*workspace, "mixer");
    ASSERT_NE(another, nullptr);
    EXPECT_NE(another, mixer);
}

TEST_F(WorkspaceUtilsTest, TheBarTogglesSetAndRemoveTheMainWindowsBars) {
    BuildTwoFrames();
    utils::ToggleStatusbarTabState(*workspace, "mixer");
    ASSERT_TRUE(main->HasStaticElement(LayoutManager::Bottom));
    EXPECT_EQ(main->GetStaticElement(LayoutManager::Bottom)->GetTabType(), "mixer");
    utils::ToggleStatusbarTabState(*workspace, "mixer");
    EXPECT_FALSE(main->HasStaticElement(LayoutManager::Bottom));

    // A type nowhere in the frames becomes the tool bar; pressed again, the bar goes.
    utils::ToggleToolbarTabState(*workspace, "mixer");
    ASSERT_TRUE(main->HasStaticElement(LayoutManager::Top));
    utils::ToggleToolbarTabState(*workspace, "mixer");
    EXPECT_FALSE(main->HasStaticElement(LayoutManager::Top));

    // A type that lives in a frame is toggled there: the front browser closes and comes back.
    utils::ToggleToolbarTabState(*workspace, "browser");
    EXPECT_EQ(main->GetFrameCount(), 1u);
    EXPECT_EQ(utils::FindFirstTabOfType(*workspace, "browser"), nullptr);
    EXPECT_FALSE(main->HasStaticElement(LayoutManager::Top));
    utils::ToggleToolbarTabState(*workspace, "browser");
    EXPECT_EQ(main->GetFrameCount(), 2u);
    EXPECT_NE(utils::FindFirstTabOfType(*workspace, "browser"), nullptr);
    EXPECT_FALSE(main->HasStaticElement(LayoutManager::Top));
}

TEST_F(WorkspaceUtilsTest, MaximisingNeedsTwoFramesAndAToggleShowsAPanelHiddenByIt) {
    WorkspaceFrame* only = main->CreateRootFrame("editor", true, true);
    EXPECT_FALSE(utils::CanHaveMaximizedFrame(main));
    EXPECT_FALSE(utils::ToggleThisFrameMaximizationState(*workspace, only));
    EXPECT_EQ(main->GetLayoutManager()->GetMaximizedFrame(), nullptr);
    main->RemoveFrame(only, false);

    BuildTwoFrames();
    EXPECT_TRUE(utils::CanHaveMaximizedFrame(main));
    // The frame under the mouse.
    Desktop::Get().MouseMove(Middle(left->UI_GetGlobalRect()));
    ASSERT_TRUE(utils::ToggleFrameMaximizationState(*workspace));
    EXPECT_EQ(main->GetLayoutManager()->GetMaximizedFrame(), left->GetLMFrame());
    EXPECT_EQ(workspace->GetFocusedTabPanel(), left->GetTabPanel(0));
    bool front = false;
    EXPECT_FALSE(utils::TabIsShown(*workspace, "browser", front));
    bool inWindow = utils::TabIsShownInTLW(*main, *right->GetTabPanel(0), front, false);
    EXPECT_TRUE(inWindow);

    // Toggling the hidden front browser only restores the layout; it stays open.
    utils::ToggleTabState(*workspace, "browser", false);
    EXPECT_EQ(main->GetLayoutManager()->GetMaximizedFrame(), nullptr);
    EXPECT_EQ(right->GetTabCount(), 1);

    ASSERT_TRUE(utils::ToggleThisFrameMaximizationState(*workspace, right));
    ASSERT_TRUE(utils::ToggleThisFrameMaximizationState(*workspace, right));
    EXPECT_EQ(main->GetLayoutManager()->GetMaximizedFrame(), nullptr);

    Desktop::Get().MouseMove(orvui::ui::PointT(5000, 5000)); // over no window
    EXPECT_FALSE(utils::ToggleFrameMaximizationState(*workspace));
}

TEST_F(WorkspaceUtilsTest, FocusCyclesThroughEveryPanelAndWraps) {
    EXPECT_FALSE(utils::ChangeFocusTabPanel(*workspace, true));
    BuildThreeTabs();
    std::vector<TabPanel*> tabs = Walked();
    ASSERT_EQ(tabs.size(), 4u);
    // The focus on a bar, which the walk does not see, counts as no focus among the panels.
    TabPanel* bar = main->SetStaticElement("browser", LayoutManager::Bottom, true);
    workspace->SetFocusedTabPanel(bar);
    ASSERT_EQ(workspace->GetFocusedTabPanel(), bar);
    ASSERT_TRUE(utils::ChangeFocusTabPanel(*workspace, true)); // from outside the list: the first
    EXPECT_EQ(workspace->GetFocusedTabPanel(), tabs[0]);
    workspace->SetFocusedTabPanel(bar);
    ASSERT_TRUE(utils::ChangeFocusTabPanel(*workspace, false)); // or the last
    EXPECT_EQ(workspace->GetFocusedTabPanel(), tabs[3]);
    ASSERT_TRUE(utils::ChangeFocusTabPanel(*workspace, true)); // from the last to the first
    EXPECT_EQ(workspace->GetFocusedTabPanel(), tabs[0]);
    ASSERT_TRUE(utils::ChangeFocusTabPanel(*workspace, true));
    EXPECT_EQ(workspace->GetFocusedTabPanel(), tabs[1]);
    ASSERT_TRUE(utils::ChangeFocusTabPanel(*workspace, false));
    ASSERT_TRUE(utils::ChangeFocusTabPanel(*workspace, false)); // from the first to the last
    EXPECT_EQ(workspace->GetFocusedTabPanel(), tabs[3]);
}

} // namespace
