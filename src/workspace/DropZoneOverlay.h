// The translucent windows a tab drag shows over the window under the pointer: over one window edge
// (an edge overlay, a single zone) or over one frame (that frame's drop zones). They answer which
// zone lies under the pointer and paint the zones with the active one filled. The window that shows
// an overlay owns it (TopLevelWindow::CreateDropZoneOverlay); the dragger only refers to it.
//
// Painting: the overlay is filled white; every zone but tab-row zones is outlined with a 1-pixel
// dark grey pen, and the active zone is filled dark blue (tab row: blue; an edge overlay's single
// zone: green-blue, drawn as the whole overlay rectangle). The dragger shows the overlay at opacity
// 0.15, so all of this reads as a light tint over the window.
#pragma once

#include "layout/DropZone.h"
#include "platform/OS_OverlayWindow.h"

#include <vector>

namespace orvworkspace::workspace {

class OS_TopLevelWindow;
class TabDragger;
class TopLevelWindow;
class Workspace;
class WorkspaceFrame;

// What both generic overlays share: showing, opacity and repainting only mean something when a
// native window backs the overlay.
class BackedOverlay : public OS_OverlayWindow {
public:
    BackedOverlay(OS_TopLevelWindow* owner, OS_TopLevelWindow* window, orvui::ui::OS_Window* view,
                  RectT const& rect, bool plainView);
    void UI_Show(bool show) override;
    void UI_SetOpacity(float opacity);
    void UI_Invalidate();
    void BringToTop() override {}
};

// A generic overlay window.
class OverlayWindow : public BackedOverlay {
public:
    OverlayWindow(OS_TopLevelWindow* owner, OS_TopLevelWindow* window, orvui::ui::OS_Window* view,
                  RectT const& rect, bool plainView);
};

// The same as a view drawn with the canvas.
class OverlayView : public BackedOverlay {
public:
    OverlayView(OS_TopLevelWindow* owner, OS_TopLevelWindow* window, orvui::ui::OS_Window* view,
                RectT const& rect, bool plainView);
    bool UI_SupportsCanvasor() const override { return true; }
};

class DropZoneOverlayWindow : public OverlayWindow {
public:
    DropZoneOverlayWindow(TopLevelWindow* window, orvui::ui::OS_Window* view, TabDragger* dragger,
                          PointT const& point, RectT const& rect, bool plainView);

    // The first zone (in order) whose polygon holds the point becomes the active one; None when
    // there is none.
    DropZone::DropType DropZoneFromPoint(PointT const& point);
    DropZone::DropType GetActiveDropZone() const { return activeDropZone_; }
    std::size_t GetZoneCount() const { return zones_.size(); }
    std::vector<DropZone> const& GetZones() const { return zones_; }
    // The zone of the active type, or null.
    DropZone const* GetActiveZone() const;
    // A point inside the zone of a type (the mean of its corners), for a pointer to aim at; false
    // when the overlay offers no zone of that type.
    bool PointInZone(DropZone::DropType type, PointT& point) const;
    void GetGlobalRect(RectT* out) const { *out = globalRect_; }
    TopLevelWindow* GetWindow() const { return window_; }
    TabDragger* GetDragger() const { return dragger_; }

    void UI_Draw(canvasor::Canvasor& c) override;
    bool UI_SupportsCanvasor() const override { return true; }
    canvasor::SupplierInterface* UI_GetDrawSupplier() const override;

    // Even-odd containment with the point on an edge counting as inside (to a relative 1e-12).
    static bool PolygonContains(std::vector<PointT> polygon, PointT const& point);

protected:
    RectT globalRect_;
    Workspace* workspace_;
    std::vector<DropZone> zones_;
    std::vector<PointT> outline_;
    DropZone::DropType activeDropZone_ = DropZone::None;
    TopLevelWindow* window_;
    TabDragger* dragger_;
};

// One window edge; the hit test uses the edge's trapezoid, the painting the whole rectangle.
class EdgeDropZoneOverlayWindow : public DropZoneOverlayWindow {
public:
    EdgeDropZoneOverlayWindow(TopLevelWindow* window, TabDragger* dragger, PointT const& point,
                              RectT const& rect, std::vector<PointT>& polygon, DropZone::DropType type,
                              bool plainView);
};

// One frame's zones, its sides shortened where the window's edge zones lie (the exclusions: top,
// left, bottom, right).
class FrameDropZoneOverlayWindow : public DropZoneOverlayWindow {
public:
    FrameDropZoneOverlayWindow(TabDragger* dragger, PointT const& point, RectT const& rect,
                               std::vector<long> const& exclusions, WorkspaceFrame* frame, bool plainView);
    WorkspaceFrame* GetRootFrame() const { return frame_; }

private:
    WorkspaceFrame* frame_;
};

} // namespace orvworkspace::workspace
