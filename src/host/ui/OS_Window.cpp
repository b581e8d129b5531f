// Nodes with native windows.
#include "host/ui/OS_Window.h"

#include "host/ui/Desktop.h"
#include "host/ui/NodeManager.h"

namespace orvui::ui {

OS_Window::~OS_Window() {
    if (window_) {
        Desktop::Get().DestroyNativeWindow(window_);
    }
}

NativeWindow OS_Window::UI_CreateWindow(std::u16string const& title, NativeWindow owner, RectT const& rect,
                                        std::uint32_t style, std::uint32_t exStyle, bool hasMenu) {
    Desktop& desktop = Desktop::Get();
    if (window_) {
        desktop.DestroyNativeWindow(window_);
    }
    window_ = desktop.CreateNativeWindow(title, style, exStyle, owner, rect, this, hasMenu);
    record_ = desktop.Record(window_);
    UI_Node::UI_Show((style & style::Visible) != 0);
    if (IsTopLevel()) {
        NativeRectChanged();
    } else {
        UI_Node::UI_SetRect(RectF(float(rect.left), float(rect.top), float(rect.width), float(rect.height)));
    }
    return window_;
}

void OS_Window::UI_AttachWindow(NativeWindow window) {
    Desktop& desktop = Desktop::Get();
    if (!desktop.IsWindow(window) || window == window_) {
        return;
    }
    if (window_) {
        UI_DetachOSWindow();
    }
    window_ = window;
    record_ = desktop.Record(window);
    desktop.SetObject(window, this);
    UI_Node::UI_Show(desktop.IsVisible(window));
    NativeRectChanged();
}

NativeWindow OS_Window::UI_DetachOSWindow() {
    NativeWindow window = window_;
    if (window) {
        Desktop::Get().SetObject(window, nullptr);
    }
    window_ = 0;
    record_ = nullptr;
    return window;
}

OS_Window* OS_Window::FromNative(NativeWindow window) {
    return Desktop::Get().GetObject(window);
}

std::vector<OS_Window*> OS_Window::UI_EnumerateAllWindows() {
    std::vector<OS_Window*> windows;
    for (NativeWindow w : Desktop::Get().EnumerateWindows()) {
        if (OS_Window* object = FromNative(w)) {
            windows.push_back(object);
        }
    }
    return windows;
}

void OS_Window::UI_HandleOSEvent(OS_Event& event) {
    switch (event.message) {
    case message::MouseMove:
    case message::LeftButtonDown:
    case message::LeftButtonUp:
    case message::LeftButtonDoubleClick:
    case message::RightButtonDown:
    case message::RightButtonUp:
    case message::MouseWheel:
        UI_NodeManager::Get()->DispatchMouse(*this, event);
        break;
    case message::CaptionActivate:
        Desktop::Get().SetCaptionActive(window_, event.wParam != 0);
        event.result = 1;
        break;
    default:
        break;
    }
}

bool OS_Window::IsMarkedWhole() const {
    return record_ && record_->dirty;
}

bool OS_Window::IsTopLevel() const {
    return record_ && !(record_->style & style::Child);
}

void OS_Window::UI_ParentChanged() {
    Desktop& desktop = Desktop::Get();
    if (!window_ || !(desktop.GetStyle(window_) & style::Child)) {
        return;
    }
    for (UI_Node* n = UI_GetParentNode(); n; n = n->UI_GetParentNode()) {
        if (OS_Window* w = n->UI_GetOSWindow(); w && w->GetPlatformWindow()) {
            desktop.SetParent(window_, w->GetPlatformWindow());
            return;
        }
    }
    desktop.SetParent(window_, 0); // out of any window for now
}

RectT OS_Window::UI_GetGlobalStructureRect() const {
    return window_ ? Desktop::Get().GetWindowRect(window_) : UI_GetGlobalRect();
}

void OS_Window::UI_SetGlobalStructureRect(RectT const& rect) {
    if (IsTopLevel()) {
        Desktop::Get().SetWindowRect(window_, rect);
        return;
    }
    // A child window: its node moves within its parent.
    PointF origin = UI_GetParentNode()
                        ? UI_GetParentNode()->UI_GlobalToLocalF(PointF(float(rect.left), float(rect.top)))
                        : PointF(float(rect.left), float(rect.top));
    UI_Node::UI_SetRect(RectF(origin.x, origin.y, float(rect.width), float(rect.height)));
}

RectT OS_Window::UI_GetGlobalClientRect() const {
    return IsTopLevel() ? Desktop::Get().GetClientRect(window_) : UI_GetGlobalRect();
}

void OS_Window::UI_Move(PointT topLeft) {
    RectT r = UI_GetGlobalStructureRect();
    UI_SetGlobalStructureRect(RectT(topLeft.x, topLeft.y, r.width, r.height));
}

void OS_Window::UI_Activate() {
    if (window_) {
        Desktop::Get().Activate(window_);
    }
}

bool OS_Window::UI_IsActive() const {
    return window_ && Desktop::Get().GetActiveWindow() == window_;
}

bool OS_Window::UI_IsMinimized() const {
    return window_ && Desktop::Get().IsIconic(window_);
}

void OS_Window::UI_Minimize(bool minimize) {
    if (!window_) {
        return;
    }
    Desktop& desktop = Desktop::Get();
    WindowPlacement placement = desktop.GetPlacement(window_);
    if (minimize) {
        placement.showCmd = 2;
    } else {
        placement.showCmd = (placement.flags & 2) ? 3 : 1;
    }
    desktop.SetPlacement(window_, placement);
}

bool OS_Window::UI_Close() {
    if (auto* container = dynamic_cast<UI_Container*>(UI_GetParentNode())) {
        return container->ChildRequestRemove(this);
    }
    return false;
}

void OS_Window::UpdateWindowNow() {
    if (window_) {
        Desktop::Get().PaintDirty(window_);
    }
}

void OS_Window::UI_Show(bool show) {
    UI_Node::UI_Show(show);
    if (window_) {
        Desktop::Get().ShowWindow(window_, show);
    }
}

void OS_Window::UI_SetRect(RectF const& rect) {
    if (!IsTopLevel()) {
        UI_Node::UI_SetRect(rect);
        return;
    }
    // The node of a top-level window is its client area: resize the window around it.
    RectT structure = UI_GetGlobalStructureRect();
    RectT client = UI_GetGlobalClientRect();
    std::int32_t chromeW = structure.width - client.width, chromeH = structure.height - client.height;
    Desktop::Get().SetWindowRect(window_,
                                 RectT(structure.left, structure.top, std::int32_t(rect.width) + chromeW,
                                       std::int32_t(rect.height) + chromeH));
}

void OS_Window::NativeRectChanged() {
    if (!IsTopLevel()) {
        return;
    }
    RectT client = Desktop::Get().GetClientRect(window_);
    UI_Node::UI_SetRect(RectF(0, 0, float(client.width), float(client.height)));
}

} // namespace orvui::ui
