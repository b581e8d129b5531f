// The workspace's trackers: the shared base and the splitter drag.
#include "workspace/Tracker.h"

#include "host/ui/Desktop.h"
#include "workspace/TopLevelWindow.h"
#include "workspace/Workspace.h"

namespace orvworkspace::workspace {

using orvui::ui::KeyboardEvent;
using orvui::ui::PointT;

// --- Tracker ---

Tracker::Tracker(Workspace* workspace, orvcore::utility::Flags<unsigned char> flags)
    : workspace_(workspace) {
    flags_.Set(WantsKeys, flags.IsSet(WantsKeys));
    flags_.Set(WantsIdle, flags.IsSet(WantsIdle));
    if (workspace_ && workspace_->GetMainTopLevelWindow()) {
        SetTrackedWindow(workspace_->GetMainTopLevelWindow()->GetPlatformWindow());
    }
}

void Tracker::Begin(PointT const& global, bool* endAtOnce) {
    flags_.Set(TrackingBit);
    OS_Tracker::Begin(global, endAtOnce);
}

void Tracker::End() {
    // Only a tracker that began holds the capture; one that never began leaves it alone.
    if (IsTracking()) {
        flags_.Clear(TrackingBit);
        OS_Tracker::End();
    }
}

void Tracker::Cancel() {
    flags_.Set(CancelledBit);
    OS_Tracker::Cancel();
}

// --- NotifySplitterDragBeginAndEnd ---

NotifySplitterDragBeginAndEnd::NotifySplitterDragBeginAndEnd(Workspace* workspace, TopLevelWindow* window)
    : workspace_(workspace)
    , window_(window)
    , resizing_(std::make_unique<orvui::ui::UI_NodeManager::NotifyUserResizing>(window)) {
    workspace_->NotifySplitterDragBegin(window_);
}

NotifySplitterDragBeginAndEnd::~NotifySplitterDragBeginAndEnd() {
    workspace_->NotifySplitterDragEnd(window_);
    resizing_.reset();
}

// --- SplitterDragger ---

SplitterDragger::SplitterDragger(Workspace* workspace, TopLevelWindow* window, PointT const& point)
    : Tracker(workspace, orvcore::utility::Flags<unsigned char>(1u << WantsKeys))
    , window_(window) {
    window_->GetLayoutManager()->AcquireTracker(point.x, point.y, layoutTracker_);
}

SplitterDragger::~SplitterDragger() {
    End();
}

PointT SplitterDragger::ToWindow(PointT const& global) const {
    return window_->UI_GlobalToLocal(global);
}

void SplitterDragger::Begin(PointT const& global, bool* endAtOnce) {
    window_->GetLayoutManager()->SetUserAdjustingSplitter(true);
    adjusting_ = true;
    if (endAtOnce) {
        *endAtOnce = false;
    }
    if (!layoutTracker_) {
        return;
    }
    layoutTracker_->TrackBegin(ToWindow(global));
    notifier_ = std::make_unique<NotifySplitterDragBeginAndEnd>(workspace_, window_);
    Tracker::Begin(global, endAtOnce);
}

void SplitterDragger::Track(PointT const& global, KeyboardEvent const*) {
    if (layoutTracker_ && !ended_) {
        layoutTracker_->TrackMove(ToWindow(global));
    }
}

void SplitterDragger::DoKeyEvent(KeyboardEvent const& event) {
    if (event.IsKeyDown() && event.GetKeyCode() == orvui::ui::key::Escape) {
        Cancel();
    }
}

void SplitterDragger::End() {
    if (ended_) {
        return;
    }
    ended_ = true;
    Tracker::End();
    if (layoutTracker_) {
        layoutTracker_->TrackEnd();
    }
    if (adjusting_) {
        window_->GetLayoutManager()->SetUserAdjustingSplitter(false);
        adjusting_ = false;
    }
    notifier_.reset();
}

} // namespace orvworkspace::workspace
