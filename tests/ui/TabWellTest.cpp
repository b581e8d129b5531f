// The tab well driven through the desktop: gestures and their action numbers, the front item,
// moving, overflow and scrolling, the flyout, and what it looks like.
#include "UiDoubles.h"

#include "host/ui/Theme.h"
#include "host/ui/controls/TabWell.h"
#include "support/SnapshotOnFailure.h"

#include <cstdlib>
#include <filesystem>

using namespace orvtest;
using namespace orvui::controls;

namespace {

class TabWellTest : public DesktopScenario {
protected:
    void SetUp() override {
        DesktopScenario::SetUp();
        window = MakeCaptionWindow(u"tabs", RectT(100, 100, 406, 328));
        well = new UI_TabWell([this](int action, long index, RectT const* rect) {
            actions.push_back(std::to_string(action) + ":" + std::to_string(index));
            lastRect = rect ? *rect : RectT();
        });
        window->ChildPushBack(well);
        well->UI_SetRect(RectF(0, 0, 400, 30));
        for (char16_t const* name : {u"Project", u"Media", u"Effects"}) {
            well->AddTab(well->GetTabCount(), name, false, true);
        }
    }
    void CloseWindows() override {
        well.reset();
        window.reset();
    }
    // The global point at a position inside item i (fractions of its width and height).
    PointT InTab(long i, float fx = 0.3f, float fy = 0.5f) const {
        RectT r = well->GetTabGlobalRect(i);
        return PointT(r.left + int(float(r.width) * fx), r.top + int(float(r.height) * fy));
    }
    PointT OnCloseBox(long i) const {
        RectF box = well->GetTab(i)->CloseBoxRect();
        return well->GetTab(i)->UI_LocalToGlobal(
            PointT(int(box.left + box.width / 2), int(box.top + box.height / 2)));
    }
    void Click(PointT p, int button = 0, int clicks = 1) {
        Desktop::Get().MouseDown(p, button, clicks);
        Desktop::Get().MouseUp(p, button);
    }

    boost::intrusive_ptr<RecordingWindow> window;
    boost::intrusive_ptr<UI_TabWell> well;
    std::vector<std::string> actions;
    RectT lastRect;
};

} // namespace

TEST_F(TabWellTest, GesturesReportTheirActionsWithTheIndex) {
    Click(InTab(1));
    EXPECT_EQ(actions, (std::vector<std::string>{"0:1"}));
    EXPECT_EQ(lastRect, well->GetTabGlobalRect(1));
    actions.clear();
    Click(OnCloseBox(2));
    EXPECT_EQ(actions, (std::vector<std::string>{"3:2"}));
    actions.clear();
    // A press on the close box released elsewhere closes nothing.
    Desktop::Get().MouseDown(OnCloseBox(0));
    Desktop::Get().MouseUp(InTab(1));
    EXPECT_TRUE(actions.empty());
    Click(InTab(0), 1);
    EXPECT_EQ(actions, (std::vector<std::string>{"10:0"}));
    actions.clear();
    Click(InTab(2));
    Click(InTab(2), 0, 2);
    EXPECT_EQ(actions, (std::vector<std::string>{"0:2", "11:2"}));
}

TEST_F(TabWellTest, ChangingTheFrontReportsEightThenSeven) {
    well->SetFrontmost(0);
    well->SetFrontmost(2);
    well->SetFrontmost(2); // no change, no report
    well->SetFrontmost(-1);
    EXPECT_EQ(actions, (std::vector<std::string>{"7:0", "8:0", "7:2", "8:2"}));
    EXPECT_FALSE(well->FrontmostIsValid());
    actions.clear();
    well->SetFrontmost(1);
    well->RemoveTab(1); // the front item goes: its panel is hidden
    EXPECT_EQ(actions, (std::vector<std::string>{"7:1", "8:1"}));
    EXPECT_EQ(well->GetFrontmost(), -1);
    well->SetFrontmost(1);
    well->AddTab(0, u"Before", false, true); // the front item keeps its place in the list
    EXPECT_EQ(well->GetFrontmost(), 2);
    EXPECT_EQ(well->GetTab(2)->name, u"Effects");
}

