// The tab strip of a frame: one item per panel (name, colour, close box, lock icon, multi-pane mark,
// whether the panel may show without a tab), a front item, a flyout at the end with a gripper (drag
// the whole frame) and a menu button, scrolling when the items do not fit, and the gestures it
// reports through its callback as TabItemAction numbers. Horizontal along the top of a frame, or
// vertical along its side.
//
// Metrics: the well is 24 pixels high (wide when vertical), plus a 6-pixel scroll bar when its items
// overflow; an item is its text's width plus 10 pixels of padding on each side, plus 16 for a close
// box, 14 for a lock icon and 12 for a multi-pane mark; the flyout takes 32 pixels (gripper 12,
// menu button 20).
#pragma once

#include "host/ui/UI_Node.h"
#include "host/ui/canvasor/Color.h"

#include <functional>
#include <string>
#include <vector>

namespace orvui::controls {

using ui::PointF;
using ui::PointT;
using ui::RectF;
using ui::RectT;

// The gestures a tab well reports, with the index of the item concerned.
enum TabItemAction {
    TabPressed = 0,           // press on a tab, not on its close box or icons
    TabKeyboardActivated = 1, // a tab chosen with the keyboard
    FlyoutGripperPressed = 2, // press on the flyout's gripper (drag the whole frame)
    TabCloseClicked = 3,      // click on a tab's close box
    TabMultiPaneClicked = 4,  // click on a tab's multi-pane mark
    FlyoutMenuClicked = 5,    // click on the flyout's menu button
    TabHoverChanged = 6,      // the item under the pointer changed (index -1: none)
    TabBecameFront = 7,       // show the panel of this item
    TabLeftFront = 8,         // hide the panel of this item
    TabLockClicked = 9,       // click on a tab's lock icon
    TabSecondaryPressed = 10, // secondary-button press on a tab
    TabDoubleClicked = 11,    // double click on a tab
};

// Reports an action with its item index and, where it has one, a global rectangle to anchor to.
using TabActionCallback = std::function<void(int action, long index, RectT const* rect)>;

// The minimum height of a tab well, and the thickness of the focused front tab's stroke.
int GetTabWellMinHeight();
float GetFrontmostFocusedStrokeSize();

class UI_TabWell;

// One tab of a well.
class UI_TabItem : public ui::UI_Node {
public:
    std::u16string name;
    canvasor::ColorRGBA color;
    bool canClose = true;
    bool allowTabless = false;
    bool multiTab = false;
    bool lockable = false;
    bool locked = false;

    // The strip by which the tab is dragged (the whole tab but its icons), in global coordinates.
    RectT GetGlobalGripperRect() const;
    // The item's icons, in the item's own coordinates (empty when it has none).
    RectF CloseBoxRect() const;
    RectF LockRect() const;
    RectF MultiTabRect() const;
    // The length the item wants along the well.
    float WantedLength() const;

private:
    // Measuring text is the costly part of arranging a well; the width is kept until the name changes.
    mutable std::u16string measuredName_;
    mutable float measuredWidth_ = -1.0f;
};

// The flyout at the end of a well: a gripper to drag the whole frame and a menu button.
class UI_TabWellFlyout : public ui::UI_Node {
public:
    RectF GripperRect() const;
    RectF MenuButtonRect() const;
    RectT GetGlobalGripperRect() const;
    RectT GetGlobalMenuButtonRect() const;
    void UI_Draw(canvasor::Canvasor& c) override;
};

class UI_TabWell : public ui::UI_Node {
public:
    static constexpr int WellHeight = 24;
    static constexpr int ScrollbarHeight = 6;
    static constexpr float FlyoutLength = 32;
    static constexpr float DefaultMargin = 4;

    explicit UI_TabWell(TabActionCallback callback);

    // Inserts an item at index (clamped); returns where it went. The front item keeps its panel: an
    // insertion before it moves the front index along without reporting a change.
    long AddTab(long index, std::u16string const& name, bool allowTabless, bool canClose);
    // Removes an item; removing the front one leaves no front item (-1) and reports 8 for it.
    void RemoveTab(long index);
    // Moves an item to another position; the front item stays the same item.
    void MoveTab(long from, long to);
    long GetTabCount() const { return long(items_.size()); }
    UI_TabItem* GetTab(long index) const;

