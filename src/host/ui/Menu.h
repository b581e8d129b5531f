// Native-style menus: an OS_Menu of items (text, command, enabled, checked) and separators, chosen
// from a real popup window run modally (UI_DoPopupMenu under a rectangle, UI_DoContextMenu at a
// point). The mouse highlights and picks an item; Up and Down move through the enabled items, Enter
// picks and Escape or a press outside gives 0. Disabled items and separators cannot be chosen.
#pragma once

#include "host/ui/Modal.h"

#include <string>
#include <vector>

namespace orvui::utility {

using ui::PointT;
using ui::RectT;

class OS_Menu {
public:
    struct Item {
        std::u16string text;
        unsigned long command = 0;
        bool enabled = true;
        bool checked = false;
        bool separator = false;
    };

    void AppendItem(std::u16string const& text, unsigned long command, bool enabled = true,
                    bool checked = false);
    void AppendSeparator();
    // Inserts at a position (clamped); 0 is the top.
    void InsertItem(std::size_t position, std::u16string const& text, unsigned long command);
    void InsertSeparator(std::size_t position);
    bool RemoveItem(std::size_t position);
    void Clear() { items_.clear(); }
    std::size_t GetItemCount() const { return items_.size(); }
    Item const& GetItem(std::size_t position) const { return items_.at(position); }
    // By command; false when no item has it.
    bool CheckItem(unsigned long command, bool checked);
    bool EnableItem(unsigned long command, bool enabled);
    bool IsChecked(unsigned long command) const;
    std::vector<Item> const& Items() const { return items_; }

private:
    std::vector<Item> items_;
};

// Shows the menu under a global rectangle and returns the command chosen, 0 for none.
unsigned long UI_DoPopupMenu(OS_Menu const& menu, RectT const& anchor, ui::NativeWindow owner = 0);
// Shows the menu at a global point and returns the command chosen, 0 for none.
unsigned long UI_DoContextMenu(OS_Menu const& menu, PointT const& point, ui::NativeWindow owner = 0);

// The popup window of an open menu, for drivers and tests that operate it.
class MenuWindow : public ui::UI_ModalWindow {
public:
    static constexpr int RowHeight = 20;
    static constexpr int SeparatorHeight = 7;

    MenuWindow(OS_Menu const& menu, PointT const& topLeft, ui::NativeWindow owner);
    ~MenuWindow() override;
    // The global rectangle of an item's row.
    RectT GetItemGlobalRect(std::size_t position) const;
    long GetHighlighted() const { return highlighted_; }
    OS_Menu const& GetMenu() const { return menu_; }

    void UI_HandleOSEvent(ui::OS_Event& event) override;
    bool UI_DoKeyboardEvent(ui::KeyboardEvent& event) override;
    bool UI_WantsKeyboardFocus() const override { return true; }
    void UI_Draw(canvasor::Canvasor& c) override;

private:
    long ItemAt(int y) const;
    void Choose(long position);
    void MoveHighlight(int step);

    OS_Menu menu_;
    std::vector<int> tops_;
    long highlighted_ = -1;
};

} // namespace orvui::utility
