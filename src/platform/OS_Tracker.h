// The platform half of a mouse tracker (a splitter or tab drag): the tracked window holds the mouse
// capture between Begin and End, and cancelling beeps. The workspace's trackers derive from it.
#pragma once

#include "host/core/Flags.h"
#include "host/ui/Events.h"

namespace orvworkspace::workspace {

class OS_Tracker {
public:
    OS_Tracker() = default;
    OS_Tracker(OS_Tracker const&) = delete;
    OS_Tracker& operator=(OS_Tracker const&) = delete;
    virtual ~OS_Tracker() = default;
    virtual bool WantsKeyEvents() const = 0;
    virtual bool WantsIdleEvents() const = 0;
    // Starts tracking: the tracked window takes the mouse capture; endAtOnce comes back false.
    virtual void Begin(orvui::ui::PointT const& global, bool* endAtOnce);
    // One step of tracking at a global point; keyEvent is the key that asked for it, if any.
    virtual void Track(orvui::ui::PointT const& global, orvui::ui::KeyboardEvent const* keyEvent) = 0;
    // Ends tracking: the capture is released when the tracked window still holds it.
    virtual void End();
    virtual void DoIdleEvent(orvui::ui::OS_Event const&) {}
    virtual void DoKeyEvent(orvui::ui::KeyboardEvent const&) {}
    // Abandons the drag with the warning beep.
    virtual void Cancel();
    virtual bool HasBeenCancelled() const = 0;
    // Whether one of its steps is running now (a release from inside it must not destroy it).
    virtual bool IsBusy() const { return false; }

    void SetTrackedWindow(orvui::ui::NativeWindow window) { trackedWindow_ = window; }
    orvui::ui::NativeWindow GetTrackedWindow() const { return trackedWindow_; }

private:
    orvui::ui::NativeWindow trackedWindow_ = 0;
};

} // namespace orvworkspace::workspace