    void UpdateTabName(long index, std::u16string const& name);
    void UpdateTabColor(long index, canvasor::ColorRGBA const& color);
    void SetMultitab(long index, bool multiTab);
    void SetLockable(long index, bool lockable);
    void SetLocked(long index, bool locked);
    void SetCanClose(long index, bool canClose);

    long GetFrontmost() const { return front_; }
    // Makes an item the front one (-1 for none), reporting 8 for the old one and then 7 for the new.
    void SetFrontmost(long index);
    bool FrontmostIsValid() const { return front_ >= 0 && front_ < GetTabCount(); }

    // Returns whether the orientation changed.
    bool SetTabWellIsVertical(bool vertical);
    bool GetTabWellIsVertical() const { return vertical_; }
    // The space before the first item along the well.
    void SetTabMargin(float margin);
    void RestoreDefaultMargin() { SetTabMargin(DefaultMargin); }
    float GetTabMargin() const { return margin_; }

    // The well's height for a width: 24, plus the scroll bar when the items do not fit (a width of 0
    // counts as not fitting when there is an item).
    int GetTabWellHeight(int width) const;
    static int GetTabScrollbarHeight() { return ScrollbarHeight; }
    static int GetTabWellMinHeight() { return WellHeight; }
    bool IsOverflowing() const;
    // Exactly one item, and it may show without a tab.
    bool ShouldDisplayTabless() const;

    // An item's rectangle in the well's coordinates (scrolling applied), and in global ones.
    RectF GetTabRect(long index) const;
    RectT GetTabGlobalRect(long index) const;
    // The item under a local point, or -1.
    long GetTabIndexFromPoint(PointF local) const;
    // The index a dragged tab dropped at a local point would take: before the item whose middle
    // is past the point, else at the end.
    long GetTabInsertIndexFromPoint(PointF local) const;
    UI_TabWellFlyout* GetFlyout() const { return flyout_.get(); }

    float GetScrollOffset() const { return scroll_; }
    void ScrollBy(float delta);
    // Brings an item fully into view.
    void ScrollToTab(long index);

    // The frame's focus changed: the front tab's stroke follows it.
    void InvalidateDueToFocusChange() { UI_Invalidate(); }
    void SetFocusedLook(bool focused);
    bool GetFocusedLook() const { return focused_; }
    // Reports keyboard activation of an item (action 1).
    void ActivateTabByKeyboard(long index);

    void UI_Draw(canvasor::Canvasor& c) override;
    bool UI_DoMouseEvent(ui::UI_Node* target, ui::MouseEvent& event) override;
    void UI_SizeChanged() override;

private:
    void Report(int action, long index, RectT const* rect = nullptr);
    void Arrange();
    float Along(PointF p) const { return vertical_ ? p.y : p.x; }
    float Length() const { return vertical_ ? UI_GetRect().height : UI_GetRect().width; }
    float ItemsLength() const;
    float ItemsRoom() const;
    // How far the items can scroll: the length they need beyond the room they have.
    float MostScroll() const;
    void DrawItem(canvasor::Canvasor& c, long index);

    TabActionCallback callback_;
    std::vector<boost::intrusive_ptr<UI_TabItem>> items_;
    boost::intrusive_ptr<UI_TabWellFlyout> flyout_;
    long front_ = -1;
    long hover_ = -1;
    bool vertical_ = false;
    float margin_ = DefaultMargin;
    float scroll_ = 0;
    bool focused_ = false;
    // What the current press started on, for clicks completed on release.
    enum class Pressed { Nothing, CloseBox, Lock, MultiTab, MenuButton } pressed_ = Pressed::Nothing;
    long pressedIndex_ = -1;
};

// The strip of a tabless frame: a press on it reports its action (the frame's tear-off).
class UI_TablessDragger : public ui::UI_Node {
public:
    explicit UI_TablessDragger(TabActionCallback callback)
        : callback_(std::move(callback)) {}
    void SetGripperShown(bool shown) { gripperShown_ = shown; }
    bool GetGripperShown() const { return gripperShown_; }
    void UI_Draw(canvasor::Canvasor& c) override;
    bool UI_DoMouseEvent(ui::UI_Node* target, ui::MouseEvent& event) override;

private:
    TabActionCallback callback_;
    bool gripperShown_ = true;
};

} // namespace orvui::controls
