// The platform half of the drop-zone overlays shown over a window while a tab is dragged: a
// borderless popup owned by that window, layered and transparent to the mouse so the pointer keeps
// reaching the windows beneath. Built as a plain view, it has no native window of its own.
#pragma once

#include "host/ui/OS_Window.h"

namespace orvworkspace::workspace {

class OS_OverlayWindow : public orvui::ui::OS_Window {
public:
    static constexpr std::uint32_t OverlayStyle = 0x80000000;
    static constexpr std::uint32_t OverlayExStyle = 0x80020;

    // Raises CannotCreateEmptyOverlayWindow for an empty rectangle and CannotCreateOverlayWindow when
    // the native window cannot be made (an owner that names no window).
    OS_OverlayWindow(orvui::ui::NativeWindow owner, orvui::ui::NativeWindow second,
                     orvui::ui::OS_Window* toolkitWindow, orvui::ui::RectT const& rect, bool plainView);

    virtual void BringToTop() {}
    virtual void DetachFromParent() {}
    bool OSWindowBacked() const { return osWindowBacked_; }

private:
    bool osWindowBacked_;
};

} // namespace orvworkspace::workspace
