// Mouse capture around a drag.
#include "platform/OS_Tracker.h"

#include "host/ui/Desktop.h"

namespace orvworkspace::workspace {

void OS_Tracker::Begin(orvui::ui::PointT const&, bool* endAtOnce) {
    if (endAtOnce) {
        *endAtOnce = false;
    }
    if (trackedWindow_) {
        orvui::ui::Desktop::Get().SetCapture(trackedWindow_);
    }
}

void OS_Tracker::End() {
    orvui::ui::Desktop& desktop = orvui::ui::Desktop::Get();
    if (trackedWindow_ && desktop.GetCapture() == trackedWindow_) {
        desktop.ReleaseCapture();
    }
}

void OS_Tracker::Cancel() {
    orvui::ui::Desktop::Get().Beep(0x30);
}

} // namespace orvworkspace::workspace
