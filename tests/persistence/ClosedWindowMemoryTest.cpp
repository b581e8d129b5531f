// Closed floating windows remembered by the workspace: recording, reopening by type or by kept
// panel, the instance data written and read back, and the whole story through a file.
#include "workspace/WorkspaceDoubles.h"

#include "host/core/PropListUtils.h"
#include "persistence/WorkspaceDocument.h"
#include "support/TempDir.h"

using namespace orvtest;
using orvcore::proplist::PropList;
using orvui::ui::RectT;

namespace {

class ClosedWindowMemory : public WorkspaceTest {
protected:
    void SetUp() override {
        WorkspaceTest::SetUp();
        Register({"scope", MixerPaint, /*hides*/ true});
    }
    // A floating window: mixer | scope, closed by the user.
    TopLevelWindow* OpenFloating() {
        RectT rect(300, 250, 600, 400);
        auto floating = workspace->AddTopLevelWindow(false, &rect);
        floating->UI_Show(true);
        WorkspaceFrame* first = floating->CreateRootFrame("mixer", true, true);
        floating->AddTabbedFrame(first, "scope", LayoutManager::Right);
        Painted(first->GetFrontTabPanel())->state = "bus 4";
        return floating.get();
    }
};

} // namespace

TEST_F(ClosedWindowMemory, AClosedWindowComesBackForItsPanelTypes) {
    BuildTwoFrames();
    TopLevelWindow* floating = OpenFloating();
    boost::intrusive_ptr<TabPanel> scope(floating->GetFrame(1)->GetFrontTabPanel());
    ASSERT_TRUE(workspace->RemoveWindow(floating, true));
    ASSERT_EQ(workspace->GetWindows().size(), 1u);

    ASSERT_EQ(workspace->GetRemovedWindowData().size(), 1u);
    auto const& record = *workspace->GetRemovedWindowData().front();
    EXPECT_EQ(record.tabTypes, (std::set<std::string>{"mixer", "scope"}));
    ASSERT_EQ(record.hiddenPanels.size(), 1u); // the hiding panel lives on, out of every tree
    EXPECT_EQ(record.hiddenPanels.front(), scope);
    EXPECT_EQ(scope->GetFrame(), nullptr);
    EXPECT_EQ(scope->UI_GetParentNode(), nullptr);
    EXPECT_TRUE(workspace->CanReanimateWindow("mixer"));
    EXPECT_TRUE(workspace->CanReanimateWindow(scope));
    boost::intrusive_ptr<TabPanel> otherScope(
        workspace->FindCreator("scope")->CreateTabPanel(workspace.get(), nullptr));
    EXPECT_FALSE(workspace->CanReanimateWindow(otherScope));
    EXPECT_FALSE(workspace->CanReanimateWindow("browser"));

    // Reopening the mixer rebuilds the window with the mixer in its old frame and state.
    ASSERT_TRUE(workspace->ReanimateWindow("mixer"));
    EXPECT_FALSE(workspace->CanReanimateWindow("mixer"));
    ASSERT_EQ(workspace->GetWindows().size(), 2u);
    TopLevelWindow* back = workspace->GetWindows()[1];
    EXPECT_EQ(back->UI_GetGlobalStructureRect(), RectT(300, 250, 600, 400));
    ASSERT_EQ(back->GetFrameCount(), 1u);
    EXPECT_EQ(Painted(back->GetFrame(0)->GetFrontTabPanel())->state, "bus 4");
    // The scope's frame waits in its place, the kept panel in it.
    EXPECT_TRUE(back->CanReanimateFrame(scope));
    ASSERT_TRUE(back->ReanimateFrame(scope));
    EXPECT_EQ(scope->GetFrame()->GetTopLevelWindow(), back);
    EXPECT_FALSE(workspace->ReanimateWindow("mixer"));
}

TEST_F(ClosedWindowMemory, AKeptPanelReopensItsWindowAndUnrecordedRemovalsLeaveNoMemory) {
    TopLevelWindow* floating = OpenFloating();
    boost::intrusive_ptr<TabPanel> scope(floating->GetFrame(1)->GetFrontTabPanel());
    ASSERT_TRUE(workspace->RemoveWindow(floating, true));
    ASSERT_TRUE(workspace->ReanimateWindow(scope));
    EXPECT_EQ(scope->GetFrame()->GetTopLevelWindow(), workspace->GetWindows()[1]);
    EXPECT_TRUE(workspace->GetRemovedWindowData().empty());

    ASSERT_TRUE(workspace->RemoveWindow(workspace->GetWindows()[1], false));
    EXPECT_TRUE(workspace->GetRemovedWindowData().empty());
}

