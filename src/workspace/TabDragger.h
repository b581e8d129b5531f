// Dragging a tab, or a whole frame with all its tabs, between frames and windows. Past a 5-pixel
// threshold the dragger follows the pointer: it finds the window and frame beneath it, has that
// window show a drop-zone overlay, reorders tabs live within their own tab row, tears the content
// off into a floating interim window when nothing is beneath it, and docks it by the zone under the
// pointer (a frame's edge, body or tab row, or a window's edge). Holding Control (modifier flag 4)
// makes no window a target. Releasing docks for good and makes an interim window permanent; Escape
// or a lost capture cancels with a beep and docks nothing more.
#pragma once

#include "layout/DropZone.h"
#include "platform/OS_TabDragger.h"
#include "workspace/TopLevelWindow.h"
#include "workspace/Tracker.h"

#include <boost/intrusive_ptr.hpp>
#include <vector>

namespace orvworkspace::workspace {

class TabPanel;
class TopLevelWindow;
class WorkspaceFrame;

class TabDragger : public OS_TabDragger, public Tracker {
public:
    TabDragger(Workspace* workspace, WorkspaceFrame* sourceFrame, bool wholeFrame, unsigned long tabIndex);
    ~TabDragger() override;

    void Begin(PointT const& global, bool* endAtOnce) override;
    void Track(PointT const& global, orvui::ui::KeyboardEvent const* keyEvent) override;
    void End() override;
    void DoKeyEvent(orvui::ui::KeyboardEvent const& event) override;
    bool IsBusy() const override { return applyingCount_ > 0 || trackingDepth_ > 0; }

    // Takes the source frame out of its window, keeping its place when it still remembers tabs.
    void DetachFrameWindow(TopLevelWindow* window, WorkspaceFrame* frame);
    // Removes an emptied window (remembered when it had placeholders to bring back).
    void DetachTopLevelWindow(TopLevelWindow* window);

    // A floating interim window made before the drag (a panel torn off a window edge) that already
    // carries the content and follows the pointer.
    void AdoptDragWindow(boost::intrusive_ptr<TopLevelWindow> window) { dragWindow_ = std::move(window); }

    // --- What tests and overlays look at ---
    WorkspaceFrame* GetSourceFrame() const { return sourceFrame_.get(); }
    bool IsWholeFrame() const { return wholeFrame_; }
    bool HasStarted() const { return dragStarted_; }
    TopLevelWindow* GetTargetWindow() const { return targetWindow_.get(); }
    WorkspaceFrame* GetTargetFrame() const { return targetFrame_.get(); }
    TopLevelWindow* GetDragWindow() const { return dragWindow_.get(); }
    DropZone::DropType GetCurrentDropType() const { return currentDropType_; }
    RectT GetDragRect() const { return dragRect_; }
    unsigned long GetTabIndex() const { return tabIndex_; }

private:
    // The step both Track and Apply start with: the window and frame beneath the pointer.
    void UpdateTarget(orvui::ui::KeyboardEvent const* keyEvent);
    // One docking step; final on release.
    void Apply(orvui::ui::KeyboardEvent const* keyEvent, bool final);
    bool ControlHeld(orvui::ui::KeyboardEvent const* keyEvent) const;
    // The dragged content is all that a floating window holds.
    bool ContentIsWholeFloatingWindow() const;
    // The source frame has one tab, or the whole frame is dragged.
    bool ContentIsWholeSourceFrame() const;
    // Takes the dragged content out of the source frame; the panels it took (none for a whole
    // frame), and an emptied source frame and window removed.
    std::vector<boost::intrusive_ptr<TabPanel>> TakeContent();
    void ReleaseDragWindow();
    void CloseOverlay();

    PointT startPoint_;
    PointT grabOffset_;
    PointT lastPoint_;
    RectT dragRect_;
    boost::intrusive_ptr<WorkspaceFrame> sourceFrame_;
    // Held, not just pointed at: a window or frame may go away while the pointer is over it.
    boost::intrusive_ptr<TopLevelWindow> targetWindow_;
    boost::intrusive_ptr<WorkspaceFrame> targetFrame_;
    int applyingCount_ = 0;
    DropZone::DropType currentDropType_ = DropZone::TabWell;
    boost::intrusive_ptr<WorkspaceFrame> appliedFrame_;
    DropZone::DropType appliedDropType_ = DropZone::TabWell;
    unsigned long tabIndex_;
    bool wholeFrame_;
    bool dragStarted_ = false;
    bool awayFromSourceWell_ = true;
    bool needTabRects_ = true;
    std::vector<RectT> sourceTabRects_;
    boost::intrusive_ptr<TopLevelWindow> dragWindow_;
    // A panel docked somewhere other than a tabbed frame (a window's tool bar): focused at the end.
    boost::intrusive_ptr<TabPanel> dockedElsewhere_;
    int trackingDepth_ = 0;
    bool ended_ = false;
};

} // namespace orvworkspace::workspace
