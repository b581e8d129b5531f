// A drop-down list: items with the text shown and the full text each stands for, check marks in a
// check style, enabling, and a value (the chosen item, -1 for none, or unknown). A click opens the
// items as a menu under the control; choosing one sets the value and sends the changed notification.
// Items with empty text are shown as separators.
#pragma once

#include "host/ui/controls/ControlView.h"

#include <string>
#include <vector>

namespace orvui::controls {

struct PopupItem {
    std::u16string text;
    // What the item stands for; empty means the text itself.
    std::u16string fullText;
    bool enabled = true;
    bool checked = false;

    PopupItem() = default;
    PopupItem(std::u16string shown, std::u16string full = {})
        : text(std::move(shown))
        , fullText(std::move(full)) {}
    std::u16string const& Full() const { return fullText.empty() ? text : fullText; }
};

class UI_Popup : public UI_InteractiveControlView {
public:
    explicit UI_Popup(int popupType = 0, bool flag = false)
        : popupType_(popupType)
        , flag_(flag) {}

    void SetItems(std::vector<PopupItem> items);
    std::vector<PopupItem> const& GetItems() const { return items_; }
    long GetItemCount() const { return long(items_.size()); }
    void SetItemCheckStyle(bool checkStyle) { checkStyle_ = checkStyle; }
    bool GetItemCheckStyle() const { return checkStyle_; }
    void UncheckAllItems();
    void CheckItem(long index, bool checked);
    void EnableAllItems();
    void DisableItem(long index, bool disable);
    // The index of the item whose shown text is exactly this, or -1.
    long FindStringExact(std::u16string const& text) const;
    // Chooses an item (-1 for none) without notifying; clears the unknown state.
    void SetValue(long index);
    long GetValue() const { return value_; }
    // Shows no choice until a value is set.
    void SetValueUnknown() { unknown_ = true; }
    bool IsValueUnknown() const { return unknown_; }
    // The full text of the chosen item; empty when there is none.
    std::u16string GetValueString() const;
    // Opens the items as a menu under the control, as a click does; returns the chosen index or -1.
    long OpenMenu();

    bool UI_DoMouseEvent(ui::UI_Node* target, ui::MouseEvent& event) override;
    bool UI_DoKeyboardEvent(ui::KeyboardEvent& event) override;
    void UI_Draw(canvasor::Canvasor& c) override;

private:
    int popupType_;
    bool flag_;
    std::vector<PopupItem> items_;
    bool checkStyle_ = false;
    long value_ = -1;
    bool unknown_ = false;
};

} // namespace orvui::controls
