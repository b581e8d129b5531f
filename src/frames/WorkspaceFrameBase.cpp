// The common part of frames: zones, conversions between the frame's, window's and screen
// coordinates, the size rules and the border.
#include "frames/WorkspaceFrameBase.h"

#include "host/ui/Theme.h"
#include "host/ui/canvasor/Canvasor.h"
#include "workspace/TopLevelWindow.h"
#include "workspace/Workspace.h"

namespace orvworkspace::workspace {

using namespace orvui::ui;

WorkspaceFrameBase::WorkspaceFrameBase(TopLevelWindow* window)
    : workspace_(window->GetWorkspace())
    , window_(window)
    , frame_(window->GetLayoutManager(), this) {
    UI_SetNodeID("WorkspaceFrameBase");
    ConstructOSWindow(window->GetPlatformWindow(), RectT());
}

WorkspaceFrameBase::~WorkspaceFrameBase() = default;

void WorkspaceFrameBase::SetTopLevelWindow(TopLevelWindow* window) {
    if (!window || window == window_) {
        return;
    }
    window_ = window;
    workspace_ = window->GetWorkspace();
    frame_.SetLayoutManager(window->GetLayoutManager());
}

void WorkspaceFrameBase::SetZoneRects(FrameZones const& zones) {
    zones_ = zones;
    RectT whole = zones[FrameZones::Whole];
    for (int k = 0; k < 6; ++k) {
        zones_[k] = zones[k].Offset(-whole.left, -whole.top);
    }
}

void WorkspaceFrameBase::SetSizeAndPos(FrameZones const& zones) {
    RectT whole = zones[FrameZones::Whole];
    RectF target(float(whole.left), float(whole.top), float(whole.width), float(whole.height));
    if (UI_GetRect() != target) {
        UI_SetRect(target);
    }
    FrameZones previous = zones_;
    SetZoneRects(zones);
    // A layout pass places every frame; only those whose zones moved have borders to redraw (a moved
    // or resized frame has already marked its old and new areas).
    if (zones_ != previous) {
        UI_Invalidate();
    }
}

PointT WorkspaceFrameBase::GetMinimumSize() const {
    return PointT(std::int32_t(zones_.EdgeSize(FrameZones::Left) + zones_.EdgeSize(FrameZones::Right)),
                  std::int32_t(zones_.EdgeSize(FrameZones::Top) + zones_.EdgeSize(FrameZones::Bottom)));
}

RectT WorkspaceFrameBase::GetTabPanelRect() const {
    return FrameRectToTabPanelRect(GetFrameRect());
}

void WorkspaceFrameBase::ConvertTabToFrameSize(PointT& size) const {
    size.x += std::int32_t(zones_.EdgeSize(FrameZones::Left) + zones_.EdgeSize(FrameZones::Right));
    size.y += std::int32_t(zones_.EdgeSize(FrameZones::Top) + zones_.EdgeSize(FrameZones::Bottom));
}

void WorkspaceFrameBase::ConvertFrameToTabSize(PointT& size) const {
    size.x -= std::int32_t(zones_.EdgeSize(FrameZones::Left) + zones_.EdgeSize(FrameZones::Right));
    size.y -= std::int32_t(zones_.EdgeSize(FrameZones::Top) + zones_.EdgeSize(FrameZones::Bottom));
}

RectT WorkspaceFrameBase::LocalToWindow(RectT const& r) const {
    RectF origin = UI_GetRect();
    return r.Offset(std::int32_t(origin.left), std::int32_t(origin.top));
}

RectT WorkspaceFrameBase::WindowToLocal(RectT const& r) const {
    RectF origin = UI_GetRect();
    return r.Offset(-std::int32_t(origin.left), -std::int32_t(origin.top));
}

RectT WorkspaceFrameBase::GetFrameLocalRect() const {
    return LocalToWindow(zones_[FrameZones::Whole]);
}

RectT WorkspaceFrameBase::GetTabPanelFrameGlobalRect() const {
    return UI_LocalToGlobal(GetTabPanelRect());
}

RectT WorkspaceFrameBase::GetTabWellGlobalRect() const {
    return UI_LocalToGlobal(FrameRectToTabWellRect(GetFrameRect()));
}

void WorkspaceFrameBase::DrawBorders(canvasor::Canvasor* c) {
    int edgeColor = UI_HasKeyboardFocus(true) ? color::FocusedFrameBorder : color::FrameBorder;
    for (int k = 0; k < 4; ++k) {
        RectT z = zones_[k];
        c->FillRect(RectF(float(z.left), float(z.top), float(z.width), float(z.height)), GetColor(edgeColor));
    }
}

void WorkspaceFrameBase::UI_Draw(canvasor::Canvasor& c) {
    c.FillRect(UI_GetLocalBounds(), GetColor(color::WindowBackground));
    DrawBorders(&c);
}

void WorkspaceFrameBase::UI_FocusChanged(int reason) {
    // Focus shows only in the border's colour, so only the four edge strips are painted again.
    for (int k = 0; k < 4; ++k) {
        RectT z = zones_[k];
        RectF edge(float(z.left), float(z.top), float(z.width), float(z.height));
        UI_Invalidate(&edge);
    }
    OS_WorkspaceFrame::UI_FocusChanged(reason);
}

} // namespace orvworkspace::workspace
