// A host's main window with two frames, used the way a user would: clicking tabs, closing a panel
// with its close box, the frame's flyout menu (undocking, closing a frame), the bar between frames,
// and a picture of the window.
#include "WorkspaceDoubles.h"

#include "host/ui/Menu.h"
#include "host/ui/Modal.h"
#include "ui/UiDoubles.h"

using namespace orvtest;
using orvui::ui::PointT;
using orvui::ui::RectT;
using orvui::utility::MenuWindow;
using orvui::utility::OS_Menu;

namespace {

class WorkspaceScenario : public WorkspaceTest {
protected:
    void SetUp() override {
        WorkspaceTest::SetUp();
        BuildTwoFrames();
        mixer = right->AddTab("mixer", true);
        Desktop::Get().Activate(appWindow);
    }

    static PointT OnCloseBox(WorkspaceFrame* frame, long index) {
        auto* item = frame->GetTabWell()->GetTab(index);
        RectF box = item->CloseBoxRect();
        return item->UI_LocalToGlobal(PointT(int(box.left + box.width / 2), int(box.top + box.height / 2)));
    }
    static PointT OnMenuButton(WorkspaceFrame* frame) {
        return Middle(frame->GetTabWell()->GetFlyout()->GetGlobalMenuButtonRect());
    }
    // A driver that clicks the menu item with the given command.
    static orvui::ui::ModalDriver ChooseCommand(unsigned long command) {
        return Steps<MenuWindow>({[command](MenuWindow& m) {
            auto const& items = m.GetMenu().Items();
            for (std::size_t i = 0; i < items.size(); ++i) {
                if (items[i].command == command) {
                    Click(Middle(m.GetItemGlobalRect(i)));
                    return;
                }
            }
            ADD_FAILURE() << "no menu item with command " << long(command);
        }});
    }

    TabPanel* mixer = nullptr;
};

std::vector<std::pair<unsigned long, bool>> CommandsAndEnabling(OS_Menu const& menu) {
    std::vector<std::pair<unsigned long, bool>> out;
    for (auto const& item : menu.Items()) {
        out.emplace_back(item.command, item.enabled);
    }
    return out;
}

unsigned long Cmd(WorkspaceFrame::FlyoutCommand c) {
    return WorkspaceFrame::CommandNumber(c);
}

// A panel with an item of its own in the flyout menu, which it counts when chosen.
class PanelWithCommands : public PaintedPanel {
public:
    using PaintedPanel::PaintedPanel;
    void PopulateFlyoutMenu(OS_Menu& menu) override { menu.AppendItem(u"Zoom to Fit", 700); }
    bool DoFlyoutMenuCommand(unsigned long command) override {
        chosen.push_back(command);
        return command == 700;
    }
    std::vector<unsigned long> chosen;
};

} // namespace

TEST_F(WorkspaceScenario, ClickingTabsChangesTheFrontPanelAndTheFocus) {
    TabPanel* browser = right->GetTabPanel(0);
    ASSERT_EQ(right->GetFrontTabPanel(), mixer);
    Click(OnTab(right, 0));
    EXPECT_EQ(right->GetFrontTabPanel(), browser);
    EXPECT_TRUE(browser->UI_IsShown());
    EXPECT_FALSE(mixer->UI_IsShown());
    EXPECT_EQ(workspace->GetFocusedTabPanel(), browser);

    Click(OnTab(left, 0));
    EXPECT_EQ(workspace->GetFocusedTabPanel(), left->GetTabPanel(0));
    EXPECT_EQ(right->GetFrontTabPanel(), browser); // the other frame keeps its front tab

    // A press inside a panel focuses it and marks it as the last touched.
    Click(Middle(browser->UI_GetGlobalRect()));
    EXPECT_EQ(workspace->GetFocusedTabPanel(), browser);
    EXPECT_EQ(workspace->GetLastTouchedTabPanel(), browser);
}

TEST_F(WorkspaceScenario, TheCloseBoxClosesAPanelAndTheFrameRemembersIt) {
    Painted(mixer)->state = "solo on track 3";
    Click(OnCloseBox(right, 1));
    ASSERT_EQ(right->GetTabCount(), 1);
    EXPECT_EQ(right->GetFrontTabPanel()->GetTabType(), "browser");
    ASSERT_TRUE(right->CanReanimateTab("mixer"));
    EXPECT_EQ(Painted(right->ReanimateTab("mixer"))->state, "solo on track 3");
}

TEST_F(WorkspaceScenario, TheFlyoutMenuUndocksAPanelIntoANewFloatingWindow) {
    RectT before = mixer->UI_GetGlobalRect();
    {
        orvui::ui::ScopedModalDriver driver(ChooseCommand(Cmd(WorkspaceFrame::UndockPanel)));
        Click(OnMenuButton(right));
    }
    ASSERT_EQ(workspace->GetWindows().size(), 2u);
    TopLevelWindow* floating = workspace->GetWindows()[1];
    EXPECT_FALSE(floating->IsMain());
    EXPECT_TRUE(floating->UI_IsShown());
    ASSERT_NE(floating->GetRootFrame(), nullptr);
    EXPECT_EQ(floating->GetRootFrame()->GetFrontTabPanel(), mixer);
    EXPECT_EQ(mixer->GetFrame()->GetTopLevelWindow(), floating);
    // The new window shows the panel where it was, at the same size.
    EXPECT_EQ(mixer->UI_GetGlobalRect(), before);
    EXPECT_EQ(right->GetTabCount(), 1);
    EXPECT_FALSE(right->HasRemovedTabData());
    EXPECT_EQ(workspace->GetFocusedTabPanel(), mixer);
}

