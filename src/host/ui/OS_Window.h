// A node that owns a native window of the desktop: top-level windows, popups, and the child windows
// of frames and panels. The native window's property "orvui::ui::OS_Window::property" leads back to
// this object, which receives the window's messages in UI_HandleOSEvent. A top-level window's node
// rectangle is its client area at (0, 0); a child window's native rectangle follows its node.
#pragma once

#include <vector>

#include "host/ui/UI_Container.h"

namespace orvui::ui {

struct NativeWindowRecord;

class OS_Window : public UI_Container {
public:
    static constexpr char PropertyName[] = "orvui::ui::OS_Window::property";

    OS_Window() = default;
    ~OS_Window() override;

    // Creates this node's native window. For the child style, owner is the parent window. Returns
    // the handle.
    NativeWindow UI_CreateWindow(std::u16string const& title, NativeWindow owner, RectT const& rect,
                                 std::uint32_t style, std::uint32_t exStyle, bool hasMenu = false);
    // Process start-up of the toolkit; nothing to do on this platform.
    static void UI_Initialize(void*) {}
    // Binds this node to an existing native window (the host's main window, say).
    void UI_AttachWindow(NativeWindow window);
    // Unbinds the native window, which lives on without this object; returns it.
    NativeWindow UI_DetachOSWindow();
    NativeWindow GetPlatformWindow() const { return window_; }
    // A host's hook that sees every message sent to the native window before the window handles it.
    using EventFunction = void (*)(OS_Event*);
    void UI_SetEventFunction(EventFunction function) { eventFunction_ = function; }
    EventFunction UI_GetEventFunction() const { return eventFunction_; }
    // The toolkit object of a native window, or null.
    static OS_Window* FromNative(NativeWindow window);
    // The toolkit objects of every top-level window, topmost first (windows without one are left out).
    static std::vector<OS_Window*> UI_EnumerateAllWindows();

    // Handles a message to the native window: mouse messages go to the nodes under the pointer, the
    // caption activation message sets the caption's look; the rest is ignored. Overrides call this
    // for the default handling.
    virtual void UI_HandleOSEvent(OS_Event& event);

    bool IsTopLevel() const;
    // Whether the whole of this (top-level) window is already marked for painting, so that marking
    // a part adds nothing; asked without a look-up.
    bool IsMarkedWhole() const;
    RectT UI_GetGlobalStructureRect() const;
    void UI_SetGlobalStructureRect(RectT const& rect);
    RectT UI_GetGlobalClientRect() const;
    // Moves a top-level window's structure rectangle to a global top-left corner.
    void UI_Move(PointT topLeft);
    void UI_Activate();
    bool UI_IsActive() const;
    bool UI_IsMinimized() const;
    void UI_Minimize(bool minimize);
    // Asks the parent container to remove this window.
    bool UI_Close();
    // Paints the window's image now when it is marked.
    void UpdateWindowNow();

    void UI_Show(bool show) override;
    void UI_SetRect(RectF const& rect) override;
    OS_Window* UI_GetOSWindow() override { return this; }

    // The desktop moved or resized the native window: the node follows.
    void NativeRectChanged();
    // The native window is gone (destroyed, or its desktop reset): the node forgets it.
    void NativeDestroyed() {
        window_ = 0;
        record_ = nullptr;
    }
    // A child window's node moved: its native window follows it under the new parent window.
    void UI_ParentChanged() override;

private:
    EventFunction eventFunction_ = nullptr;
    NativeWindow window_ = 0;
    // The desktop's record of window_, kept while window_ lives (the desktop says when it goes), so
    // that the questions every walk up the node tree asks need no look-up.
    NativeWindowRecord const* record_ = nullptr;
};

// A window with the toolkit's own drawing, for content such as pop-up menus.
class UI_Window : public OS_Window {};

// A chrome-less popup window owned by another window.
class OS_PopupWindow : public OS_Window {
public:
    NativeWindow CreatePopup(NativeWindow owner, RectT const& rect, std::uint32_t exStyle = 0) {
        return UI_CreateWindow(u"", owner, rect, 0x80000000u, exStyle);
    }
};

} // namespace orvui::ui