TEST_F(TabWellTest, MovingTabsKeepsItemsAndRectanglesInStep) {
    well->SetFrontmost(0);
    well->MoveTab(0, 2);
    EXPECT_EQ(well->GetTab(0)->name, u"Media");
    EXPECT_EQ(well->GetTab(2)->name, u"Project");
    EXPECT_EQ(well->GetFrontmost(), 2); // still "Project"
    float along = well->GetTabMargin();
    for (long i = 0; i < well->GetTabCount(); ++i) {
        RectF r = well->GetTabRect(i);
        EXPECT_FLOAT_EQ(r.left, along) << "tab " << i;
        along += r.width;
    }
    EXPECT_EQ(well->GetTabIndexFromPoint(PointF(well->GetTabRect(1).left + 2, 10)), 1);
    EXPECT_EQ(well->GetTabInsertIndexFromPoint(PointF(well->GetTabRect(1).left + 1, 10)), 1);
    EXPECT_EQ(well->GetTabInsertIndexFromPoint(PointF(380, 10)), 3);
    Click(InTab(2));
    EXPECT_EQ(actions.back(), "0:2");
}

TEST_F(TabWellTest, OverflowBringsTheScrollBarAndScrolling) {
    EXPECT_EQ(well->GetTabWellHeight(400), 24);
    EXPECT_EQ(well->GetTabWellHeight(0), 30); // a width of 0 never fits an item
    EXPECT_EQ(UI_TabWell::GetTabScrollbarHeight(), 6);
    for (int i = 0; i < 6; ++i) {
        well->AddTab(well->GetTabCount(), u"Another panel", false, true);
    }
    EXPECT_TRUE(well->IsOverflowing());
    EXPECT_EQ(well->GetTabWellHeight(400), 30);
    EXPECT_EQ(well->GetTabWellHeight(4000), 24);
    float before = well->GetTabRect(0).left;
    Desktop::Get().MouseWheel(InTab(0), -120);
    EXPECT_GT(well->GetScrollOffset(), 0);
    EXPECT_LT(well->GetTabRect(0).left, before);
    well->SetFrontmost(well->GetTabCount() - 1); // the front item is scrolled into view
    RectF last = well->GetTabRect(well->GetTabCount() - 1);
    EXPECT_LE(last.Right(), 400 - UI_TabWell::FlyoutLength + 0.5f);
    // Under the flyout there is no tab to press.
    EXPECT_EQ(well->GetTabIndexFromPoint(PointF(395, 10)), -1);
    UI_TabWell empty(nullptr);
    EXPECT_EQ(empty.GetTabWellHeight(0), 24);
}

TEST_F(TabWellTest, FlyoutGripperAndMenuButton) {
    well->SetFrontmost(1);
    actions.clear();
    RectT grip = well->GetFlyout()->GetGlobalGripperRect();
    Click(PointT(grip.left + grip.width / 2, grip.top + grip.height / 2));
    EXPECT_EQ(actions, (std::vector<std::string>{"2:1"}));
    EXPECT_EQ(lastRect, grip);
    actions.clear();
    RectT menu = well->GetFlyout()->GetGlobalMenuButtonRect();
    Click(PointT(menu.left + menu.width / 2, menu.top + menu.height / 2));
    EXPECT_EQ(actions, (std::vector<std::string>{"5:1"}));
    EXPECT_EQ(lastRect, menu);
}

TEST_F(TabWellTest, HoverLockAndMultiPaneMarks) {
    Desktop::Get().MouseMove(InTab(0));
    Desktop::Get().MouseMove(InTab(0, 0.4f));
    Desktop::Get().MouseMove(InTab(1));
    Desktop::Get().MouseMove(PointT(103 + 300, 125 + 10)); // past the items
    EXPECT_EQ(actions, (std::vector<std::string>{"6:0", "6:1", "6:-1"}));
    actions.clear();
    {
        UI_NodeManager::SuspendMouseOverUpdates frozen; // a drag freezes hover feedback
        Desktop::Get().MouseMove(InTab(2));
        EXPECT_TRUE(actions.empty());
    }
    well->SetLockable(1, true);
    well->SetMultitab(1, true);
    UI_TabItem* item = well->GetTab(1);
    RectF lock = item->LockRect(), multi = item->MultiTabRect();
    Click(item->UI_LocalToGlobal(PointT(int(lock.left + 5), int(lock.top + 5))));
    Click(item->UI_LocalToGlobal(PointT(int(multi.left + 5), int(multi.top + 5))));
    EXPECT_EQ(actions, (std::vector<std::string>{"9:1", "4:1"}));
    // The gripper of a tab leaves its icons out.
    EXPECT_LT(item->GetGlobalGripperRect().width, item->UI_GetGlobalRect().width);
}

