// The drop-down list: its items open as a menu under it.
#include "host/ui/controls/Popup.h"

#include "host/core/TextConversion.h"
#include "host/ui/Menu.h"
#include "host/ui/NodeManager.h"
#include "host/ui/OS_Window.h"
#include "host/ui/Theme.h"
#include "host/ui/canvasor/Canvasor.h"

namespace orvui::controls {

void UI_Popup::SetItems(std::vector<PopupItem> items) {
    items_ = std::move(items);
    if (value_ >= GetItemCount()) {
        value_ = -1;
    }
    UI_Invalidate();
}

void UI_Popup::UncheckAllItems() {
    for (PopupItem& item : items_) {
        item.checked = false;
    }
}

void UI_Popup::CheckItem(long index, bool checked) {
    if (index >= 0 && index < GetItemCount()) {
        items_[std::size_t(index)].checked = checked;
    }
}

void UI_Popup::EnableAllItems() {
    for (PopupItem& item : items_) {
        item.enabled = true;
    }
}

void UI_Popup::DisableItem(long index, bool disable) {
    if (index >= 0 && index < GetItemCount()) {
        items_[std::size_t(index)].enabled = !disable;
    }
}

long UI_Popup::FindStringExact(std::u16string const& text) const {
    for (long i = 0; i < GetItemCount(); ++i) {
        if (items_[std::size_t(i)].text == text) {
            return i;
        }
    }
    return -1;
}

void UI_Popup::SetValue(long index) {
    value_ = index >= 0 && index < GetItemCount() ? index : -1;
    unknown_ = false;
    UI_Invalidate();
}

std::u16string UI_Popup::GetValueString() const {
    return value_ >= 0 && value_ < GetItemCount() ? items_[std::size_t(value_)].Full() : std::u16string();
}

long UI_Popup::OpenMenu() {
    // Commands are item positions plus one, so 0 stays "nothing chosen".
    utility::OS_Menu numbered;
    for (std::size_t i = 0; i < items_.size(); ++i) {
        PopupItem const& item = items_[i];
        if (item.text.empty()) {
            numbered.AppendSeparator();
        } else {
            numbered.AppendItem(item.text, i + 1, item.enabled, checkStyle_ && item.checked);
        }
    }
    ui::OS_Window* window = UI_GetContainingWindow();
    unsigned long chosen =
        utility::UI_DoPopupMenu(numbered, UI_GetGlobalRect(), window ? window->GetPlatformWindow() : 0);
    if (chosen == 0) {
        return -1;
    }
    long index = long(chosen) - 1;
    SetValue(index);
    SendChanged(index);
    return index;
}

bool UI_Popup::UI_DoMouseEvent(ui::UI_Node*, ui::MouseEvent& event) {
    if (!IsEnabled()) {
        return false;
    }
    TakeFocusOnPress(event);
    if (event.IsAction(ui::action::Press)) {
        boost::intrusive_ptr<ui::UI_Node> keep(IsReferenced() ? this : nullptr);
        OpenMenu();
        return true;
    }
    return false;
}

bool UI_Popup::UI_DoKeyboardEvent(ui::KeyboardEvent& event) {
    if (event.IsKeyDown() && (event.GetKeyCode() == ' ' || event.GetKeyCode() == ui::key::Enter)) {
        OpenMenu();
        return true;
    }
    return false;
}

void UI_Popup::UI_Draw(canvasor::Canvasor& c) {
    RectF r = UI_GetLocalBounds();
    c.FillRect(r, ui::GetColor(ui::color::ControlBackground));
    c.StrokeRect(r, canvasor::Pen{1, ui::GetColor(UI_HasKeyboardFocus(false) ? ui::color::ControlHighlight
                                                                             : ui::color::WindowBorder)});
    std::u16string shown = unknown_ || value_ < 0 ? std::u16string() : items_[std::size_t(value_)].text;
    canvasor::ColorRGBA ink = ui::GetColor(ui::color::ControlText);
    if (!IsEnabled()) {
        ink.a = 0.4f;
    }
    c.DrawText(orvcore::utility::UTF16to8(shown), PointF(6, (r.height - 13) / 2), canvasor::Font(), ink);
    if (canvasor::FileImageP arrow = ui::UI_NodeManager::Get()->GetImage("DownArrow")) {
        c.DrawImage(arrow->GetImage(), RectF(r.width - 16, (r.height - float(arrow->Height())) / 2,
                                             float(arrow->Width()), float(arrow->Height())));
    }
}

} // namespace orvui::controls