TEST_F(WorkspaceScenario, AnUndockedPanelWithAHeightOnlyWishKeepsItsWidth) {
    boost::intrusive_ptr<TabPanel> strip(new SizedPanel(workspace.get(), {PointT(0, 120)}));
    right->AddTab(strip, true);
    RectT before = strip->UI_GetGlobalRect();
    right->Undock(2, false);
    ASSERT_EQ(workspace->GetWindows().size(), 2u);
    RectT after = strip->UI_GetGlobalRect();
    EXPECT_EQ(after.width, before.width);
    EXPECT_EQ(after.height, 120);
    EXPECT_EQ(after.left, before.left);
}

TEST_F(WorkspaceScenario, TheFlyoutMenuUndocksAndClosesWholeFrames) {
    {
        orvui::ui::ScopedModalDriver driver(ChooseCommand(Cmd(WorkspaceFrame::UndockFrame)));
        Click(OnMenuButton(right));
    }
    ASSERT_EQ(workspace->GetWindows().size(), 2u);
    TopLevelWindow* floating = workspace->GetWindows()[1];
    EXPECT_EQ(floating->GetRootFrame(), right);
    EXPECT_EQ(right->GetTopLevelWindow(), floating);
    EXPECT_EQ(right->GetTabCount(), 2);
    EXPECT_EQ(main->GetFrameCount(), 1u);
    EXPECT_EQ(main->GetRootFrame(), left);

    // Closing the floating window's only frame closes the window too.
    {
        orvui::ui::ScopedModalDriver driver(ChooseCommand(Cmd(WorkspaceFrame::CloseFrame)));
        Click(OnMenuButton(right));
    }
    EXPECT_EQ(workspace->GetWindows().size(), 1u);
    EXPECT_EQ(workspace->GetFocusedTabPanel(), left->GetFrontTabPanel());
}

TEST_F(WorkspaceScenario, PressingOnTheBarBetweenFramesChangesTheCursor) {
    RectT l = left->UI_GetGlobalRect();
    RectT r = right->UI_GetGlobalRect();
    ASSERT_LT(l.Right(), r.left + 1);
    PointT onBar((l.Right() + r.left) / 2, l.top + l.height / 2);
    Desktop::Get().MouseMove(Middle(l));
    EXPECT_NE(Desktop::Get().GetCursor(), orvui::ui::cursor::VerticalSplitter);
    Desktop::Get().MouseMove(onBar);
    Desktop::Get().MouseDown(onBar);
    EXPECT_EQ(Desktop::Get().GetCursor(), orvui::ui::cursor::VerticalSplitter);
    Desktop::Get().MouseUp(onBar);
}

TEST_F(WorkspaceScenario, TheMainWindowShowsItsFramesTabWellsAndPanels) {
    Desktop::Get().MouseMove(PointT(5, 1075)); // no hover over the window
    std::filesystem::path file = WriteSnapshot();
    ASSERT_TRUE(std::filesystem::exists(file));

    EXPECT_TRUE(Looks(SeenAt(Middle(left->GetFrontTabPanel()->UI_GetGlobalRect())), EditorPaint));
    EXPECT_TRUE(Looks(SeenAt(Middle(mixer->UI_GetGlobalRect())), MixerPaint));
    // The tab well sits above the panel, in neither panel colour.
    PointT inWell = OnTab(right, 0);
    EXPECT_FALSE(Looks(SeenAt(inWell), MixerPaint));
    EXPECT_FALSE(Looks(SeenAt(inWell), BrowserPaint));
    EXPECT_LT(inWell.y, mixer->UI_GetGlobalRect().top);

    Click(OnTab(right, 0));
    EXPECT_TRUE(Looks(SeenAt(Middle(mixer->UI_GetGlobalRect())), BrowserPaint));
}

// --- The flyout menu's items ---

