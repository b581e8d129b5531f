// Repainting a workspace window in parts: after every kind of edit a user makes, the window painted
// only where something changed looks exactly like the window painted whole, and an edit in one
// corner of a window with many frames repaints that corner, not the window.
#include "WorkspaceDoubles.h"
#include "support/ImageCompare.h"

#include "workspace/WorkspaceUtils.h"

using namespace orvtest;
using orvui::ui::PointT;
using orvui::ui::RectT;

namespace {

class Repainting : public WorkspaceTest {
protected:
    NativeWindow Window() const { return main->GetPlatformWindow(); }

    // The pixels in which the window as painted so far differs from the window painted whole.
    int StaleAfterPartialPaints() {
        canvasor::Image partial = Desktop::Get().WindowImage(Window()).Clone();
        Desktop::Get().Invalidate(Window());
        return PixelsDiffering(Desktop::Get().WindowImage(Window()), partial);
    }
    // What an edit costs in painted pixels, as a share of the whole window.
    template <class Edit> double ShareRepainted(Edit&& edit) {
        Desktop::Get().WindowImage(Window());
        std::uint64_t before = Desktop::Get().PaintedPixels();
        edit();
        Desktop::Get().WindowImage(Window());
        RectT r = Desktop::Get().Record(Window())->rect;
        return double(Desktop::Get().PaintedPixels() - before) / (double(r.width) * double(r.height));
    }
};

} // namespace

TEST_F(Repainting, EveryEditPaintedInPartsMatchesAWholeRepaint) {
    BuildTwoFrames();
    Desktop::Get().Activate(appWindow);
    ASSERT_EQ(StaleAfterPartialPaints(), 0);

    WorkspaceFrame* below = main->AddTabbedFrame(left, "mixer", LayoutManager::Bottom);
    EXPECT_EQ(StaleAfterPartialPaints(), 0) << "after adding a frame";

    TabPanel* second = right->AddTab("mixer", true);
    EXPECT_EQ(StaleAfterPartialPaints(), 0) << "after adding a tab";

    Click(OnTab(right, 0));
    ASSERT_EQ(right->GetFrontTabPanel(), right->GetTabPanel(0));
    EXPECT_EQ(StaleAfterPartialPaints(), 0) << "after bringing a tab to the front";

    // A splitter bar dragged with the mouse.
    RectT l = left->UI_GetGlobalRect(), r = right->UI_GetGlobalRect();
    PointT bar((l.Right() + r.left) / 2, r.top + 40);
    Desktop::Get().MouseMove(bar);
    Desktop::Get().MouseDown(bar);
    Desktop::Get().MouseMove(PointT(bar.x + 60, bar.y));
    EXPECT_EQ(StaleAfterPartialPaints(), 0) << "while dragging a bar";
    Desktop::Get().MouseUp(PointT(bar.x + 60, bar.y));
    ASSERT_NE(left->UI_GetGlobalRect().width, l.width);
    EXPECT_EQ(StaleAfterPartialPaints(), 0) << "after dragging a bar";

    ASSERT_TRUE(WorkspaceUtils::ToggleThisFrameMaximizationState(*workspace, below));
    EXPECT_EQ(StaleAfterPartialPaints(), 0) << "with a frame maximised";
    ASSERT_TRUE(WorkspaceUtils::ToggleThisFrameMaximizationState(*workspace, below));
    EXPECT_EQ(StaleAfterPartialPaints(), 0) << "after the maximised frame is restored";

    ASSERT_TRUE(workspace->RemoveTab(right, second, true, true));
    EXPECT_EQ(StaleAfterPartialPaints(), 0) << "after closing a tab";
    ASSERT_TRUE(workspace->RemoveTab(below, 0L, true, true));
    ASSERT_EQ(main->GetFrameCount(), 2u);
    EXPECT_EQ(StaleAfterPartialPaints(), 0) << "after closing a frame's last tab";
}

TEST_F(Repainting, AnEditInOneCornerOfManyFramesRepaintsThatCorner) {
    Desktop::Get().Activate(appWindow);
    BuildTwoFrames();
    WorkspaceFrame* bottomLeft = main->AddTabbedFrame(left, "mixer", LayoutManager::Bottom);
    main->AddTabbedFrame(right, "mixer", LayoutManager::Bottom);
    ASSERT_EQ(main->GetFrameCount(), 4u);

    // Splitting a quarter repaints about that quarter (the new frame's half of it is painted again
    // once its panel takes the focus): not the window, as it would if the new frame first covered
    // the whole window before the layout placed it.
    WorkspaceFrame* added = nullptr;
    double split =
        ShareRepainted([&] { added = main->AddTabbedFrame(bottomLeft, "browser", LayoutManager::Right); });
    EXPECT_GT(split, 0.15);
    EXPECT_LT(split, 0.5);
    EXPECT_EQ(StaleAfterPartialPaints(), 0);

    // A new tab in the smallest frame repaints about that frame.
    double tab = ShareRepainted([&] { added->AddTab("editor", true); });
    EXPECT_GT(tab, 0.0);
    EXPECT_LT(tab, 0.2);
    EXPECT_EQ(StaleAfterPartialPaints(), 0);

    // Activating the window again, as focusing each new panel does, repaints nothing; moving the
    // focus to another frame repaints the two panels (which may show their focus) and the two
    // frames' borders and tab rows: here a quarter and an eighth of the window.
    EXPECT_EQ(ShareRepainted([&] { main->Activate(false); }), 0.0);
    double focus = ShareRepainted([&] { workspace->SetFocusedTabPanel(right->GetFrontTabPanel()); });
    EXPECT_GT(focus, 0.0);
    EXPECT_LT(focus, 0.45);
    EXPECT_EQ(StaleAfterPartialPaints(), 0);
}
