// Monitors.
#include "host/ui/MonitorInfo.h"

#include "host/core/PropList.h"
#include "host/ui/Desktop.h"

#include <algorithm>
#include <climits>

namespace orvui::utility {

MonitorInfo::MonitorInfo() {
    Refresh();
}

void MonitorInfo::Refresh() {
    monitors_ = ui::Desktop::Get().GetMonitors();
}

bool MonitorInfo::GetMonitorRect(std::size_t index, RectT& out) const {
    if (index >= monitors_.size()) {
        return false;
    }
    out = monitors_[index];
    return true;
}

namespace {
long long DistanceSquared(RectT const& r, PointT const& p) {
    long long dx = p.x < r.left ? r.left - p.x : (p.x >= r.Right() ? p.x - r.Right() + 1 : 0);
    long long dy = p.y < r.top ? r.top - p.y : (p.y >= r.Bottom() ? p.y - r.Bottom() + 1 : 0);
    return dx * dx + dy * dy;
}
} // namespace

bool MonitorInfo::GetMonitorRectFromPoint(PointT const& point, RectT& out) const {
    if (monitors_.empty()) {
        return false;
    }
    auto nearest = std::min_element(monitors_.begin(), monitors_.end(), [&](RectT const& a, RectT const& b) {
        return DistanceSquared(a, point) < DistanceSquared(b, point);
    });
    out = *nearest;
    return true;
}

bool MonitorInfo::GetMonitorRectFromRect(RectT const& rect, RectT& out) const {
    long long best = 0;
    for (RectT const& m : monitors_) {
        RectT common = m.Intersection(rect);
        long long area = (long long)common.width * common.height;
        if (area > best) {
            best = area;
            out = m;
        }
    }
    return best > 0 ||
           GetMonitorRectFromPoint(PointT(rect.left + rect.width / 2, rect.top + rect.height / 2), out);
}

bool MonitorInfo::EnsureRectIsVisible(RectT& rect) const {
    RectT titleStrip(rect.left, rect.top, rect.width,
                     std::min<std::int32_t>(rect.height, ui::TitleBarHeight));
    for (RectT const& m : monitors_) {
        if (m.Intersects(titleStrip)) {
            return false;
        }
    }
    RectT monitor;
    if (!GetMonitorRectFromPoint(PointT(rect.left + rect.width / 2, rect.top + rect.height / 2), monitor)) {
        return false;
    }
    std::int32_t left =
        std::clamp(rect.left, monitor.left, std::max(monitor.left, monitor.Right() - rect.width));
    std::int32_t top =
        std::clamp(rect.top, monitor.top, std::max(monitor.top, monitor.Bottom() - rect.height));
    rect = RectT(left, top, rect.width, rect.height);
    return true;
}

void MonitorInfo::SaveToPropList(orvcore::proplist::PropList& list) const {
    list.SetValue("Count", static_cast<std::int32_t>(monitors_.size()));
    for (std::size_t i = 0; i < monitors_.size(); ++i) {
        RectT const& m = monitors_[i];
        list.SetValue("Monitor-" + std::to_string(i),
                      std::vector<std::int32_t>{m.left, m.top, m.width, m.height});
    }
}

} // namespace orvui::utility
