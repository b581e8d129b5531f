// Drop-zone overlays: choosing the zone under the pointer and painting the zones.
#include "workspace/DropZoneOverlay.h"

#include "frames/WorkspaceFrame.h"
#include "host/ui/canvasor/Canvasor.h"
#include "workspace/TopLevelWindow.h"
#include "workspace/Workspace.h"

#include <algorithm>
#include <cmath>

namespace orvworkspace::workspace {

using orvui::ui::PointF;
using orvui::ui::RectF;

namespace {

orvui::ui::NativeWindow PlatformWindowOf(OS_TopLevelWindow* window) {
    return window ? window->GetPlatformWindow() : 0;
}

OS_TopLevelWindow* MainWindowOf(TopLevelWindow* window) {
    Workspace* workspace = window ? window->GetWorkspace() : nullptr;
    return workspace ? workspace->GetMainTopLevelWindow() : nullptr;
}

} // namespace

// --- OverlayWindow and OverlayView ---

BackedOverlay::BackedOverlay(OS_TopLevelWindow* owner, OS_TopLevelWindow* window, orvui::ui::OS_Window* view,
                             RectT const& rect, bool plainView)
    : OS_OverlayWindow(PlatformWindowOf(owner), PlatformWindowOf(window), view, rect, plainView) {}

void BackedOverlay::UI_Show(bool show) {
    if (OSWindowBacked()) {
        OS_Window::UI_Show(show);
    }
}

void BackedOverlay::UI_SetOpacity(float opacity) {
    if (OSWindowBacked()) {
        OS_Window::UI_SetOpacity(opacity);
    }
}

void BackedOverlay::UI_Invalidate() {
    if (OSWindowBacked()) {
        OS_Window::UI_Invalidate();
    }
}

OverlayWindow::OverlayWindow(OS_TopLevelWindow* owner, OS_TopLevelWindow* window, orvui::ui::OS_Window* view,
                             RectT const& rect, bool plainView)
    : BackedOverlay(owner, window, view, rect, plainView) {
    UI_SetNodeID("OverlayWindow");
}

OverlayView::OverlayView(OS_TopLevelWindow* owner, OS_TopLevelWindow* window, orvui::ui::OS_Window* view,
                         RectT const& rect, bool plainView)
    : BackedOverlay(owner, window, view, rect, plainView) {
    UI_SetNodeID("OverlayView");
}

// --- DropZoneOverlayWindow ---

DropZoneOverlayWindow::DropZoneOverlayWindow(TopLevelWindow* window, orvui::ui::OS_Window* view,
                                             TabDragger* dragger, PointT const&, RectT const& rect,
                                             bool plainView)
    : OverlayWindow(MainWindowOf(window), window, view, rect, plainView)
    , globalRect_(rect)
    , workspace_(window ? window->GetWorkspace() : nullptr)
    , window_(window)
    , dragger_(dragger) {
    UI_SetNodeID("DropZoneOverlayWindow");
}

bool DropZoneOverlayWindow::PointInZone(DropZone::DropType type, PointT& point) const {
    for (DropZone const& zone : zones_) {
        auto area = zone.GetArea();
        if (zone.GetType() == type && !area.empty()) {
            long x = 0, y = 0;
            for (PointT const& p : area) {
                x += p.x;
                y += p.y;
            }
            point = PointT(std::int32_t(x / long(area.size())), std::int32_t(y / long(area.size())));
            return true;
        }
    }
    return false;
}

bool DropZoneOverlayWindow::PolygonContains(std::vector<PointT> polygon, PointT const& point) {
    polygon.erase(std::unique(polygon.begin(), polygon.end()), polygon.end());
    if (polygon.empty()) {
        return false;
    }
    if (polygon.size() == 1) {
        return polygon[0] == point;
    }
    double px = point.x;
    double py = point.y;
    bool inside = false;
    for (std::size_t i = 0; i < polygon.size(); ++i) {
        PointT const& a = polygon[i];
        PointT const& b = polygon[(i + 1) % polygon.size()];
        double ax = a.x, ay = a.y, bx = b.x, by = b.y;
        // The edge spans the point's x with one end strictly before it and the other at or after.
        if (!((ax < px && bx >= px) || (bx < px && ax >= px))) {
            continue;
        }
        double y = ay + (px - ax) * (by - ay) / (bx - ax);
        double scale = std::max(std::fabs(y), std::fabs(py));
        if (std::fabs(y - py) <= 1e-12 * scale) {
            return true; // on the edge
        }
        if (y > py) {
            inside = !inside;
        }
    }
    return inside;
}

DropZone::DropType DropZoneOverlayWindow::DropZoneFromPoint(PointT const& point) {
    activeDropZone_ = DropZone::None;
    for (DropZone const& zone : zones_) {
        if (PolygonContains(zone.GetArea(), point)) {
            activeDropZone_ = zone.GetType();
            break;
        }
    }
    return activeDropZone_;
}

DropZone const* DropZoneOverlayWindow::GetActiveZone() const {
    for (DropZone const& zone : zones_) {
        if (zone.GetType() == activeDropZone_) {
            return &zone;
        }
    }
    return nullptr;
}

canvasor::SupplierInterface* DropZoneOverlayWindow::UI_GetDrawSupplier() const {
    return workspace_ ? workspace_->GetDrawSupplier() : OverlayWindow::UI_GetDrawSupplier();
}

void DropZoneOverlayWindow::UI_Draw(canvasor::Canvasor& c) {
    RectF local = UI_GetLocalBounds();
    if (local.width <= 0 || local.height <= 0) {
        return;
    }
    c.FillRect(local, canvasor::ColorRGBA{1, 1, 1, 1});
    canvasor::Pen pen{1.0f, canvasor::ColorRGBA{0.1f, 0.1f, 0.1f, 1}};
    canvasor::ColorRGBA fill{0, 0, 0.6f, 1};
    if (activeDropZone_ == DropZone::TabWell) {
        fill = canvasor::ColorRGBA{0, 0, 1.0f, 1};
    }
    if (zones_.size() == 1) {
        fill = canvasor::ColorRGBA{0, 0.7f, 0.5f, 1};
    }
    // The path of a zone in overlay coordinates; a single zone is drawn as the whole rectangle.
    auto trace = [&](DropZone const& zone) {
        std::vector<PointT> const points = zones_.size() == 1 ? outline_ : zone.GetArea();
        c.NewPath();
        for (std::size_t i = 0; i < points.size(); ++i) {
            PointF p = UI_GlobalToLocalF(PointF(float(points[i].x), float(points[i].y)));
            if (i == 0) {
                c.MoveTo(p);
            } else {
                c.LineTo(p);
            }
        }
    };
    DropZone const* active = nullptr;
    for (DropZone const& zone : zones_) {
        if (zone.GetType() < DropZone::Top || zone.GetType() > DropZone::TabWell) {
            continue;
        }
        if (activeDropZone_ != DropZone::None && zone.GetType() == activeDropZone_ && !active) {
            active = &zone;
        }
        // Outlines come with an active zone only: without one the overlay is a plain tint.
        if (activeDropZone_ != DropZone::None && zone.GetType() != DropZone::TabWell) {
            trace(zone);
            c.Stroke(pen);
        }
    }
    if (active) {
        trace(*active);
        c.Fill(fill);
        trace(*active);
        c.Stroke(pen);
    }
}

// --- The two kinds ---

EdgeDropZoneOverlayWindow::EdgeDropZoneOverlayWindow(TopLevelWindow* window, TabDragger* dragger,
                                                     PointT const& point, RectT const& rect,
                                                     std::vector<PointT>& polygon, DropZone::DropType type,
                                                     bool plainView)
    : DropZoneOverlayWindow(window, nullptr, dragger, point, rect, plainView) {
    UI_SetNodeID("EdgeDropZoneOverlayWindow");
    globalRect_ = RectT(rect.left + 1, rect.top + 1, rect.width - 2, rect.height - 2);
    zones_.emplace_back(window->GetLayoutManager(), polygon, type, nullptr);
    outline_ = {PointT(rect.left, rect.top), PointT(rect.left + rect.width, rect.top),
                PointT(rect.left + rect.width, rect.top + rect.height),
                PointT(rect.left, rect.top + rect.height)};
    activeDropZone_ = type;
}

namespace {

// The frame's rectangle less the window's edge zones along it (exclusions: top, left, bottom, right),
// so that the overlay neither covers nor hides the edge zones.
RectT LessExclusions(RectT const& rect, std::vector<long> const& exclusions) {
    auto at = [&](std::size_t k) { return std::int32_t(k < exclusions.size() ? exclusions[k] : 0); };
    return RectT(rect.left + at(1), rect.top + at(0), rect.width - at(1) - at(3),
                 rect.height - at(0) - at(2));
}

} // namespace

FrameDropZoneOverlayWindow::FrameDropZoneOverlayWindow(TabDragger* dragger, PointT const& point,
                                                       RectT const& rect, std::vector<long> const& exclusions,
                                                       WorkspaceFrame* frame, bool plainView)
    : DropZoneOverlayWindow(frame->GetTopLevelWindow(), nullptr, dragger, point,
                            LessExclusions(rect, exclusions), plainView)
    , frame_(frame) {
    UI_SetNodeID("FrameDropZoneOverlayWindow");
    zones_ =
        frame->GetTopLevelWindow()->GetLayoutManager()->GetDropZones(frame->GetLMFrame(), rect, exclusions);
    DropZoneFromPoint(point);
}

} // namespace orvworkspace::workspace
