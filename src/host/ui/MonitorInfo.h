// The monitors of the desktop as the workspace reads them: rectangles by index (0 is the primary),
// the monitor under a point, keeping a window rectangle on screen, and a record for saved documents.
#pragma once

#include "host/ui/UITypes.h"

#include <vector>

namespace orvcore::proplist {
class PropList;
}

namespace orvui::utility {

using orvui::ui::PointT;
using orvui::ui::RectT;

class MonitorInfo {
public:
    MonitorInfo();
    virtual ~MonitorInfo() = default;

    // Reads the desktop's monitors again.
    void Refresh();
    std::size_t GetMonitorCount() const { return monitors_.size(); }
    // False (out untouched) for an index with no monitor.
    bool GetMonitorRect(std::size_t index, RectT& out) const;
    // The monitor holding the point, else the one nearest to it.
    bool GetMonitorRectFromPoint(PointT const& point, RectT& out) const;
    // The monitor that shares the most area with rect (the nearest to its middle when none does).
    bool GetMonitorRectFromRect(RectT const& rect, RectT& out) const;
    // Moves rect onto the monitor nearest to it when its top strip (where a title bar is) is on no
    // monitor; a rectangle larger than that monitor keeps its size and goes to its top-left corner.
    // Returns whether it moved.
    bool EnsureRectIsVisible(RectT& rect) const;
    // Writes "Count" and one "Monitor-i" list of left, top, width and height per monitor.
    void SaveToPropList(orvcore::proplist::PropList& list) const;

private:
    std::vector<RectT> monitors_;
};

// The platform's monitor table; the flag is accepted for the platform layer's calls and unused.
class OS_MonitorInfo : public MonitorInfo {
public:
    explicit OS_MonitorInfo(bool) {}
};

} // namespace orvui::utility
