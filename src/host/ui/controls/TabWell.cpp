// The tab well: arranging items along the well, scrolling, the gestures and the drawing.
#include "host/ui/controls/TabWell.h"

#include "host/core/TextConversion.h"
#include "host/ui/NodeManager.h"
#include "host/ui/Theme.h"
#include "host/ui/canvasor/Canvasor.h"

#include <algorithm>

namespace orvui::controls {

using canvasor::Canvasor;
using canvasor::ColorRGBA;

namespace {
constexpr float Padding = 10;
constexpr float CloseLength = 16;
constexpr float LockLength = 14;
constexpr float MultiLength = 12;
constexpr float IconSize = 11;

// An icon's square, centred across the item, at a position along it.
RectF IconAt(float along, float across, bool vertical) {
    float offset = (float(UI_TabWell::WellHeight) - IconSize) / 2;
    return vertical ? RectF(offset + across, along, IconSize, IconSize)
                    : RectF(along, offset + across, IconSize, IconSize);
}
} // namespace

int GetTabWellMinHeight() {
    return UI_TabWell::WellHeight;
}
float GetFrontmostFocusedStrokeSize() {
    return 2.0f;
}

// --- Items ---

float UI_TabItem::WantedLength() const {
    if (measuredWidth_ < 0 || measuredName_ != name) {
        measuredWidth_ =
            canvasor::Canvasor::Measure(orvcore::utility::UTF16to8(name), canvasor::Font()).width;
        measuredName_ = name;
    }
    float text = measuredWidth_;
    return 2 * Padding + text + (canClose ? CloseLength : 0) + (lockable ? LockLength : 0) +
           (multiTab ? MultiLength : 0);
}

namespace {
bool ItemIsVertical(UI_TabItem const& item) {
    auto* well = dynamic_cast<UI_TabWell const*>(item.UI_GetParentNode());
    return well && well->GetTabWellIsVertical();
}
float ItemLength(UI_TabItem const& item) {
    RectF r = item.UI_GetRect();
    return ItemIsVertical(item) ? r.height : r.width;
}
} // namespace

// Icons sit at the far end of the item: close box last, then the lock, then the multi-pane mark.
RectF UI_TabItem::CloseBoxRect() const {
    if (!canClose) {
        return RectF();
    }
    return IconAt(ItemLength(*this) - Padding / 2 - CloseLength + (CloseLength - IconSize) / 2, 0,
                  ItemIsVertical(*this));
}

RectF UI_TabItem::LockRect() const {
    if (!lockable) {
        return RectF();
    }
    float end = ItemLength(*this) - Padding / 2 - (canClose ? CloseLength : 0);
    return IconAt(end - LockLength + (LockLength - IconSize) / 2, 0, ItemIsVertical(*this));
}

RectF UI_TabItem::MultiTabRect() const {
    if (!multiTab) {
        return RectF();
    }
    float end = ItemLength(*this) - Padding / 2 - (canClose ? CloseLength : 0) - (lockable ? LockLength : 0);
    return IconAt(end - MultiLength + (MultiLength - IconSize) / 2, 0, ItemIsVertical(*this));
}

RectT UI_TabItem::GetGlobalGripperRect() const {
    RectT whole = UI_GetGlobalRect();
    float icons = (canClose ? CloseLength : 0) + (lockable ? LockLength : 0) + (multiTab ? MultiLength : 0);
    if (ItemIsVertical(*this)) {
        return RectT(whole.left, whole.top, whole.width, std::max(0, whole.height - int(icons)));
    }
    return RectT(whole.left, whole.top, std::max(0, whole.width - int(icons)), whole.height);
}

// --- Flyout ---

RectF UI_TabWellFlyout::GripperRect() const {
    RectF r = UI_GetLocalBounds();
    return r.width >= r.height ? RectF(0, 0, 12, r.height) : RectF(0, 0, r.width, 12);
}

RectF UI_TabWellFlyout::MenuButtonRect() const {
    RectF r = UI_GetLocalBounds();
    return r.width >= r.height ? RectF(12, 0, r.width - 12, r.height) : RectF(0, 12, r.width, r.height - 12);
}

RectT UI_TabWellFlyout::GetGlobalGripperRect() const {
    RectF g = GripperRect();
    return UI_LocalToGlobal(RectT(int(g.left), int(g.top), int(g.width), int(g.height)));
}

RectT UI_TabWellFlyout::GetGlobalMenuButtonRect() const {
    RectF m = MenuButtonRect();
    return UI_LocalToGlobal(RectT(int(m.left), int(m.top), int(m.width), int(m.height)));
}

void UI_TabWellFlyout::UI_Draw(Canvasor& c) {
    c.FillRect(UI_GetLocalBounds(), ui::GetColor(ui::color::TabWellBackground));
    RectF g = GripperRect();
    c.FillRect(g, canvasor::LinearGradient{PointF(0, 0), PointF(0, g.height),
                                           ui::GetColor(ui::color::GripperTop),
                                           ui::GetColor(ui::color::GripperBottom)});
    if (canvasor::FileImageP grip = ui::UI_NodeManager::Get()->GetImage("gripper")) {
        c.DrawImage(grip->GetImage(),
                    RectF(g.left + (g.width - grip->Width()) / 2, g.top + (g.height - grip->Height()) / 2,
                          float(grip->Width()), float(grip->Height())));
    }
    RectF m = MenuButtonRect();
    if (canvasor::FileImageP arrow = ui::UI_NodeManager::Get()->GetImage("DownArrow")) {
        c.DrawImage(arrow->GetImage(),
                    RectF(m.left + (m.width - arrow->Width()) / 2, m.top + (m.height - arrow->Height()) / 2,
                          float(arrow->Width()), float(arrow->Height())));
    }
}

// --- The well ---

UI_TabWell::UI_TabWell(TabActionCallback callback)
    : callback_(std::move(callback))
    , flyout_(new UI_TabWellFlyout) {
    ChildPushBack(flyout_);
    UI_SetNodeID("TabWell");
}

void UI_TabWell::Report(int action, long index, RectT const* rect) {
    if (callback_) {
        boost::intrusive_ptr<ui::UI_Node> keep(
            IsReferenced() ? this : nullptr); // a handler may take the well out of its frame
        callback_(action, index, rect);
    }
}

UI_TabItem* UI_TabWell::GetTab(long index) const {
    return index >= 0 && index < GetTabCount() ? items_[std::size_t(index)].get() : nullptr;
}

long UI_TabWell::AddTab(long index, std::u16string const& name, bool allowTabless, bool canClose) {
    index = std::clamp(index, 0L, GetTabCount());
    boost::intrusive_ptr<UI_TabItem> item(new UI_TabItem);
    item->name = name;
    item->allowTabless = allowTabless;
    item->canClose = canClose;
    items_.insert(items_.begin() + index, item);
    ChildInsert(std::size_t(index), item);
    if (front_ >= index) {
        ++front_;
    }
    Arrange();
    return index;
}

void UI_TabWell::RemoveTab(long index) {
    if (!GetTab(index)) {
        return;
    }
    if (index == front_) {
        SetFrontmost(-1);
    }
    ChildRemove(items_[std::size_t(index)].get());
    items_.erase(items_.begin() + index);
    if (front_ > index) {
        --front_;
    }
    if (hover_ >= GetTabCount()) {
        hover_ = -1;
    }
    Arrange();
}

void UI_TabWell::MoveTab(long from, long to) {
    if (!GetTab(from) || to < 0 || to >= GetTabCount() || from == to) {
        return;
    }
    boost::intrusive_ptr<UI_TabItem> item = items_[std::size_t(from)];
    items_.erase(items_.begin() + from);
    items_.insert(items_.begin() + to, item);
    ChildMove(item.get(), std::size_t(to));
    if (front_ == from) {
        front_ = to;
    } else if (from < front_ && to >= front_) {
        --front_;
    } else if (from > front_ && to <= front_) {
        ++front_;
    }
    Arrange();
}

void UI_TabWell::UpdateTabName(long index, std::u16string const& name) {
    if (UI_TabItem* item = GetTab(index); item && item->name != name) {
        item->name = name;
        Arrange();
    }
}

void UI_TabWell::UpdateTabColor(long index, ColorRGBA const& color) {
    if (UI_TabItem* item = GetTab(index); item && !(item->color == color)) {
        item->color = color;
        UI_Invalidate();
    }
}

void UI_TabWell::SetMultitab(long index, bool multiTab) {
    if (UI_TabItem* item = GetTab(index); item && item->multiTab != multiTab) {
        item->multiTab = multiTab;
        Arrange();
    }
}

void UI_TabWell::SetLockable(long index, bool lockable) {
    if (UI_TabItem* item = GetTab(index); item && item->lockable != lockable) {
        item->lockable = lockable;
        Arrange();
    }
}

void UI_TabWell::SetLocked(long index, bool locked) {
    if (UI_TabItem* item = GetTab(index); item && item->locked != locked) {
        item->locked = locked;
        UI_Invalidate();
    }
}

void UI_TabWell::SetCanClose(long index, bool canClose) {
    if (UI_TabItem* item = GetTab(index); item && item->canClose != canClose) {
        item->canClose = canClose;
        Arrange();
    }
}

void UI_TabWell::SetFrontmost(long index) {
    if (index < -1 || index >= GetTabCount()) {
        index = -1;
    }
    if (index == front_) {
        return;
    }
    long previous = front_;
    front_ = index;
    if (previous >= 0 && previous < GetTabCount()) {
        Report(TabLeftFront, previous);
    }
    if (index >= 0) {
        ScrollToTab(index);
        Report(TabBecameFront, index);
    }
    UI_Invalidate();
}

bool UI_TabWell::SetTabWellIsVertical(bool vertical) {
    if (vertical == vertical_) {
        return false;
    }
    vertical_ = vertical;
    scroll_ = 0;
    Arrange();
    return true;
}

void UI_TabWell::SetTabMargin(float margin) {
    margin_ = std::max(0.0f, margin);
    Arrange();
}

float UI_TabWell::ItemsLength() const {
    float total = 0;
    for (auto const& item : items_) {
        total += item->WantedLength();
    }
    return total;
}

float UI_TabWell::ItemsRoom() const {
    return Length() - margin_ - FlyoutLength;
}

bool UI_TabWell::IsOverflowing() const {
    return !items_.empty() && ItemsLength() > ItemsRoom();
}

int UI_TabWell::GetTabWellHeight(int width) const {
    if (items_.empty()) {
        return WellHeight;
    }
    bool fits = width > 0 && ItemsLength() <= float(width) - margin_ - FlyoutLength;
    return WellHeight + (fits ? 0 : ScrollbarHeight);
}

bool UI_TabWell::ShouldDisplayTabless() const {
    return items_.size() == 1 && items_.front()->allowTabless;
}

void UI_TabWell::Arrange() {
    float along = margin_ - scroll_;
    for (auto const& item : items_) {
        float length = item->WantedLength();
        item->UI_SetRect(vertical_ ? RectF(0, along, float(WellHeight), length)
                                   : RectF(along, 0, length, float(WellHeight)));
        along += length;
    }
    RectF bounds = UI_GetLocalBounds();
    flyout_->UI_SetRect(
        vertical_ ? RectF(0, std::max(0.0f, bounds.height - FlyoutLength), float(WellHeight), FlyoutLength)
                  : RectF(std::max(0.0f, bounds.width - FlyoutLength), 0, FlyoutLength, float(WellHeight)));
    UI_Invalidate();
}

void UI_TabWell::UI_SizeChanged() {
    // The scroll position is kept within what the new size allows, and the items are arranged once.
    scroll_ = std::clamp(scroll_, 0.0f, MostScroll());
    Arrange();
}

float UI_TabWell::MostScroll() const {
    return std::max(0.0f, ItemsLength() - std::max(0.0f, ItemsRoom()));
}

void UI_TabWell::ScrollBy(float delta) {
    float next = std::clamp(scroll_ + delta, 0.0f, MostScroll());
    if (next != scroll_) {
        scroll_ = next;
        Arrange();
    }
}

void UI_TabWell::ScrollToTab(long index) {
    if (!GetTab(index) || !IsOverflowing()) {
        return;
    }
    RectF r = GetTabRect(index);
    float start = vertical_ ? r.top : r.left;
    float length = vertical_ ? r.height : r.width;
    float room = std::max(0.0f, ItemsRoom());
    if (start < margin_) {
        ScrollBy(start - margin_);
    } else if (start + length > margin_ + room) {
        ScrollBy(start + length - margin_ - room);
    }
}

RectF UI_TabWell::GetTabRect(long index) const {
    UI_TabItem* item = GetTab(index);
    return item ? item->UI_GetRect() : RectF();
}

RectT UI_TabWell::GetTabGlobalRect(long index) const {
    UI_TabItem* item = GetTab(index);
    return item ? item->UI_GetGlobalRect() : RectT();
}

long UI_TabWell::GetTabIndexFromPoint(PointF local) const {
    float room = margin_ + std::max(0.0f, ItemsRoom());
    if (Along(local) >= room) {
        return -1; // under the flyout
    }
    for (long i = 0; i < GetTabCount(); ++i) {
        if (items_[std::size_t(i)]->UI_GetRect().Contains(local)) {
            return i;
        }
    }
    return -1;
}

long UI_TabWell::GetTabInsertIndexFromPoint(PointF local) const {
    for (long i = 0; i < GetTabCount(); ++i) {
        RectF r = items_[std::size_t(i)]->UI_GetRect();
        float middle = vertical_ ? r.top + r.height / 2 : r.left + r.width / 2;
        if (Along(local) < middle) {
            return i;
        }
    }
    return GetTabCount();
}

void UI_TabWell::SetFocusedLook(bool focused) {
    if (focused != focused_) {
        focused_ = focused;
        UI_Invalidate();
    }
}

void UI_TabWell::ActivateTabByKeyboard(long index) {
    if (GetTab(index)) {
        Report(TabKeyboardActivated, index);
    }
}

bool UI_TabWell::UI_DoMouseEvent(ui::UI_Node*, ui::MouseEvent& event) {
    namespace action = ui::action;
    PointF local = event.GetLocalPoint();
    if (event.IsAction(action::Wheel)) {
        ScrollBy(-float(event.GetWheelDelta()) / 4);
        return true;
    }
    UI_TabWellFlyout* flyout = flyout_.get();
    PointF inFlyout =
        flyout->UI_GlobalToLocalF(PointF(float(event.GetGlobalPoint().x), float(event.GetGlobalPoint().y)));
    bool overFlyout = flyout->UI_HitTest(inFlyout);
    long index = overFlyout ? -1 : GetTabIndexFromPoint(local);
    if (event.IsAction(action::Move)) {
        // Hover feedback stays as it is while a drag freezes it.
        if (index != hover_ && !ui::UI_NodeManager::Get()->MouseOverUpdatesSuspended()) {
            hover_ = index;
            Report(TabHoverChanged, index);
            UI_Invalidate();
        }
        return false;
    }
    if (event.IsAction(action::Press)) {
        pressed_ = Pressed::Nothing;
        pressedIndex_ = index;
        if (overFlyout) {
            if (flyout->GripperRect().Contains(inFlyout)) {
                RectT grip = flyout->GetGlobalGripperRect();
                Report(FlyoutGripperPressed, front_, &grip);
            } else {
                pressed_ = Pressed::MenuButton;
            }
            return true;
        }
        UI_TabItem* item = GetTab(index);
        if (!item) {
            return false;
        }
        PointF inItem =
            item->UI_GlobalToLocalF(PointF(float(event.GetGlobalPoint().x), float(event.GetGlobalPoint().y)));
        if (item->CloseBoxRect().Contains(inItem)) {
            pressed_ = Pressed::CloseBox;
        } else if (item->LockRect().Contains(inItem)) {
            pressed_ = Pressed::Lock;
        } else if (item->MultiTabRect().Contains(inItem)) {
            pressed_ = Pressed::MultiTab;
        } else {
            RectT rect = item->UI_GetGlobalRect();
            Report(TabPressed, index, &rect);
        }
        return true;
    }
    if (event.IsAction(action::DoubleClickPress)) {
        if (GetTab(index)) {
            Report(TabDoubleClicked, index);
            return true;
        }
        return false;
    }
    if (event.IsAction(action::SecondaryPress)) {
        if (GetTab(index)) {
            RectT rect = GetTabGlobalRect(index);
            Report(TabSecondaryPressed, index, &rect);
            return true;
        }
        return false;
    }
    if (event.IsAction(action::Release)) {
        Pressed pressed = pressed_;
        long pressedIndex = pressedIndex_;
        pressed_ = Pressed::Nothing;
        if (pressed == Pressed::MenuButton && overFlyout && flyout->MenuButtonRect().Contains(inFlyout)) {
            RectT button = flyout->GetGlobalMenuButtonRect();
            Report(FlyoutMenuClicked, front_, &button);
            return true;
        }
        UI_TabItem* item = GetTab(index);
        if (!item || index != pressedIndex) {
            return false;
        }
        PointF inItem =
            item->UI_GlobalToLocalF(PointF(float(event.GetGlobalPoint().x), float(event.GetGlobalPoint().y)));
        RectT rect = item->UI_GetGlobalRect();
        if (pressed == Pressed::CloseBox && item->CloseBoxRect().Contains(inItem)) {
            Report(TabCloseClicked, index, &rect);
        } else if (pressed == Pressed::Lock && item->LockRect().Contains(inItem)) {
            Report(TabLockClicked, index, &rect);
        } else if (pressed == Pressed::MultiTab && item->MultiTabRect().Contains(inItem)) {
            Report(TabMultiPaneClicked, index, &rect);
        } else {
            return false;
        }
        return true;
    }
    return false;
}

// --- Drawing ---

void UI_TabWell::DrawItem(Canvasor& c, long index) {
    UI_TabItem& item = *items_[std::size_t(index)];
    RectF r = item.UI_GetRect();
    bool front = index == front_;
    c.Save();
    c.Translate(r.left, r.top);
    RectF local(0, 0, r.width, r.height);
    c.FillRect(local, ui::GetColor(front ? ui::color::TabFront : ui::color::TabBackground));
    if (index == hover_ && !front) {
        c.FillRect(local, ColorRGBA(1, 1, 1, 0.06f));
    }
    if (item.color.a > 0) {
        c.FillRect(vertical_ ? RectF(r.width - 3, 0, 3, r.height) : RectF(0, r.height - 3, r.width, 3),
                   item.color);
    }
    if (front && focused_) {
        float s = GetFrontmostFocusedStrokeSize();
        c.FillRect(vertical_ ? RectF(0, 0, s, r.height) : RectF(0, 0, r.width, s),
                   ui::GetColor(ui::color::FocusedFrameBorder));
    }
    // The divider between items.
    c.FillRect(vertical_ ? RectF(0, r.height - 1, r.width, 1) : RectF(r.width - 1, 0, 1, r.height),
               ui::GetColor(ui::color::TabWellBackground));
    std::string text = orvcore::utility::UTF16to8(item.name);
    canvasor::Font font;
    float textHeight = canvasor::Canvasor::Measure(text, font).height;
    if (vertical_) {
        // Vertical wells read from bottom to top.
        c.Save();
        c.Translate((r.width - textHeight) / 2, r.height - Padding);
        c.Rotate(-1.5707964f);
        c.DrawText(text, PointF(0, 0), font, ui::GetColor(ui::color::TabText));
        c.Restore();
    } else {
        c.DrawText(text, PointF(Padding, (r.height - textHeight) / 2), font,
                   ui::GetColor(ui::color::TabText));
    }
    if (RectF box = item.CloseBoxRect(); box.width > 0) {
        if (canvasor::FileImageP image = ui::UI_NodeManager::Get()->GetImage("closebox")) {
            c.DrawImage(image->GetImage(), box);
        }
    }
    if (RectF lock = item.LockRect(); lock.width > 0) {
        ColorRGBA ink = ui::GetColor(ui::color::TabText);
        c.StrokeRect(RectF(lock.left + 2, lock.top + 5, 7, 6), canvasor::Pen{1, ink});
        if (item.locked) {
            c.FillRect(RectF(lock.left + 2, lock.top + 5, 7, 6), ink);
        }
        c.StrokeRect(RectF(lock.left + 3.5f, lock.top + 1, 4, 5), canvasor::Pen{1, ink});
    }
    if (RectF multi = item.MultiTabRect(); multi.width > 0) {
        ColorRGBA ink = ui::GetColor(ui::color::TabText);
        c.StrokeRect(RectF(multi.left, multi.top + 3, 8, 8), canvasor::Pen{1, ink});
        c.StrokeRect(RectF(multi.left + 3, multi.top, 8, 8), canvasor::Pen{1, ink});
    }
    c.Restore();
}

void UI_TabWell::UI_Draw(Canvasor& c) {
    RectF bounds = UI_GetLocalBounds();
    c.FillRect(bounds, ui::GetColor(ui::color::TabWellBackground));
    float room = margin_ + std::max(0.0f, ItemsRoom());
    c.Save();
    c.ClipRect(vertical_ ? RectF(0, 0, bounds.width, room) : RectF(0, 0, room, bounds.height));
    for (long i = 0; i < GetTabCount(); ++i) {
        DrawItem(c, i);
    }
    c.Restore();
    if (IsOverflowing()) {
        // The scroll bar under the items: a track and a thumb in proportion to what is shown.
        float total = ItemsLength();
        float shown = std::max(0.0f, ItemsRoom());
        RectF track = vertical_ ? RectF(float(WellHeight), margin_, float(ScrollbarHeight), shown)
                                : RectF(margin_, float(WellHeight), shown, float(ScrollbarHeight));
        c.FillRect(track, ui::GetColor(ui::color::TabWellBackground));
        float thumbStart = shown * scroll_ / total, thumbLength = shown * shown / total;
        RectF thumb = vertical_ ? RectF(track.left, track.top + thumbStart, track.width, thumbLength)
                                : RectF(track.left + thumbStart, track.top, thumbLength, track.height);
        c.FillRect(thumb, ui::GetColor(ui::color::ControlBackground));
    }
    // The items are drawn here, clipped to the room the flyout leaves; the flyout paints itself.
}

// --- Tabless dragger ---

void UI_TablessDragger::UI_Draw(Canvasor& c) {
    RectF r = UI_GetLocalBounds();
    c.FillRect(r, ui::GetColor(ui::color::PanelBackground));
    if (gripperShown_) {
        c.FillRect(r, canvasor::LinearGradient{PointF(0, 0), PointF(0, r.height),
                                               ui::GetColor(ui::color::GripperTop),
                                               ui::GetColor(ui::color::GripperBottom)});
        if (canvasor::FileImageP grip = ui::UI_NodeManager::Get()->GetImage("gripper")) {
            c.DrawImage(grip->GetImage(),
                        RectF((r.width - grip->Width()) / 2, (r.height - grip->Height()) / 2,
                              float(grip->Width()), float(grip->Height())));
        }
    }
}

bool UI_TablessDragger::UI_DoMouseEvent(ui::UI_Node*, ui::MouseEvent& event) {
    if (!event.IsAction(ui::action::Press) || !callback_) {
        return false;
    }
    RectT rect = UI_GetGlobalRect();
    boost::intrusive_ptr<ui::UI_Node> keep(IsReferenced() ? this : nullptr);
    callback_(0, 0, &rect);
    return true;
}

} // namespace orvui::controls
