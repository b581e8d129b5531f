// The platform half of a mouse tracker (a splitter or tab drag): the tracked window holds the mouse
// capture between Begin and End, and cancelling beeps. The workspace's trackers derive from it.
#pragma once

#include "host/core/Flags.h"
#include "host/ui/Events.h"

namespace orvworkspace::workspace {

class OS_Tracker {
public:
    virtual ~OS_Tracker() = default;
    virtual bool WantsKeyEvents() const = 0;
    virtual bool WantsIdleEvents() const = 0;
    // Starts tracking: the window takes the mouse capture; cancelled is set to false.
    virtual void Begin(orvui::ui::PointT const& global, bool& cancelled);
    // One step of tracking at a global point.
    virtual void Track(orvui::ui::PointT const& global) = 0;
    // Ends tracking: the capture is released when the window still holds it.
    virtual void End(bool cancel);
    virtual void DoIdleEvent() {}
    // A key while tracking (Escape cancels in the workspace's trackers).
    virtual void DoKeyEvent(orvui::ui::KeyboardEvent&) {}
    // Abandons the drag with a beep.
    virtual void Cancel();
    virtual bool HasBeenCancelled() const = 0;

    void SetTrackedWindow(orvui::ui::NativeWindow window) { trackedWindow_ = window; }
    orvui::ui::NativeWindow GetTrackedWindow() const { return trackedWindow_; }

private:
    orvui::ui::NativeWindow trackedWindow_ = 0;
};

} // namespace orvworkspace::workspace