TEST_F(ClosedWindowMemory, TheMemoryIsWrittenAndReadBackInOrder) {
    Register({"ghost", MixerPaint, /*hides*/ true});
    BuildTwoFrames();
    ASSERT_TRUE(workspace->RemoveWindow(OpenFloating(), true));
    RectT rect(50, 50, 300, 200);
    auto second = workspace->AddTopLevelWindow(false, &rect);
    second->CreateRootFrame("ghost", true, true);
    ASSERT_TRUE(workspace->RemoveWindow(second.get(), true));

    PropList data;
    workspace->SaveWorkspaceData(data);
    std::int32_t count = 0;
    ASSERT_TRUE(data.GetValue("FrameReanimMax", count));
    EXPECT_EQ(count, 2);
    std::vector<std::string> removed, hidden;
    ASSERT_TRUE(data.GetSubList("FrameReanim-0")->GetValue("RemovedTabs", removed));
    EXPECT_EQ(removed, (std::vector<std::string>{"mixer", "scope"}));
    ASSERT_TRUE(data.GetSubList("FrameReanim-1")->GetValue("HiddenTabs", hidden));
    EXPECT_EQ(hidden, std::vector<std::string>{"ghost"});

    // Read back where the ghost's creator is gone: its record keeps no panel.
    std::unique_ptr<TabCreator> ghostCreator(workspace->FindCreator("ghost"));
    workspace->UnregisterTabCreator("ghost");
    ReusableTabPool pool;
    workspace->ReadWorkspaceData(data, pool);
    ASSERT_EQ(workspace->GetRemovedWindowData().size(), 2u);
    auto first = workspace->GetRemovedWindowData().front();
    auto last = workspace->GetRemovedWindowData().back();
    EXPECT_EQ(first->tabTypes, (std::set<std::string>{"mixer", "scope"}));
    ASSERT_EQ(first->hiddenPanels.size(), 1u);
    EXPECT_EQ(first->hiddenPanels.front()->GetTabType(), "scope");
    EXPECT_TRUE(last->hiddenPanels.empty());
    EXPECT_EQ(main->GetFrameCount(), 2u); // no scratch frame left behind

    PropList none;
    workspace->ReadWorkspaceData(none, pool);
    EXPECT_TRUE(workspace->GetRemovedWindowData().empty());
}

TEST_F(ClosedWindowMemory, AClosedPanelComesBackInItsOldWindowAfterARestart) {
    BuildTwoFrames();
    TopLevelWindow* floating = OpenFloating();
    ASSERT_TRUE(workspace->RemoveWindow(floating, true));
    TempDir dir;
    PropList saved;
    SaveWorkspace(*workspace, saved, u"Session");
    orvcore::proplist::utils::SavePropList(dir.U16("session.xml"), saved);

    // A fresh start of the application.
    CloseWindows();
    Desktop::Reset();
    SetUp();
    PropList loaded;
    ASSERT_TRUE(orvcore::proplist::utils::LoadPropList(dir.U16("session.xml"), loaded, true));
    ASSERT_TRUE(RestoreWorkspace(*workspace, loaded, true, true, false));
    ASSERT_EQ(workspace->GetWindows().size(), 1u);
    ASSERT_TRUE(workspace->CanReanimateWindow("mixer"));

    ASSERT_TRUE(workspace->ReanimateWindow("mixer"));
    ASSERT_EQ(workspace->GetWindows().size(), 2u);
    TopLevelWindow* back = workspace->GetWindows()[1];
    EXPECT_EQ(back->UI_GetGlobalStructureRect(), RectT(300, 250, 600, 400));
    ASSERT_EQ(back->GetFrameCount(), 1u);
    EXPECT_EQ(back->GetFrame(0)->GetFrontTabPanel()->GetTabType(), "mixer");
    EXPECT_EQ(Painted(back->GetFrame(0)->GetFrontTabPanel())->state, "bus 4");
    // Its old slot: the left of the window's split, the scope still waiting on the right.
    EXPECT_EQ(GetMaximizedFramePath(back->GetFrame(0)->GetLMFrame()), "00");
    ASSERT_EQ(back->HiddenFrames().size(), 1u);
    ASSERT_EQ(back->HiddenFrames().front()->HiddenTabs().size(), 1u);
    boost::intrusive_ptr<TabPanel> scope = back->HiddenFrames().front()->HiddenTabs().front();
    EXPECT_EQ(scope->GetTabType(), "scope");
    ASSERT_TRUE(back->ReanimateFrame(scope));
    EXPECT_EQ(GetMaximizedFramePath(scope->GetFrame()->GetLMFrame()), "01");
}
