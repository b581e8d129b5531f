// The tab drag: threshold, target search, overlays, live reorder, tear-off and docking.
#include "workspace/TabDragger.h"

#include "frames/WorkspaceBorderElement.h"
#include "frames/WorkspaceFrame.h"
#include "host/ui/Desktop.h"
#include "host/ui/NodeManager.h"
#include "workspace/TabPanel.h"
#include "workspace/TopLevelWindow.h"
#include "workspace/Workspace.h"

#include <algorithm>
#include <cmath>

namespace orvworkspace::workspace {

using orvui::ui::Desktop;
using orvui::ui::KeyboardEvent;
using orvui::ui::UI_NodeManager;

namespace {

// The modifier flag that makes no window a target (Control).
constexpr unsigned NoTargetModifier = 4;
// How far the pointer must move, strictly, before a press becomes a drag.
constexpr double DragThreshold = 5.0;

// A scoped increment of a re-entrancy counter.
class ScIncDec {
public:
    explicit ScIncDec(int& count)
        : count_(count) {
        ++count_;
    }
    ~ScIncDec() { --count_; }
    ScIncDec(ScIncDec const&) = delete;
    ScIncDec& operator=(ScIncDec const&) = delete;

private:
    int& count_;
};

} // namespace

TabDragger::TabDragger(Workspace* workspace, WorkspaceFrame* sourceFrame, bool wholeFrame,
                       unsigned long tabIndex)
    : Tracker(workspace, orvcore::utility::Flags<unsigned char>(1u << WantsKeys))
    , sourceFrame_(sourceFrame)
    , appliedFrame_(sourceFrame)
    , tabIndex_(tabIndex)
    , wholeFrame_(wholeFrame) {
    dragRect_ = sourceFrame->UI_LocalToGlobal(sourceFrame->GetTabPanelRect());
    TopLevelWindow* window = sourceFrame->GetTopLevelWindow();
    if (window && window->GetFrameCount() > 1) {
        PointT snap;
        sourceFrame->GetLMFrame()->GetNearestSnapSize(snap);
        PointT converted = snap;
        sourceFrame->ConvertFrameToTabSize(converted);
        if (snap.x != 0) {
            dragRect_.width = converted.x;
        }
        if (snap.y != 0) {
            dragRect_.height = converted.y;
        }
    }
}

TabDragger::~TabDragger() {
    End();
}

bool TabDragger::ControlHeld(KeyboardEvent const* keyEvent) const {
    unsigned modifiers = keyEvent ? keyEvent->GetModifiers() : Desktop::Get().GetModifiers();
    return (modifiers & NoTargetModifier) != 0;
}

bool TabDragger::ContentIsWholeSourceFrame() const {
    return wholeFrame_ || sourceFrame_->GetTabCount() == 1;
}

bool TabDragger::ContentIsWholeFloatingWindow() const {
    TopLevelWindow* window = sourceFrame_->GetTopLevelWindow();
    return ContentIsWholeSourceFrame() && window && window->GetFrameCount() == 1 && !window->IsMain() &&
           window->GetRootFrame() == sourceFrame_.get();
}

void TabDragger::Begin(PointT const& global, bool* endAtOnce) {
    startPoint_ = lastPoint_ = global;
    RectT tab;
    PointT local = sourceFrame_->UI_GlobalToLocal(global);
    if (sourceFrame_->GetTabRect(sourceFrame_->GetFrontTabIndex(), tab)) {
        grabOffset_ = PointT(local.x - tab.left, local.y - tab.top);
    }
    workspace_->NotifyTabDragBegin(sourceFrame_->GetFrontTabPanel());
    Tracker::Begin(global, endAtOnce);
}

void TabDragger::DoKeyEvent(KeyboardEvent const& event) {
    if (event.GetKeyCode() == orvui::ui::key::Escape) {
        if (event.IsKeyDown()) {
            Cancel();
        }
        return;
    }
    // A modifier pressed or let go changes what is a target at once.
    Track(lastPoint_, &event);
}

void TabDragger::UpdateTarget(KeyboardEvent const* keyEvent) {
    TopLevelWindow* window = nullptr;
    if (!ControlHeld(keyEvent)) {
        window = dynamic_cast<TopLevelWindow*>(workspace_->GetTopLevelWindowFromPos(lastPoint_));
        if (window && !window->AcceptsTabs()) {
            window = nullptr;
        }
    }
    if (targetWindow_ && window != targetWindow_.get()) {
        targetWindow_->DestroyDropZoneOverlay();
    }
    targetWindow_ = window;
    targetFrame_ = window ? window->GetFrameFromPos(lastPoint_) : nullptr;
    if (targetFrame_ != sourceFrame_) {
        needTabRects_ = true;
        if (!targetWindow_ || !targetWindow_->GetDropZoneOverlay()) {
            currentDropType_ = DropZone::None;
        }
    } else if (needTabRects_) {
        sourceTabRects_ = sourceFrame_->GetTabRects();
        needTabRects_ = sourceTabRects_.empty() || std::any_of(sourceTabRects_.begin(), sourceTabRects_.end(),
                                                               [](RectT const& r) { return r.IsEmpty(); });
    }
}

void TabDragger::CloseOverlay() {
    if (targetWindow_) {
        targetWindow_->DestroyDropZoneOverlay();
    }
}

void TabDragger::Track(PointT const& point, KeyboardEvent const* keyEvent) {
    if (applyingCount_ != 0 || ended_) {
        return;
    }
    ScIncDec tracking(trackingDepth_);
    lastPoint_ = point;
    UpdateTarget(keyEvent);
    RectT edgeRect;
    std::vector<PointT> edgePolygon;
    bool onEdge =
        targetWindow_ && targetWindow_->GetEdgeDropZone(point, edgeRect, edgePolygon) != DropZone::None;
    if (awayFromSourceWell_) {
        awayFromSourceWell_ = !onEdge && !sourceFrame_->GetTabWellGlobalRect().Contains(point);
    }
    if (!dragStarted_) {
        double dx = double(lastPoint_.x) - double(startPoint_.x);
        double dy = double(lastPoint_.y) - double(startPoint_.y);
        if (std::sqrt(dx * dx + dy * dy) <= DragThreshold) {
            return;
        }
        workspace_->SetToolkitCursor(wholeFrame_ ? orvui::ui::cursor::DragFrame : orvui::ui::cursor::DragTab);
        dragStarted_ = true;
        awayFromSourceWell_ = false;
        if (!onEdge) {
            Apply(keyEvent, false);
        }
    }
    if (ControlHeld(keyEvent) && !dragWindow_) {
        Apply(keyEvent, false);
        return;
    }
    // A floating window that holds only the content is replaced by an interim one that follows
    // the pointer; the interim window itself is only moved (it docks on release).
    if (ContentIsWholeFloatingWindow() && sourceFrame_->GetTopLevelWindow() != dragWindow_.get()) {
        Apply(keyEvent, false);
    }
    UpdateTarget(keyEvent);
    if (targetFrame_) {
        targetFrame_->UI_UpdateNow(~0u);
    }
    if (!targetFrame_ && !onEdge) {
        appliedDropType_ = DropZone::None;
        if (!targetWindow_ && !dragWindow_) {
            Apply(keyEvent, false); // nothing beneath: tear the content off
            return;
        }
    }
    // An overlay already shown follows the pointer, or goes when the pointer leaves it.
    if (DropZoneOverlayWindow* overlay = targetWindow_ ? targetWindow_->GetDropZoneOverlay() : nullptr) {
        RectT bounds;
        overlay->GetGlobalRect(&bounds);
        if (bounds.Contains(lastPoint_)) {
            DropZone::DropType type = overlay->GetZoneCount() > 1 ? overlay->DropZoneFromPoint(lastPoint_)
                                                                  : overlay->GetActiveDropZone();
            FrameDropZoneOverlayWindow* frameOverlay = targetWindow_->GetFrameDropZoneOverlay();
            if (type == DropZone::TabWell && frameOverlay &&
                frameOverlay->GetRootFrame() == sourceFrame_.get()) {
                CloseOverlay();
            } else if (type != currentDropType_) {
                currentDropType_ = type;
                overlay->UI_Invalidate();
                DropTargetChanged(0);
            }
        } else {
            CloseOverlay();
            if (!onEdge) {
                currentDropType_ = DropZone::None;
            }
        }
    }
    if (targetWindow_ && !targetWindow_->GetDropZoneOverlay()) {
        if (!onEdge && targetFrame_ && targetFrame_->GetTabWellGlobalRect().Contains(lastPoint_)) {
            currentDropType_ = DropZone::TabWell;
            if (targetFrame_ == sourceFrame_) {
                Apply(keyEvent, false); // reordered live under the pointer
            }
        } else if (targetWindow_->IsMain() && !targetWindow_->GetRootFrame()) {
            Apply(keyEvent, false); // an empty main window takes the content without an overlay
        }
    }
    // Offer an overlay; a window's only frame is not docked at that window's own edges.
    if (targetWindow_ && targetWindow_ == sourceFrame_->GetTopLevelWindow() &&
        targetWindow_->GetFrameCount() == 1 && ContentIsWholeSourceFrame()) {
        onEdge = false;
    }
    if (targetWindow_ && (targetFrame_ || onEdge)) {
        bool overSource = targetFrame_ == sourceFrame_;
        bool skip = (overSource && awayFromSourceWell_) ||
                    (overSource && !onEdge && sourceFrame_->GetTabWellGlobalRect().Contains(lastPoint_));
        if (!skip && !targetWindow_->GetDropZoneOverlay()) {
            WorkspaceFrame* frame = overSource && ContentIsWholeSourceFrame() ? nullptr : targetFrame_.get();
            if (DropZoneOverlayWindow* overlay =
                    targetWindow_->CreateDropZoneOverlay(this, lastPoint_, frame)) {
                if (onEdge) {
                    DropTargetChanged(0);
                }
                overlay->UI_SetOpacity(0.15f);
                overlay->UI_Show(true);
            }
        }
    }
    if (dragWindow_) {
        if (!dragWindow_->GetRootFrame()) {
            ReleaseDragWindow();
        } else {
            dragWindow_->SetDragPosition(lastPoint_, wholeFrame_);
        }
    }
}

void TabDragger::ReleaseDragWindow() {
    boost::intrusive_ptr<TopLevelWindow> window = std::move(dragWindow_);
    if (window && !window->GetRootFrame() && window->UI_GetParentNode()) {
        DetachTopLevelWindow(window.get());
    }
}

std::vector<boost::intrusive_ptr<TabPanel>> TabDragger::TakeContent() {
    std::vector<boost::intrusive_ptr<TabPanel>> panels;
    boost::intrusive_ptr<TopLevelWindow> sourceWindow(sourceFrame_->GetTopLevelWindow());
    if (!wholeFrame_) {
        if (boost::intrusive_ptr<TabPanel> panel =
                sourceFrame_->DetachTabPanel(sourceFrame_->GetFrontTabIndex())) {
            panels.push_back(panel);
        }
    }
    if (!wholeFrame_ && sourceFrame_->GetTabCount() > 0) {
        sourceFrame_->UI_Invalidate();
        return panels;
    }
    if (sourceWindow && sourceFrame_->UI_GetParentNode() == sourceWindow.get()) {
        if (wholeFrame_) {
            sourceWindow->RemoveFrame(sourceFrame_, false);
        } else {
            DetachFrameWindow(sourceWindow.get(), sourceFrame_.get());
        }
    }
    if (targetFrame_ == sourceFrame_) {
        targetFrame_ = nullptr;
    }
    if (sourceWindow && !sourceWindow->GetRootFrame() && !sourceWindow->IsMain() &&
        sourceWindow->UI_GetParentNode()) {
        if (targetWindow_ == sourceWindow) {
            sourceWindow->DestroyDropZoneOverlay();
        }
        DetachTopLevelWindow(sourceWindow.get());
    }
    return panels;
}

void TabDragger::Apply(KeyboardEvent const* keyEvent, bool final) {
    if (applyingCount_ != 0) {
        return;
    }
    ScIncDec applying(applyingCount_);
    bool control = ControlHeld(keyEvent);
    if (control && dragWindow_) {
        return;
    }
    UpdateTarget(keyEvent);
    bool detach = control || (!targetWindow_ && !dragWindow_) ||
                  (targetWindow_ && targetWindow_->IsMain() && !targetWindow_->GetRootFrame());
    if (!detach && !final && ContentIsWholeFloatingWindow() &&
        sourceFrame_->GetTopLevelWindow() != dragWindow_.get()) {
        // The floating window that holds only the content moves with the pointer instead.
        detach = true;
        CloseOverlay();
        targetWindow_ = nullptr;
        targetFrame_ = nullptr;
    }
    UI_NodeManager::GroupingFocusChanges grouping;
    if (detach) {
        std::vector<boost::intrusive_ptr<TabPanel>> panels = TakeContent();
        if (!wholeFrame_ && panels.empty()) {
            return;
        }
        if (!targetWindow_) {
            dragWindow_ = wholeFrame_ ? workspace_->CreateDragSrcWindow(dragRect_, lastPoint_, sourceFrame_)
                                      : workspace_->CreateDragSrcWindow(dragRect_, lastPoint_, panels);
            if (dragWindow_ && dragWindow_->GetRootFrame()) {
                sourceFrame_ = dragWindow_->GetRootFrame(); // the content now lives there
            }
            appliedFrame_ = nullptr;
            appliedDropType_ = DropZone::None;
            awayFromSourceWell_ = false;
            needTabRects_ = true;
            DropTargetChanged(2);
        } else {
            WorkspaceFrame* holder = nullptr;
            if (wholeFrame_) {
                targetWindow_->SetRootFrame(sourceFrame_, true);
                holder = sourceFrame_.get();
            } else {
                holder = targetWindow_->CreateRootFrame(panels, true);
            }
            startPoint_ = lastPoint_;
            if (dragWindow_ && !dragWindow_->GetRootFrame()) {
                ReleaseDragWindow();
            }
            DropTargetChanged(1);
            if (holder) {
                sourceFrame_ = holder;
                holder->BringTabToFront(holder->GetFrontTabIndex());
            }
            needTabRects_ = true;
        }
        return;
    }

    // Docking through the overlay's zone.
    WorkspaceFrame* target = targetFrame_.get();
    if (DropZoneOverlayWindow* overlay = targetWindow_ ? targetWindow_->GetDropZoneOverlay() : nullptr) {
        currentDropType_ = overlay->GetActiveDropZone();
        if (FrameDropZoneOverlayWindow* frameOverlay = targetWindow_->GetFrameDropZoneOverlay()) {
            DropZone const* zone = frameOverlay->GetActiveZone();
            WorkspaceFrame* zoneFrame = zone ? targetWindow_->GetFrameFromLMFrame(zone->GetFrame()) : nullptr;
            target = zoneFrame ? zoneFrame : frameOverlay->GetRootFrame();
        } else {
            target = nullptr; // a window edge: beside the whole layout
        }
    }
    if (!targetWindow_ || currentDropType_ == DropZone::None) {
        return;
    }
    long index = 0;
    if (currentDropType_ == DropZone::TabWell) {
        // Only a pointer inside the tab row places the tab; past the last tab means at the end.
        if (!target || !target->GetTabWellGlobalRect().Contains(lastPoint_)) {
            return;
        }
        std::vector<RectT> const* rects =
            target == sourceFrame_.get() && !needTabRects_ ? &sourceTabRects_ : nullptr;
        if (!target->GetTabInsertIndexFromPos(lastPoint_, index, rects)) {
            index = target->GetTabCount();
        }
    }
    if (currentDropType_ == DropZone::Center && (!target || target == sourceFrame_.get())) {
        return;
    }
    if (currentDropType_ == appliedDropType_ && target == appliedFrame_.get() &&
        (currentDropType_ != DropZone::TabWell || index == long(tabIndex_))) {
        return;
    }
    DropZone::DropType type = currentDropType_;
    tabIndex_ = static_cast<unsigned long>(std::max(0L, index));
    if (final) {
        appliedDropType_ = type;
        appliedFrame_ = target;
    }
    bool reorder = type == DropZone::TabWell && target == sourceFrame_.get();
    if (reorder) {
        long front = sourceFrame_->GetFrontTabIndex();
        long to = std::min(index, sourceFrame_->GetTabCount() - 1);
        if (to != front && front >= 0) {
            sourceFrame_->MoveTabPanel(front, to);
        }
        tabIndex_ = static_cast<unsigned long>(std::max(0L, sourceFrame_->GetFrontTabIndex()));
        needTabRects_ = true;
        CloseOverlay();
        return;
    }
    boost::intrusive_ptr<TopLevelWindow> keepTarget(targetWindow_);
    boost::intrusive_ptr<WorkspaceFrame> keepFrame(target);
    boost::intrusive_ptr<WorkspaceFrame> content = sourceFrame_;
    std::vector<boost::intrusive_ptr<TabPanel>> panels = TakeContent();
    if (!wholeFrame_ && panels.empty()) {
        return;
    }
    TabPanel* dragged = wholeFrame_ ? content->GetFrontTabPanel() : panels.front().get();
    WorkspaceFrame* holder = nullptr;
    switch (type) {
    case DropZone::Top:
    case DropZone::Left:
    case DropZone::Bottom:
    case DropZone::Right: {
        auto side = LayoutManager::InsertionType(int(type) - 1);
        if (wholeFrame_) {
            keepTarget->AddTabbedFrame(target, content, side);
            holder = content.get();
        } else if (!target && type == DropZone::Top && keepTarget->IsMain() &&
                   dynamic_cast<WorkspaceBorderElement*>(dragged)) {
            keepTarget->SetStaticElement(panels.front(), LayoutManager::Top, true);
            dockedElsewhere_ = panels.front();
        } else {
            holder = keepTarget->AddTabbedFrame(target, panels, dragged, side);
        }
        break;
    }
    case DropZone::Center:
        if (wholeFrame_) {
            target->AddTabs(content.get());
        } else {
            target->AddTabs(panels);
        }
        holder = target;
        break;
    case DropZone::TabWell:
        if (wholeFrame_) {
            target->AddTabs(content.get());
        } else {
            target->AddTab(panels.front(), std::min(index, target->GetTabCount()), true);
        }
        holder = target;
        break;
    default:
        break;
    }
    if (type == DropZone::TabWell) {
        CloseOverlay();
    } else if (DropZoneOverlayWindow* overlay = keepTarget->GetDropZoneOverlay()) {
        overlay->UI_Invalidate();
    }
    if (holder) {
        dockedElsewhere_.reset();
        if (dragged && holder->IndexOf(dragged) >= 0) {
            holder->BringTabToFront(dragged);
        }
        sourceFrame_ = holder;
        tabIndex_ = static_cast<unsigned long>(std::max(0L, holder->GetFrontTabIndex()));
    }
    needTabRects_ = true;
    DropTargetChanged(1);
}

void TabDragger::End() {
    if (ended_) {
        return;
    }
    ended_ = true;
    Tracker::End();
    bool emptyMain = targetWindow_ && targetWindow_->IsMain() && !targetWindow_->GetRootFrame();
    // Ended from inside a docking step (released by something it set off), it docks nothing more.
    if (dragStarted_ && applyingCount_ == 0 && targetWindow_ &&
        (targetWindow_->GetDropZoneOverlay() || emptyMain) && !HasBeenCancelled()) {
        Apply(nullptr, true);
    }
    if (targetWindow_) {
        targetWindow_->DestroyDropZoneOverlay();
    }
    if (dragWindow_ && dragWindow_->UI_GetParentNode()) {
        workspace_->MakeWindowPermanent(dragWindow_);
    }
    if (dragStarted_) {
        workspace_->SetToolkitCursor(orvui::ui::cursor::Arrow);
    }
    if (UI_NodeManager* manager = UI_NodeManager::Get()) {
        manager->UI_ClearPreviousKeyboardFocus();
    }
    TabPanel* front = dockedElsewhere_ ? dockedElsewhere_.get() : sourceFrame_->GetFrontTabPanel();
    if (front) {
        workspace_->SetFocusedTabPanel(front);
    }
    workspace_->NotifyTabDragEnd(front);
}

void TabDragger::DetachFrameWindow(TopLevelWindow* window, WorkspaceFrame* frame) {
    if (!window || !frame) {
        return;
    }
    if (window->GetLayoutManager()->GetMaximizedFrame()) {
        window->GetLayoutManager()->SetMaximizedFrame(nullptr);
    }
    bool keepPlace = true;
    if (frame->GetTabCount() > 0 || (!frame->HasHiddenTabs() && !frame->HasRemovedTabData())) {
        OS_TabDragger::DetachFrameWindow(window, frame);
        keepPlace = false;
    }
    window->RemoveFrame(frame, keepPlace);
}

void TabDragger::DetachTopLevelWindow(TopLevelWindow* window) {
    if (!window) {
        return;
    }
    boost::intrusive_ptr<TopLevelWindow> keep(window);
    if (window == targetWindow_.get()) {
        window->DestroyDropZoneOverlay();
        targetWindow_ = nullptr;
        targetFrame_ = nullptr;
    }
    workspace_->RemoveWindow(window, window->HasReanimatableFrames());
    OS_TabDragger::DetachTopLevelWindow(window);
    if (window == dragWindow_.get()) {
        dragWindow_.reset();
    }
}

} // namespace orvworkspace::workspace
