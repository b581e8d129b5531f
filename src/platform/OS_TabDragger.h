// The platform half of a tab drag: native windows that must disappear while the drag runs (an
// emptied frame, an emptied floating window) are hidden, unbound from their objects and parked here,
// and destroyed only when the drag ends, the last parked first, so that nothing the drag still
// refers to goes away under it.
#pragma once

#include "host/ui/UITypes.h"

#include <vector>

namespace orvui::ui {
class OS_Window;
}

namespace orvworkspace::workspace {

class OS_TopLevelWindow;

class OS_TabDragger {
public:
    OS_TabDragger() = default;
    OS_TabDragger(OS_TabDragger const&) = delete;
    OS_TabDragger& operator=(OS_TabDragger const&) = delete;
    virtual ~OS_TabDragger();

    // Hides a frame (or other node) of a window and parks its native window.
    void DetachFrameWindow(OS_TopLevelWindow* window, orvui::ui::OS_Window* node);
    void DetachTopLevelWindow(OS_TopLevelWindow* window);
    void KeepNativeWindow(orvui::ui::NativeWindow handle);
    // A platform hook when the drop target changes (0 a zone, 1 docked, 2 torn off); nothing here.
    virtual void DropTargetChanged(int) {}
    std::vector<orvui::ui::NativeWindow> const& KeptWindows() const { return kept_; }

private:
    void Park(orvui::ui::OS_Window* node);

    std::vector<orvui::ui::NativeWindow> kept_;
};

} // namespace orvworkspace::workspace