TEST_F(TabWellTest, TablessDisplayAndTheTablessDragger) {
    EXPECT_FALSE(well->ShouldDisplayTabless());
    while (well->GetTabCount() > 1) {
        well->RemoveTab(well->GetTabCount() - 1);
    }
    EXPECT_FALSE(well->ShouldDisplayTabless());
    well->RemoveTab(0);
    well->AddTab(0, u"Toolbar", true, false);
    EXPECT_TRUE(well->ShouldDisplayTabless());

    std::vector<int> pressed;
    boost::intrusive_ptr<UI_TablessDragger> dragger(
        new UI_TablessDragger([&](int action, long, RectT const*) { pressed.push_back(action); }));
    window->ChildPushBack(dragger);
    dragger->UI_SetRect(RectF(0, 100, 12, 80));
    Click(window->UI_LocalToGlobal(PointT(5, 120)));
    EXPECT_EQ(pressed, std::vector<int>{0});
}

TEST_F(TabWellTest, VerticalWellsStackTheirItems) {
    well->UI_SetRect(RectF(0, 0, 30, 280));
    EXPECT_TRUE(well->SetTabWellIsVertical(true));
    EXPECT_FALSE(well->SetTabWellIsVertical(true));
    RectF first = well->GetTabRect(0), second = well->GetTabRect(1);
    EXPECT_FLOAT_EQ(first.left, 0);
    EXPECT_FLOAT_EQ(second.top, first.top + first.height);
    Click(InTab(1, 0.5f, 0.3f));
    EXPECT_EQ(actions.back(), "0:1");
    EXPECT_EQ(well->GetFlyout()->UI_GetRect().top, 280 - UI_TabWell::FlyoutLength);
}

TEST_F(TabWellTest, ThreeTabsWithADistinctFrontOneLookRight) {
    well->SetFrontmost(1);
    well->SetFocusedLook(true);
    well->UpdateTabColor(2, canvasor::ColorRGBA(0.9f, 0.6f, 0.1f, 1));
    canvasor::Image shot = Desktop::Get().Snapshot();
    auto at = [&](long tab, int dx, int dy) {
        RectT r = well->GetTabGlobalRect(tab);
        return shot.Pixel(r.left + dx, r.top + dy);
    };
    auto same = [](canvasor::ColorRGBA a, canvasor::ColorRGBA b) {
        return std::abs(a.r - b.r) < 0.01f && std::abs(a.g - b.g) < 0.01f && std::abs(a.b - b.b) < 0.01f;
    };
    EXPECT_TRUE(same(at(1, 3, 12), GetColor(color::TabFront)));
    EXPECT_TRUE(same(at(0, 3, 12), GetColor(color::TabBackground)));
    EXPECT_TRUE(same(at(1, 20, 0), GetColor(color::FocusedFrameBorder))); // the focused front tab's stroke
    EXPECT_TRUE(same(at(2, 20, 22), canvasor::ColorRGBA(0.9f, 0.6f, 0.1f, 1))); // the tab's colour stripe
    // The names are drawn: some pixel in the text area of each tab differs from its background.
    for (long tab = 0; tab < 3; ++tab) {
        bool ink = false;
        RectT r = well->GetTabGlobalRect(tab);
        for (int x = r.left + 10; x < r.left + 40 && !ink; ++x) {
            for (int y = r.top + 6; y < r.top + 18 && !ink; ++y) {
                ink = !same(shot.Pixel(x, y), GetColor(tab == 1 ? color::TabFront : color::TabBackground));
            }
        }
        EXPECT_TRUE(ink) << "no text drawn on tab " << tab;
    }
    // Kept as an artefact for a person to look at.
    char const* folder = std::getenv("ORV_TEST_SNAPSHOTS");
    std::filesystem::path dir = folder && *folder ? folder : "test-snapshots";
    std::filesystem::create_directories(dir);
    EXPECT_TRUE(shot.WritePNG((dir / "tab-well-three-tabs.png").string()));
}
