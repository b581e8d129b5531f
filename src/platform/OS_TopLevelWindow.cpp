// Placement, redraw suspension and the shared window messages.
#include "platform/OS_TopLevelWindow.h"

#include "host/core/DebugDatabase.h"
#include "host/core/PropList.h"
#include "host/ui/MonitorInfo.h"
#include "platform/OS_Tracker.h"
#include "platform/OS_Workspace.h"

#include <algorithm>

namespace orvworkspace::workspace {

using namespace orvui::ui;

namespace {
// How deep caption activation is being forwarded: only the outermost call forwards.
int captionActivationDepth = 0;
// Set while a button release ends a drag, so the capture loss it causes does not cancel it.
bool releasingTracker = false;
} // namespace

OS_TopLevelWindow::OS_TopLevelWindow(OS_Workspace* workspace, bool)
    : workspace_(workspace) {
    UI_SetNodeID("OS_TopLevelWindow");
}

void OS_TopLevelWindow::ConstructOSWindow(NativeWindow owner, RectT const& rect) {
    UI_CreateWindow(u"", owner, rect, FloatingStyle, FloatingExStyle);
}

void OS_TopLevelWindow::ConstructOSWindow() {
    if (workspace_ && workspace_->GetAppWindow()) {
        UI_AttachWindow(workspace_->GetAppWindow());
    }
}

void OS_TopLevelWindow::SuspendRedraws(bool suspend) {
    redrawSuspension_ += suspend ? 1 : -1;
}

void OS_TopLevelWindow::UpdateNow() {
    if (redrawSuspension_ <= 0) {
        UI_UpdateNow(1);
    }
}

void OS_TopLevelWindow::SaveWindowStateData(orvcore::proplist::PropList& list) const {
    WindowPlacement placement;
    if (GetPlatformWindow()) {
        placement = Desktop::Get().GetPlacement(GetPlatformWindow());
    } else {
        placement.showCmd = 0;
    }
    WinRect normal = ORVtoWIN(placement.normal);
    list.SetValue("ShowCmd", std::uint32_t(placement.showCmd));
    list.SetValue("MinPos", std::vector<std::int32_t>{placement.minPosition.x, placement.minPosition.y});
    list.SetValue("MaxPos", std::vector<std::int32_t>{placement.maxPosition.x, placement.maxPosition.y});
    list.SetValue("NormalPos",
                  std::vector<std::int32_t>{normal.left, normal.top, normal.right, normal.bottom});
}

bool OS_TopLevelWindow::RestoreWindowStateData(orvcore::proplist::PropList const& list) {
    if (!GetPlatformWindow() || (Desktop::Get().GetExStyle(GetPlatformWindow()) & style::ToolWindow)) {
        return false;
    }
    WindowPlacement placement;
    std::uint32_t showCmd = 1;
    list.GetValue("ShowCmd", showCmd);
    placement.showCmd = showCmd;
    placement.flags = showCmd == 3 ? 2 : 0;
    std::vector<std::int32_t> minPos, maxPos, normal;
    if (!list.GetValue("MinPos", minPos) || !list.GetValue("MaxPos", maxPos) ||
        !list.GetValue("NormalPos", normal) || minPos.size() != 2 || maxPos.size() != 2 ||
        normal.size() != 4) {
        return false;
    }
    placement.minPosition = PointT(minPos[0], minPos[1]);
    placement.maxPosition = PointT(maxPos[0], maxPos[1]);
    placement.normal = WINtoORV(WinRect{normal[0], normal[1], normal[2], normal[3]});
    ApplyWindowStateData(placement);
    return true;
}

void OS_TopLevelWindow::ApplyWindowStateData(WindowPlacement placement) {
    Desktop& desktop = Desktop::Get();
    NativeWindow w = GetPlatformWindow();
    if (!w) {
        return;
    }
    if (delayVisibility_) {
        if (placement.showCmd == 3) {
            showMaximizedLater_ = true;
        }
        placement.showCmd = 0; // stays hidden until it is shown later
        desktop.SetPlacement(w, placement);
        return;
    }
    if (placement.showCmd == 2 || placement.showCmd == 6) {
        placement.showCmd = 1;
    }
    if (placement.showCmd == 3) {
        // Normal first, then maximised, so it maximises on the monitor of its restored rectangle.
        WindowPlacement normal = placement;
        normal.showCmd = 1;
        desktop.SetPlacement(w, normal);
    }
    desktop.SetPlacement(w, placement);
}

void OS_TopLevelWindow::ApplyDefaultWindowState() {
    NativeWindow w = GetPlatformWindow();
    if (!w) {
        return;
    }
    WindowPlacement placement = Desktop::Get().GetPlacement(w);
    placement.showCmd = 3;
    placement.flags = 2;
    RectT monitor;
    orvui::utility::OS_MonitorInfo(false).GetMonitorRect(0, monitor);
    placement.normal = WINtoORV(
        ORVtoWIN(RectT(monitor.left + 10, monitor.top + 10, monitor.width - 20, monitor.height - 20)));
    Desktop::Get().SetPlacement(w, placement);
}

bool OS_TopLevelWindow::HandleCaptionActivation(OS_Event& event) {
    Desktop& desktop = Desktop::Get();
    std::vector<NativeWindow> ours;
    for (NativeWindow w : desktop.EnumerateWindows()) {
        if (desktop.GetWindowThreadId(w) == Desktop::CurrentThreadId()) {
            ours.push_back(w);
        }
    }
    NativeWindow other = static_cast<NativeWindow>(event.lParam);
    bool active = event.wParam != 0 || (other && std::find(ours.begin(), ours.end(), other) != ours.end());
    if (captionActivationDepth++ == 0) {
        for (NativeWindow w : ours) {
            if (w != GetPlatformWindow() && desktop.IsWindow(w)) {
                desktop.SendMessage(w, message::CaptionActivate, active ? 1 : 0, 0);
            }
        }
    }
    --captionActivationDepth;
    event.wParam = active ? 1 : 0;
    OS_Window::UI_HandleOSEvent(event);
    return true;
}

void OS_TopLevelWindow::HandleEnable(OS_Event const& event) {
    if (orvcore::debug::DebugDatabase::Instance().GetEntry("orvworkspace", "ORV_syncWindowEnablement") !=
        "true") {
        return;
    }
    NativeWindow self = GetPlatformWindow();
    if (!workspace_ || self != workspace_->GetAppWindow()) {
        return;
    }
    Desktop& desktop = Desktop::Get();
    for (NativeWindow w : desktop.EnumerateWindows()) {
        if (desktop.IsWindow(w) && desktop.GetOwner(w) == self && !(desktop.GetStyle(w) & style::Child) &&
            (desktop.GetExStyle(w) & style::ToolWindow)) {
            desktop.EnableWindow(w, event.wParam != 0);
        }
    }
}

void OS_TopLevelWindow::UI_HandleOSEvent(OS_Event& event) {
    boost::intrusive_ptr<UI_Node> keep(IsReferenced() ? this : nullptr);
    bool sync = OS_Workspace::IsSyncWindowActivationEnabled();
    OS_Tracker* tracker = workspace_ ? workspace_->GetTracker() : nullptr;
    switch (event.message) {
    case message::CaptionActivate:
        if (sync && HandleCaptionActivation(event)) {
            return;
        }
        break;
    case message::ActivateApp:
        if (sync && workspace_ && workspace_->GetAppWindow()) {
            Desktop::Get().SendMessage(workspace_->GetAppWindow(), message::CaptionActivate, event.wParam, 0);
        }
        break;
    case message::Enable:
        HandleEnable(event);
        break;
    case message::MouseMove:
        if (tracker) {
            PointT global = Desktop::Get().ClientToGlobal(
                GetPlatformWindow(), PointT(PointParamX(event.lParam), PointParamY(event.lParam)));
            tracker->Track(global, nullptr);
            if (workspace_->GetTracker() == tracker && tracker->HasBeenCancelled()) {
                workspace_->ReleaseTracker(false);
            }
            return;
        }
        break;
    case message::LeftButtonUp:
        if (tracker) {
            releasingTracker = true;
            workspace_->ReleaseTracker(false);
            releasingTracker = false;
            return;
        }
        break;
    case message::CaptureLost:
        if (tracker && !releasingTracker) {
            workspace_->ReleaseTracker(true);
            return;
        }
        break;
    default:
        break;
    }
    OS_Window::UI_HandleOSEvent(event);
}

} // namespace orvworkspace::workspace