TEST_F(WorkspaceScenario, FlyoutItemsAreEnabledByWhereTheFrameIs) {
    OS_Menu menu;
    left->PopulateTabMenu(0, menu);
    EXPECT_EQ(CommandsAndEnabling(menu),
              (std::vector<std::pair<unsigned long, bool>>{{Cmd(WorkspaceFrame::UndockPanel), true},
                                                           {Cmd(WorkspaceFrame::UndockFrame), true},
                                                           {Cmd(WorkspaceFrame::ClosePanel), true},
                                                           {Cmd(WorkspaceFrame::CloseFrame), true},
                                                           {Cmd(WorkspaceFrame::MaximizeFrame), true}}));
    EXPECT_EQ(menu.Items()[0].text, u"Undock Panel");
    EXPECT_EQ(menu.Items()[4].text, u"Maximize Frame");

    // A floating window with one frame and one tab cannot undock it any further.
    auto floating = workspace->AddTopLevelWindow(false, nullptr);
    WorkspaceFrame* lone = floating->CreateRootFrame("editor", true, true);
    Painted(lone->GetFrontTabPanel())->allowClose = false;
    OS_Menu loneMenu;
    lone->PopulateTabMenu(0, loneMenu);
    EXPECT_EQ(CommandsAndEnabling(loneMenu),
              (std::vector<std::pair<unsigned long, bool>>{{Cmd(WorkspaceFrame::UndockPanel), false},
                                                           {Cmd(WorkspaceFrame::UndockFrame), false},
                                                           {Cmd(WorkspaceFrame::ClosePanel), false},
                                                           {Cmd(WorkspaceFrame::CloseFrame), false},
                                                           {Cmd(WorkspaceFrame::MaximizeFrame), false}}));
    // A second tab there may be undocked, but the frame still may not.
    lone->AddTab("mixer", true);
    OS_Menu twoTabs;
    lone->PopulateTabMenu(1, twoTabs);
    EXPECT_TRUE(twoTabs.Items()[0].enabled);
    EXPECT_FALSE(twoTabs.Items()[1].enabled);
}

TEST_F(WorkspaceScenario, FlyoutOfABackTabLeavesOutMaximisingAndThePanelsOwnItems) {
    struct Creator : TabCreator {
        Creator()
            : TabCreator("special") {}
        boost::intrusive_ptr<TabPanel> CreateTabPanel(Workspace* ws, WorkspaceFrameBase* f) const override {
            return new PanelWithCommands(ws, f, "special", MixerPaint, nullptr);
        }
    };
    workspace->RegisterTabCreator(new Creator);
    auto* special = dynamic_cast<PanelWithCommands*>(right->AddTab("special", true));
    ASSERT_NE(special, nullptr);

    OS_Menu front;
    right->PopulateTabMenu(2, front);
    ASSERT_EQ(front.Items().size(), 6u);
    EXPECT_EQ(front.Items().back().command, 700u);
    OS_Menu back;
    right->PopulateTabMenu(0, back);
    EXPECT_EQ(back.Items().size(), 4u);
    for (auto const& item : back.Items()) {
        EXPECT_NE(item.command, Cmd(WorkspaceFrame::MaximizeFrame));
    }

    // The panel's own command reaches it; so do the frame's commands that leave it in place.
    right->DoTabMenuCommand(2, 700);
    right->DoTabMenuCommand(2, Cmd(WorkspaceFrame::MaximizeFrame));
    EXPECT_TRUE(main->GetLayoutManager()->IsTheMaximizedFrame(right->GetLMFrame()));
    OS_Menu restore;
    right->PopulateTabMenu(2, restore);
    EXPECT_EQ(restore.Items()[4].text, u"Restore Frame Size");
    EXPECT_EQ(special->chosen, (std::vector<unsigned long>{700, Cmd(WorkspaceFrame::MaximizeFrame)}));
    right->DoTabMenuCommand(2, Cmd(WorkspaceFrame::MaximizeFrame));
    EXPECT_FALSE(main->GetLayoutManager()->GetMaximizedFrame());
}

TEST_F(WorkspaceScenario, ClosingOtherSimilarPanelsSparesThisOneAndRefusingOnes) {
    mixer->EnableCloseOtherSimilarPanels(true);
    OS_Menu alone;
    right->PopulateTabMenu(1, alone);
    ASSERT_EQ(alone.Items().size(), 6u);
    EXPECT_EQ(alone.Items()[3].text, u"Close Other Similar Panels");
    EXPECT_FALSE(alone.Items()[3].enabled); // there is no other mixer

    boost::intrusive_ptr<TabPanel> second(left->AddTab("mixer", true));
    auto floating = workspace->AddTopLevelWindow(false, nullptr);
    boost::intrusive_ptr<TabPanel> third(floating->CreateRootFrame("mixer", true, true)->GetFrontTabPanel());
    mixer->SetCustomCloseOtherSimilarPanelsDisplayString(u"Close Other Mixers");
    EXPECT_TRUE(right->AllowCloseOtherSimilar(1));
    Painted(third.get())->allowClose = false;
    EXPECT_FALSE(right->AllowCloseOtherSimilar(1));
    OS_Menu custom;
    right->PopulateTabMenu(1, custom);
    EXPECT_EQ(custom.Items()[3].text, u"Close Other Mixers");
    EXPECT_FALSE(custom.Items()[3].enabled);

    Painted(third.get())->allowClose = true;
    right->DoTabMenuCommand(1, Cmd(WorkspaceFrame::CloseOtherSimilarPanels));
    EXPECT_EQ(mixer->GetFrame(), right);
    EXPECT_EQ(second->GetFrame(), nullptr);
    EXPECT_EQ(workspace->GetWindows().size(), 1u); // the floating window emptied out
}
