// The workspace's one mouse tracker while the user drags a splitter bar or a tab: the base keeps the
// flags every drag shares and freezes hover feedback for its lifetime; SplitterDragger hands the
// pointer to the layout's own splitter tracker. (TabDragger is in TabDragger.h.)
//
// A tracker ends when it is destroyed: Workspace::ReleaseTracker (after Cancel when asked to cancel)
// or a second acquisition destroys it, and the destructor performs End once.
#pragma once

#include "host/core/Flags.h"
#include "host/core/ScopedPtr.h"
#include "host/ui/NodeManager.h"
#include "layout/LayoutManager.h"
#include "platform/OS_Tracker.h"

#include <memory>

namespace orvworkspace::workspace {

class TopLevelWindow;
class Workspace;

class Tracker : public OS_Tracker {
public:
    // The flag bits.
    enum : unsigned { WantsKeys = 0, WantsIdle = 1, TrackingBit = 2, CancelledBit = 3 };

    // Only the wants-keys and wants-idle bits of flags are taken.
    Tracker(Workspace* workspace, orvcore::utility::Flags<unsigned char> flags);

    bool WantsKeyEvents() const override { return flags_.IsSet(WantsKeys); }
    bool WantsIdleEvents() const override { return flags_.IsSet(WantsIdle); }
    void Begin(orvui::ui::PointT const& global, bool* endAtOnce) override;
    void End() override;
    void Cancel() override;
    // Cancelled without the beep (the workspace is going away).
    void Abandon() { flags_.Set(CancelledBit); }
    bool HasBeenCancelled() const override { return flags_.IsSet(CancelledBit); }
    bool IsTracking() const { return flags_.IsSet(TrackingBit); }
    Workspace* GetWorkspace() const { return workspace_; }

protected:
    Workspace* workspace_;
    orvcore::utility::Flags<unsigned char> flags_;

private:
    orvui::ui::UI_NodeManager::SuspendMouseOverUpdates hoverFrozen_;
};

class SplitterDragger : public Tracker {
public:
    // point is in the window's local coordinates; without a splitter there, HasLayoutTracker() is
    // false and the drag does nothing.
    SplitterDragger(Workspace* workspace, TopLevelWindow* window, orvui::ui::PointT const& point);
    ~SplitterDragger() override;

    bool HasLayoutTracker() const { return layoutTracker_.get() != nullptr; }
    void Begin(orvui::ui::PointT const& global, bool* endAtOnce) override;
    void Track(orvui::ui::PointT const& global, orvui::ui::KeyboardEvent const* keyEvent) override;
    void End() override;
    void DoKeyEvent(orvui::ui::KeyboardEvent const& event) override;

private:
    orvui::ui::PointT ToWindow(orvui::ui::PointT const& global) const;

    TopLevelWindow* window_;
    std::unique_ptr<class NotifySplitterDragBeginAndEnd> notifier_;
    orvcore::utility::ScopedPtr<LayoutManager::Tracker> layoutTracker_;
    bool adjusting_ = false;
    bool ended_ = false;
};

// Tells the workspace that a splitter drag in a window begins (on construction) and ends (on
// destruction), and tells the toolkit that the user is resizing for as long.
class NotifySplitterDragBeginAndEnd {
public:
    NotifySplitterDragBeginAndEnd(Workspace* workspace, TopLevelWindow* window);
    ~NotifySplitterDragBeginAndEnd();
    NotifySplitterDragBeginAndEnd(NotifySplitterDragBeginAndEnd const&) = delete;
    NotifySplitterDragBeginAndEnd& operator=(NotifySplitterDragBeginAndEnd const&) = delete;

private:
    Workspace* workspace_;
    TopLevelWindow* window_;
    std::unique_ptr<orvui::ui::UI_NodeManager::NotifyUserResizing> resizing_;
};

} // namespace orvworkspace::workspace
