// Menus and their popup window.
#include "host/ui/Menu.h"

#include "host/core/TextConversion.h"
#include "host/ui/Desktop.h"
#include "host/ui/MonitorInfo.h"
#include "host/ui/Theme.h"
#include "host/ui/canvasor/Canvasor.h"

#include <algorithm>

namespace orvui::utility {

using namespace orvui::ui;

void OS_Menu::AppendItem(std::u16string const& text, unsigned long command, bool enabled, bool checked) {
    items_.push_back(Item{text, command, enabled, checked, false});
}

void OS_Menu::AppendSeparator() {
    items_.push_back(Item{u"", 0, false, false, true});
}

void OS_Menu::InsertItem(std::size_t position, std::u16string const& text, unsigned long command) {
    items_.insert(items_.begin() + long(std::min(position, items_.size())),
                  Item{text, command, true, false, false});
}

void OS_Menu::InsertSeparator(std::size_t position) {
    items_.insert(items_.begin() + long(std::min(position, items_.size())), Item{u"", 0, false, false, true});
}

bool OS_Menu::RemoveItem(std::size_t position) {
    if (position >= items_.size()) {
        return false;
    }
    items_.erase(items_.begin() + long(position));
    return true;
}

bool OS_Menu::CheckItem(unsigned long command, bool checked) {
    bool found = false;
    for (Item& item : items_) {
        if (!item.separator && item.command == command) {
            item.checked = checked;
            found = true;
        }
    }
    return found;
}

bool OS_Menu::EnableItem(unsigned long command, bool enabled) {
    bool found = false;
    for (Item& item : items_) {
        if (!item.separator && item.command == command) {
            item.enabled = enabled;
            found = true;
        }
    }
    return found;
}

bool OS_Menu::IsChecked(unsigned long command) const {
    return std::any_of(items_.begin(), items_.end(),
                       [&](Item const& i) { return !i.separator && i.command == command && i.checked; });
}

// --- The popup window ---

MenuWindow::MenuWindow(OS_Menu const& menu, PointT const& topLeft, NativeWindow owner)
    : menu_(menu) {
    int width = 120, y = 2;
    for (OS_Menu::Item const& item : menu_.Items()) {
        tops_.push_back(y);
        y += item.separator ? SeparatorHeight : RowHeight;
        if (!item.separator) {
            float text =
                canvasor::Canvasor::Measure(orvcore::utility::UTF16to8(item.text), canvasor::Font()).width;
            width = std::max(width, int(text) + 40);
        }
    }
    RectT rect(topLeft.x, topLeft.y, width, y + 2);
    MonitorInfo monitors;
    monitors.EnsureRectIsVisible(rect);
    RectT monitor;
    if (monitors.GetMonitorRectFromPoint(topLeft, monitor)) {
        rect.left = std::clamp(rect.left, monitor.left, std::max(monitor.left, monitor.Right() - rect.width));
        rect.top = std::clamp(rect.top, monitor.top, std::max(monitor.top, monitor.Bottom() - rect.height));
    }
    UI_CreateWindow(u"", owner, rect, style::Popup, style::ToolWindow);
    UI_SetNodeID("Menu");
    SetCancelResult(0);
}

MenuWindow::~MenuWindow() = default;

RectT MenuWindow::GetItemGlobalRect(std::size_t position) const {
    if (position >= tops_.size()) {
        return RectT();
    }
    RectT client = UI_GetGlobalClientRect();
    int height = menu_.GetItem(position).separator ? SeparatorHeight : RowHeight;
    return RectT(client.left, client.top + tops_[position], client.width, height);
}

long MenuWindow::ItemAt(int y) const {
    for (std::size_t i = 0; i < tops_.size(); ++i) {
        int height = menu_.GetItem(i).separator ? SeparatorHeight : RowHeight;
        if (y >= tops_[i] && y < tops_[i] + height) {
            return long(i);
        }
    }
    return -1;
}

void MenuWindow::Choose(long position) {
    if (position < 0 || std::size_t(position) >= menu_.GetItemCount()) {
        return;
    }
    OS_Menu::Item const& item = menu_.GetItem(std::size_t(position));
    if (!item.separator && item.enabled) {
        EndModal(int(item.command));
    }
}

void MenuWindow::MoveHighlight(int step) {
    long count = long(menu_.GetItemCount());
    long at = highlighted_;
    for (long tried = 0; tried < count; ++tried) {
        at = at < 0 ? (step > 0 ? 0 : count - 1) : (at + step + count) % count;
        OS_Menu::Item const& item = menu_.GetItem(std::size_t(at));
        if (!item.separator && item.enabled) {
            highlighted_ = at;
            UI_Invalidate();
            return;
        }
    }
}

void MenuWindow::UI_HandleOSEvent(OS_Event& event) {
    unsigned msg = event.message;
    if (msg == message::CaptureLost) {
        CancelModal();
        return;
    }
    bool mouse = msg >= message::MouseMove && msg <= message::MouseWheel;
    if (!mouse) {
        OS_Window::UI_HandleOSEvent(event);
        return;
    }
    int x = PointParamX(event.lParam), y = PointParamY(event.lParam);
    RectF bounds = UI_GetLocalBounds();
    bool inside = x >= 0 && y >= 0 && x < bounds.width && y < bounds.height;
    long at = inside ? ItemAt(y) : -1;
    if (msg == message::MouseMove) {
        if (at != highlighted_) {
            highlighted_ = at;
            UI_Invalidate();
        }
    } else if (msg == message::LeftButtonDown || msg == message::RightButtonDown ||
               msg == message::LeftButtonDoubleClick) {
        if (!inside) {
            CancelModal(); // a press anywhere else closes the menu
        }
    } else if (msg == message::LeftButtonUp || msg == message::RightButtonUp) {
        if (inside) {
            Choose(at);
        }
    }
}

bool MenuWindow::UI_DoKeyboardEvent(KeyboardEvent& event) {
    if (!event.IsKeyDown()) {
        return true;
    }
    switch (event.GetKeyCode()) {
    case key::Escape:
        CancelModal();
        break;
    case key::Down:
        MoveHighlight(1);
        break;
    case key::Up:
        MoveHighlight(-1);
        break;
    case key::Enter:
        Choose(highlighted_);
        break;
    default:
        break;
    }
    return true;
}

void MenuWindow::UI_Draw(canvasor::Canvasor& c) {
    RectF bounds = UI_GetLocalBounds();
    c.FillRect(bounds, GetColor(color::ControlBackground));
    c.StrokeRect(bounds, canvasor::Pen{1, GetColor(color::WindowBorder)});
    for (std::size_t i = 0; i < tops_.size(); ++i) {
        OS_Menu::Item const& item = menu_.GetItem(i);
        float top = float(tops_[i]);
        if (item.separator) {
            c.FillRect(RectF(6, top + 3, bounds.width - 12, 1), GetColor(color::WindowBorder));
            continue;
        }
        if (long(i) == highlighted_ && item.enabled) {
            c.FillRect(RectF(2, top, bounds.width - 4, float(RowHeight)), GetColor(color::ControlHighlight));
        }
        canvasor::ColorRGBA ink = GetColor(color::ControlText);
        if (!item.enabled) {
            ink.a = 0.4f;
        }
        if (item.checked) {
            c.NewPath();
            c.MoveTo(PointF(7, top + 10));
            c.LineTo(PointF(10, top + 14));
            c.LineTo(PointF(16, top + 6));
            c.Stroke(canvasor::Pen{1.5f, ink});
        }
        c.DrawText(orvcore::utility::UTF16to8(item.text), PointF(24, top + 3), canvasor::Font(), ink);
    }
}

namespace {
unsigned long Run(OS_Menu const& menu, PointT topLeft, NativeWindow owner) {
    if (menu.GetItemCount() == 0) {
        return 0;
    }
    boost::intrusive_ptr<MenuWindow> window(new MenuWindow(menu, topLeft, owner));
    Desktop& desktop = Desktop::Get();
    desktop.SetCapture(window->GetPlatformWindow());
    int result = window->RunModal();
    if (desktop.GetCapture() == window->GetPlatformWindow()) {
        desktop.ReleaseCapture();
    }
    return static_cast<unsigned long>(result);
}
} // namespace

unsigned long UI_DoPopupMenu(OS_Menu const& menu, RectT const& anchor, NativeWindow owner) {
    return Run(menu, PointT(anchor.left, anchor.Bottom()), owner);
}

unsigned long UI_DoContextMenu(OS_Menu const& menu, PointT const& point, NativeWindow owner) {
    return Run(menu, point, owner);
}

} // namespace orvui::utility
