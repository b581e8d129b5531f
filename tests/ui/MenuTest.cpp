// Menus chosen through a real popup window run modally, answered by a driver that clicks and types.
#include "UiDoubles.h"

#include "host/ui/Menu.h"
#include "support/SnapshotOnFailure.h"

using namespace orvtest;
using orvui::utility::MenuWindow;
using orvui::utility::OS_Menu;
using orvui::utility::UI_DoContextMenu;
using orvui::utility::UI_DoPopupMenu;

namespace {

class MenuTest : public DesktopScenario {
protected:
    void SetUp() override {
        DesktopScenario::SetUp();
        menu.AppendItem(u"New Workspace...", 101);
        menu.AppendItem(u"Editing", 102, true, true);
        menu.AppendSeparator();
        menu.AppendItem(u"Disabled", 103, false);
        menu.AppendItem(u"Reset Workspace...", 104);
    }
    static orvui::ui::ModalDriver Steps(std::vector<std::function<void(MenuWindow&)>> steps) {
        return orvtest::Steps<MenuWindow>(std::move(steps));
    }
    static void ClickItem(MenuWindow& m, std::size_t position) {
        RectT r = m.GetItemGlobalRect(position);
        PointT p(r.left + r.width / 2, r.top + r.height / 2);
        Desktop::Get().MouseMove(p);
        Desktop::Get().MouseDown(p);
        Desktop::Get().MouseUp(p);
    }
    OS_Menu menu;
};

} // namespace

TEST_F(MenuTest, ItemsByPositionAndCommand) {
    EXPECT_EQ(menu.GetItemCount(), 5u);
    EXPECT_TRUE(menu.IsChecked(102));
    EXPECT_TRUE(menu.CheckItem(101, true));
    EXPECT_FALSE(menu.CheckItem(999, true));
    menu.InsertItem(0, u"Top", 100);
    menu.InsertSeparator(1);
    EXPECT_EQ(menu.GetItem(0).command, 100u);
    EXPECT_TRUE(menu.GetItem(1).separator);
    EXPECT_TRUE(menu.RemoveItem(0));
    EXPECT_FALSE(menu.RemoveItem(99));
    EXPECT_EQ(menu.GetItemCount(), 6u);
}

TEST_F(MenuTest, AClickChoosesAnItemAndDisabledOnesCannotBeChosen) {
    orvui::ui::ScopedModalDriver driver(Steps({[](MenuWindow& m) { ClickItem(m, 4); }}));
    EXPECT_EQ(UI_DoPopupMenu(menu, RectT(100, 100, 80, 20)), 104u);

    orvui::ui::ScopedModalDriver second(Steps({[](MenuWindow& m) { ClickItem(m, 3); }, // disabled
                                               [](MenuWindow& m) { ClickItem(m, 2); }, // separator
                                               [](MenuWindow&) { Desktop::Get().KeyDown(key::Escape); }}));
    EXPECT_EQ(UI_DoContextMenu(menu, PointT(300, 300)), 0u);
}

TEST_F(MenuTest, KeyboardMovesOverSeparatorsAndDisabledItems) {
    orvui::ui::ScopedModalDriver driver(Steps({[](MenuWindow&) { Desktop::Get().KeyDown(key::Down); },
                                               [](MenuWindow&) { Desktop::Get().KeyDown(key::Down); },
                                               [](MenuWindow& m) {
                                                   EXPECT_EQ(m.GetHighlighted(), 1);
                                                   Desktop::Get().KeyDown(key::Down); // skips 2 and 3
                                               },
                                               [](MenuWindow& m) {
                                                   EXPECT_EQ(m.GetHighlighted(), 4);
                                                   Desktop::Get().KeyDown(key::Enter);
                                               }}));
    EXPECT_EQ(UI_DoContextMenu(menu, PointT(300, 300)), 104u);
}

TEST_F(MenuTest, EscapeAPressOutsideOrNoDriverGiveNothing) {
    {
        orvui::ui::ScopedModalDriver driver(
            Steps({[](MenuWindow&) { Desktop::Get().KeyDown(key::Escape); }}));
        EXPECT_EQ(UI_DoContextMenu(menu, PointT(300, 300)), 0u);
    }
    {
        orvui::ui::ScopedModalDriver driver(
            Steps({[](MenuWindow&) { Desktop::Get().MouseDown(PointT(1500, 900)); }}));
        EXPECT_EQ(UI_DoContextMenu(menu, PointT(300, 300)), 0u);
    }
    EXPECT_FALSE(orvui::ui::HasModalDriver());
    EXPECT_EQ(UI_DoContextMenu(menu, PointT(300, 300)), 0u); // nobody to answer: closed at once
    EXPECT_EQ(UI_DoContextMenu(OS_Menu(), PointT(300, 300)), 0u);
}

TEST_F(MenuTest, TheMenuOpensUnderItsAnchorAndStaysOnScreen) {
    orvui::ui::ScopedModalDriver driver(Steps({[](MenuWindow& m) {
        RectT r = m.UI_GetGlobalStructureRect();
        EXPECT_EQ(r.left, 100);
        EXPECT_EQ(r.top, 120);
        EXPECT_TRUE(Desktop::Get().IsVisible(m.GetPlatformWindow()));
        EXPECT_EQ(orvui::ui::UI_NodeManager::Get()->GetModalWindow(), &m);
        m.CancelModal();
    }}));
    UI_DoPopupMenu(menu, RectT(100, 100, 80, 20));
    orvui::ui::ScopedModalDriver corner(Steps({[](MenuWindow& m) {
        RectT r = m.UI_GetGlobalStructureRect();
        EXPECT_LE(r.Right(), 1920);
        EXPECT_LE(r.Bottom(), 1080);
        m.CancelModal();
    }}));
    UI_DoContextMenu(menu, PointT(1910, 1075));
    EXPECT_EQ(orvui::ui::UI_NodeManager::Get()->GetModalWindow(), nullptr);
}

TEST_F(MenuTest, TheOwnerIsDisabledWhileTheMenuIsOpen) {
    boost::intrusive_ptr<RecordingWindow> owner(new RecordingWindow);
    owner->UI_CreateWindow(u"owner", 0, RectT(0, 0, 400, 300), style::Popup | style::Caption | style::Visible,
                           0);
    orvui::ui::ScopedModalDriver driver(Steps({[&](MenuWindow& m) {
        EXPECT_FALSE(Desktop::Get().IsEnabled(owner->GetPlatformWindow()));
        m.CancelModal();
    }}));
    UI_DoContextMenu(menu, PointT(50, 50), owner->GetPlatformWindow());
    EXPECT_TRUE(Desktop::Get().IsEnabled(owner->GetPlatformWindow()));
    owner.reset();
}
