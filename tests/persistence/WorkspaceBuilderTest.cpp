// Default arrangements described with builders and laid onto a live workspace.
#include "workspace/WorkspaceDoubles.h"

#include "layout/Splitter.h"
#include "persistence/WorkspaceBuilder.h"

using namespace orvtest;
using orvui::ui::RectT;

namespace {

using WorkspaceBuilderTest = WorkspaceTest;

std::unique_ptr<FrameBuilder> Tabs(std::vector<std::string> types) {
    return std::make_unique<FrameBuilder>(std::move(types));
}

} // namespace

TEST_F(WorkspaceBuilderTest, AWindowIsBuiltFromItsTreeReusingPanels) {
    TabPanel* editor = main->CreateRootFrame("editor", true, true)->GetFrontTabPanel();
    auto rightSide = std::make_unique<SplitterBuilder>(false, Tabs({"browser"}), Tabs({"mixer", "editor"}));
    auto root = std::make_unique<SplitterBuilder>(true, Tabs({"editor"}), std::move(rightSide));
    root->SetSplitVal(0.25f);
    WorkspaceBuilder builder(*workspace, false, false);
    builder.AddWindow(std::move(root), RectT(50, 40, 1200, 800), "mixer");
    builder.BuildWorkspace();

    ASSERT_EQ(workspace->GetWindows().size(), 1u);
    EXPECT_EQ(main->UI_GetGlobalStructureRect(), RectT(50, 40, 1200, 800));
    ASSERT_EQ(main->GetFrameCount(), 3u);
    EXPECT_EQ(main->GetFrame(0)->GetFrontTabPanel(), editor); // the existing panel, reused
    Splitter* split = AsSplitter(main->GetLayoutManager()->GetRootSplitter()->GetLeftOrTop());
    ASSERT_NE(split, nullptr);
    EXPECT_TRUE(split->IsVertical());
    EXPECT_NEAR(split->GetPlacement(), 0.25f, 0.005f); // laid out to whole pixels
    Splitter defaults(main->GetLayoutManager(), false);
    EXPECT_FLOAT_EQ(AsSplitter(split->GetRightOrBottom())->GetPlacement(), defaults.GetPlacement());
    EXPECT_EQ(main->GetFrame(2)->GetTabCount(), 2);
    ASSERT_TRUE(main->HasStaticElement(LayoutManager::Top));
    EXPECT_EQ(main->GetStaticElement(LayoutManager::Top)->GetTabType(), "mixer");
}

TEST_F(WorkspaceBuilderTest, FramesClampTheirFrontTabAndRememberClosedOnes) {
    Register({"scope", MixerPaint, /*hides*/ true});
    auto frame = Tabs({"editor", "browser"});
    frame->SetFrontTabIdx(5);
    frame->AddTab("mixer", true);
    auto unknown = Tabs({"nothing"});
    unknown->AddTab("scope", true);
    WorkspaceBuilder builder(*workspace, false, true);
    EXPECT_TRUE(builder.UsePropList());
    builder.AddWindow(std::make_unique<SplitterBuilder>(true, std::move(frame), std::move(unknown)),
                      RectT(0, 0, 1000, 700), "");
    builder.BuildWorkspace();

    ASSERT_EQ(main->GetFrameCount(), 1u);
    WorkspaceFrame* built = main->GetFrame(0);
    EXPECT_EQ(built->GetFrontTabIndex(), 1);
    EXPECT_TRUE(built->GetFrontTabPanel()->UI_IsShown());
    EXPECT_TRUE(built->CanReanimateTab("mixer"));
    // The frame of an unknown type leaves a hidden side holding the kept scope.
    Splitter* split = AsSplitter(main->GetLayoutManager()->GetRootSplitter()->GetLeftOrTop());
    ASSERT_NE(split, nullptr);
    EXPECT_FALSE(split->IsRightOrBottomSubtreeVisible());
    ASSERT_EQ(main->HiddenFrames().size(), 1u);
    boost::intrusive_ptr<TabPanel> scope = main->HiddenFrames().front()->HiddenTabs().front();
    ASSERT_TRUE(main->ReanimateFrame(scope));
    EXPECT_EQ(main->GetFrameCount(), 2u);
}

TEST_F(WorkspaceBuilderTest, SurplusWindowsGoAndMissingOnesAreMade) {
    BuildTwoFrames();
    workspace->AddTopLevelWindow(false, nullptr)->CreateRootFrame("mixer", true, true);
    workspace->AddTopLevelWindow(false, nullptr)->CreateRootFrame("browser", true, true);
    WorkspaceBuilder builder(*workspace, false, false);
    builder.AddWindow(Tabs({"editor"}), RectT(0, 0, 1000, 700), "");
    builder.AddWindow(Tabs({"mixer"}), RectT(200, 200, 400, 300), "");
    builder.BuildWorkspace();
    ASSERT_EQ(workspace->GetWindows().size(), 2u);
    EXPECT_EQ(workspace->GetWindows()[1]->UI_GetGlobalStructureRect(), RectT(200, 200, 400, 300));
    EXPECT_TRUE(workspace->log.empty()); // no orphaning from a build

    WorkspaceBuilder more(*workspace, false, false);
    for (int i = 0; i < 3; ++i) {
        more.AddWindow(Tabs({"editor"}), RectT(100 * i, 100, 400, 300), "");
    }
    more.BuildWorkspace();
    EXPECT_EQ(workspace->GetWindows().size(), 3u);
}
