// Top-level windows: their layout, frames, closed frames, edge drop zones, drawing and input.
#include "workspace/TopLevelWindow.h"

#include "frames/TablessWorkspaceFrame.h"
#include "frames/WorkspaceFrame.h"
#include "host/core/Error.h"
#include "host/ui/MonitorInfo.h"
#include "host/ui/NodeManager.h"
#include "host/ui/ResourceManager.h"
#include "host/ui/Theme.h"
#include "host/ui/canvasor/Canvasor.h"
#include "host/ui/controls/TabWell.h"
#include "layout/FrameDataProxy.h"
#include "workspace/TabCreator.h"
#include "workspace/TabDragger.h"
#include "workspace/TabPanel.h"
#include "workspace/Workspace.h"

#include <algorithm>

namespace orvworkspace::workspace {

using namespace orvui::ui;

namespace {
// Guards the activation handler against re-entry through the focus changes it makes.
bool activating = false;
} // namespace

TopLevelWindow::TopLevelWindow(Workspace* workspace, OSEventFunction osEventFunc, bool flag)
    : OS_TopLevelWindow(workspace, flag)
    , interim_(false)
    , main_(true)
    , layoutManager_(std::make_unique<LayoutManager>(this))
    , workspace_(workspace) {
    UI_SetNodeID("TopLevelWindow");
    ConstructOSWindow();
    if (osEventFunc) {
        UI_SetEventFunction(osEventFunc);
    }
    layoutManager_->SetContainingRect(ClientLocalRect());
}

TopLevelWindow::TopLevelWindow(Workspace* workspace, bool interim, RectT const* rect,
                               OSEventFunction osEventFunc, bool flag)
    : OS_TopLevelWindow(workspace, flag)
    , interim_(interim)
    , main_(false)
    , layoutManager_(std::make_unique<LayoutManager>(this))
    , workspace_(workspace) {
    UI_SetNodeID("TopLevelWindow");
    TopLevelWindow* owner = workspace ? workspace->GetMainTopLevelWindow() : nullptr;
    ConstructOSWindow(owner ? owner->GetPlatformWindow() : 0, rect ? *rect : DefaultRect);
    if (osEventFunc) {
        UI_SetEventFunction(osEventFunc);
    }
    layoutManager_->SetContainingRect(ClientLocalRect());
}

TopLevelWindow::~TopLevelWindow() = default;

bool TopLevelWindow::GetSplitterSnappingEnabled() {
    bool enabled = workspace_ ? workspace_->GetSplitterSnappingEnabled() : true;
    return (GetCurrentModKeys() & modifier::Alt) ? !enabled : enabled;
}

bool TopLevelWindow::GetLayoutEnabled() {
    return !workspace_ || workspace_->GetLayoutEnabled();
}
long TopLevelWindow::GetTabMinHeight() {
    return orvui::controls::GetTabWellMinHeight();
}
long TopLevelWindow::GetTabMinWidth() {
    return workspace_ ? workspace_->GetTabMinWidth() : 35;
}

RectT TopLevelWindow::ClientLocalRect() const {
    RectF r = UI_GetRect();
    return RectT(0, 0, std::int32_t(r.width), std::int32_t(r.height));
}

RectT TopLevelWindow::ClientRectInScreen() const {
    return UI_GetGlobalClientRect();
}

void TopLevelWindow::MakePermanent() {
    UI_SetOpacity(1.0f);
    UI_DispatchNodeChange(6);
    interim_ = false;
    if (WorkspaceFrame* root = GetRootFrame()) {
        root->RestoreDefaultMargin();
    }
    Activate(true);
}

void TopLevelWindow::Activate(bool focusPanel) {
    UI_Activate();
    if (focusPanel && workspace_) {
        if (WorkspaceFrame* root = GetRootFrame()) {
            workspace_->SetFocusedTabPanel(root->GetFrontTabPanel());
        }
    }
}

// --- Frames ---

boost::intrusive_ptr<WorkspaceFrame> TopLevelWindow::CreateWorkspaceFrame(RectT const& rect) {
    boost::intrusive_ptr<WorkspaceFrame> frame(new WorkspaceFrame(this, rect));
    ChildPushBack(frame);
    return frame;
}

boost::intrusive_ptr<TablessWorkspaceFrame> TopLevelWindow::CreateTablessFrame(RectT const& rect) {
    return new TablessWorkspaceFrame(this, rect);
}

boost::intrusive_ptr<WorkspaceFrame> TopLevelWindow::CreateWorkspaceFrame() {
    // Every caller places the frame next (as the root, beside a frame, or by a restore), so it starts
    // without area. Started over the whole window, it would mark the whole window for repainting
    // each time one frame is added.
    RectT containing = layoutManager_->GetContainingRect();
    return CreateWorkspaceFrame(RectT(containing.left, containing.top, 0, 0));
}

boost::intrusive_ptr<WorkspaceFrame>
TopLevelWindow::CreateWorkspaceFrame(std::vector<boost::intrusive_ptr<TabPanel>>& panels) {
    boost::intrusive_ptr<WorkspaceFrame> frame = CreateWorkspaceFrame();
    frame->AddTabs(panels);
    return frame;
}

boost::intrusive_ptr<WorkspaceFrame>
TopLevelWindow::CreateWorkspaceFrame(std::vector<std::string> const& tabTypes) {
    boost::intrusive_ptr<WorkspaceFrame> frame = CreateWorkspaceFrame();
    frame->AddTabs(tabTypes);
    return frame;
}

boost::intrusive_ptr<WorkspaceFrame>
TopLevelWindow::CreateWorkspaceFrame(boost::intrusive_ptr<TabPanel> panel) {
    boost::intrusive_ptr<WorkspaceFrame> frame = CreateWorkspaceFrame();
    frame->AddTab(std::move(panel), true);
    return frame;
}

boost::intrusive_ptr<WorkspaceFrame> TopLevelWindow::CreateWorkspaceFrame(std::string const& tabType) {
    boost::intrusive_ptr<WorkspaceFrame> frame = CreateWorkspaceFrame();
    frame->AddTab(tabType, true);
    return frame;
}

void TopLevelWindow::AdoptFrame(WorkspaceFrame* frame) {
    frame->SetTopLevelWindow(this);
    frame->GetLMFrame()->SetLayoutManager(layoutManager_.get());
    if (frame->UI_GetParentNode() != this) {
        ChildPushBack(frame);
    }
    frame->ShowFrame(true);
}

void TopLevelWindow::SetRootFrame(boost::intrusive_ptr<WorkspaceFrame> frame, bool) {
    if (frame) {
        AdoptFrame(frame.get());
        layoutManager_->SetRootFrame(frame->GetLMFrame(), ClientLocalRect());
    }
}

WorkspaceFrame* TopLevelWindow::CreateRootFrame(std::string const& tabType, bool select, bool) {
    boost::intrusive_ptr<WorkspaceFrame> frame = CreateWorkspaceFrame();
    SetRootFrame(frame, select);
    frame->AddTab(tabType, select);
    return frame.get();
}

WorkspaceFrame* TopLevelWindow::CreateRootFrame(boost::intrusive_ptr<TabPanel> panel, bool select) {
    boost::intrusive_ptr<WorkspaceFrame> frame = CreateWorkspaceFrame();
    SetRootFrame(frame, select);
    frame->AddTab(std::move(panel), select);
    return frame.get();
}

WorkspaceFrame* TopLevelWindow::CreateRootFrame(std::vector<std::string> const& tabTypes, bool select) {
    boost::intrusive_ptr<WorkspaceFrame> frame = CreateWorkspaceFrame();
    SetRootFrame(frame, select);
    frame->AddTabs(tabTypes);
    return frame.get();
}

WorkspaceFrame* TopLevelWindow::CreateRootFrame(std::vector<boost::intrusive_ptr<TabPanel>>& panels,
                                                bool select) {
    boost::intrusive_ptr<WorkspaceFrame> frame = CreateWorkspaceFrame();
    SetRootFrame(frame, select);
    frame->AddTabs(panels);
    return frame.get();
}

WorkspaceFrame* TopLevelWindow::GetRootFrame() const {
    WorkspaceFrame* last = nullptr;
    for (std::size_t i = 0; i < ChildSize(); ++i) {
        if (auto* frame = dynamic_cast<WorkspaceFrame*>(ChildGet(i))) {
            if (frame->UI_IsShown()) {
                return frame;
            }
            last = frame;
        }
    }
    return last;
}

unsigned long TopLevelWindow::GetFrameCount() const {
    unsigned long count = 0;
    for (std::size_t i = 0; i < ChildSize(); ++i) {
        count += dynamic_cast<WorkspaceFrame*>(ChildGet(i)) ? 1 : 0;
    }
    return count;
}

WorkspaceFrame* TopLevelWindow::GetFrame(unsigned long index) const {
    for (std::size_t i = 0; i < ChildSize(); ++i) {
        if (auto* frame = dynamic_cast<WorkspaceFrame*>(ChildGet(i))) {
            if (index-- == 0) {
                return frame;
            }
        }
    }
    return nullptr;
}

void TopLevelWindow::AddTabbedFrame(WorkspaceFrameBase* beside, boost::intrusive_ptr<WorkspaceFrame> frame,
                                    LayoutManager::InsertionType side) {
    if (!frame) {
        return;
    }
    AdoptFrame(frame.get());
    layoutManager_->AddFrame(beside ? beside->GetLMFrame() : nullptr, side, frame->GetLMFrame());
}

WorkspaceFrame* TopLevelWindow::AddTabbedFrame(WorkspaceFrameBase* beside, std::string const& tabType,
                                               LayoutManager::InsertionType side) {
    boost::intrusive_ptr<WorkspaceFrame> frame = CreateWorkspaceFrame();
    frame->AddTab(tabType, true);
    AddTabbedFrame(beside, frame, side);
    return frame.get();
}

WorkspaceFrame* TopLevelWindow::AddTabbedFrame(WorkspaceFrameBase* beside,
                                               std::vector<boost::intrusive_ptr<TabPanel>>& panels,
                                               TabPanel* front, LayoutManager::InsertionType side) {
    boost::intrusive_ptr<WorkspaceFrame> frame = CreateWorkspaceFrame(panels);
    if (front) {
        frame->BringTabToFront(front);
    }
    AddTabbedFrame(beside, frame, side);
    return frame.get();
}

void TopLevelWindow::RemoveFrame(boost::intrusive_ptr<WorkspaceFrameBase> frame, bool keepPlace) {
    if (!frame) {
        return;
    }
    auto* tabbed = dynamic_cast<WorkspaceFrame*>(frame.get());
    bool hidden = tabbed && tabbed->HasHiddenTabs();
    layoutManager_->RemoveFrame(frame->GetLMFrame(), keepPlace, hidden);
    if (keepPlace && hidden) {
        frame->ShowFrame(false);
        hiddenFrames_.emplace_back(tabbed);
    }
    ChildRemove(frame.get());
    // The nearest remaining frame (searching from the last) takes the focus.
    for (std::size_t i = ChildSize(); i-- > 0;) {
        if (auto* other = dynamic_cast<WorkspaceFrame*>(ChildGet(i)); other && other->GetFrontTabPanel()) {
            if (workspace_) {
                workspace_->SetFocusedTabPanel(other->GetFrontTabPanel());
            }
            break;
        }
    }
    UI_Invalidate();
}

bool TopLevelWindow::UI_IsRootViewOpaque() const {
    return GetRootFrame() != nullptr;
}

WorkspaceFrame* TopLevelWindow::GetFrameFromLMFrame(Frame const* lmFrame) const {
    for (std::size_t i = 0; i < ChildSize(); ++i) {
        if (auto* frame = dynamic_cast<WorkspaceFrame*>(ChildGet(i));
            frame && frame->GetLMFrame() == lmFrame) {
            return frame;
        }
    }
    return nullptr;
}

WorkspaceFrame* TopLevelWindow::GetFrameFromPos(PointT const& global) const {
    for (std::size_t i = 0; i < ChildSize(); ++i) {
        auto* frame = dynamic_cast<WorkspaceFrame*>(ChildGet(i));
        if (frame && frame->UI_IsShown() && frame->UI_LocalToGlobal(frame->GetFrameRect()).Contains(global)) {
            return frame;
        }
    }
    return nullptr;
}

TabPanel* TopLevelWindow::GetLastTouchedTabPanel() const {
    TabPanel* best = nullptr;
    for (std::size_t i = ChildSize(); i-- > 0;) {
        auto* frame = dynamic_cast<WorkspaceFrame*>(ChildGet(i));
        TabPanel* front = frame ? frame->GetFrontTabPanel() : nullptr;
        if (front && (!best || front->GetTouchStamp() > best->GetTouchStamp())) {
            best = front;
        }
    }
    return best;
}

// --- Closed frames ---

bool TopLevelWindow::CanReanimateFrame(std::string const& tabType) const {
    return layoutManager_->FindFrameForReanimation(tabType) != nullptr;
}

bool TopLevelWindow::CanReanimateFrame(boost::intrusive_ptr<TabPanel> const& panel) const {
    return std::any_of(hiddenFrames_.begin(), hiddenFrames_.end(),
                       [&](auto const& frame) { return frame->CanReanimateTab(panel.get()); });
}

bool TopLevelWindow::ReanimateFrame(boost::intrusive_ptr<TabPanel> const& panel) {
    auto found = std::find_if(hiddenFrames_.begin(), hiddenFrames_.end(),
                              [&](auto const& frame) { return frame->CanReanimateTab(panel.get()); });
    if (found == hiddenFrames_.end()) {
        return false;
    }
    boost::intrusive_ptr<WorkspaceFrame> frame = *found;
    FrameDataProxy* proxy = layoutManager_->FindFrameForReanimation(frame->GetLMFrame());
    if (!proxy) {
        return false;
    }
    ChildPushBack(frame);
    layoutManager_->ReanimateFrame(proxy, frame->GetLMFrame());
    frame->ReanimateTab(panel);
    hiddenFrames_.erase(found);
    layoutManager_->LayoutNewFrame(frame->GetLMFrame());
    frame->UI_Invalidate();
    frame->ShowFrame(true);
    return true;
}

bool TopLevelWindow::ReanimateFrame(std::string const& tabType) {
    FrameDataProxy* proxy = layoutManager_->FindFrameForReanimation(tabType);
    if (!proxy) {
        return false;
    }
    auto found = hiddenFrames_.end();
    if (proxy->HasFrame()) {
        found = std::find_if(hiddenFrames_.begin(), hiddenFrames_.end(),
                             [&](auto const& f) { return f->GetLMFrame() == proxy->GetFrame(); });
    }
    boost::intrusive_ptr<WorkspaceFrame> frame = found != hiddenFrames_.end() ? *found : nullptr;
    // What comes back is settled before the frame returns to the layout, so that a frame never
    // comes back empty: a hidden panel of the type, else one made again from its remembered state.
    boost::intrusive_ptr<TabPanel> hiddenPanel;
    if (frame) {
        for (auto const& panel : frame->HiddenTabs()) {
            if (panel->GetTabType() == tabType) {
                hiddenPanel = panel;
                break;
            }
        }
    }
    TabDataList const& remembered = frame ? frame->GetRemovedTabData() : proxy->GetTabData();
    bool canMake =
        workspace_ && workspace_->FindCreator(tabType) &&
        std::any_of(remembered.begin(), remembered.end(), [&](auto const& e) { return e.first == tabType; });
    if (!hiddenPanel && !canMake) {
        return false;
    }
    if (frame) {
        hiddenFrames_.erase(found);
        ChildPushBack(frame);
    } else {
        frame = CreateWorkspaceFrame();
        frame->SetRemovedTabData(proxy->GetTabData());
    }
    layoutManager_->ReanimateFrame(proxy, frame->GetLMFrame());
    if (hiddenPanel) {
        frame->ReanimateTab(hiddenPanel);
    } else {
        frame->ReanimateTab(tabType);
    }
    layoutManager_->LayoutNewFrame(frame->GetLMFrame());
    frame->UI_Invalidate();
    frame->ShowFrame(true);
    return true;
}

void TopLevelWindow::AddHiddenFrame(boost::intrusive_ptr<WorkspaceFrame> const& frame) {
    hiddenFrames_.push_back(frame);
}

void TopLevelWindow::DestroyHiddenFrames() {
    for (auto const& frame : hiddenFrames_) {
        frame->DestroyHiddenTabs();
    }
}

void TopLevelWindow::RemoveTabPanels(bool flag) {
    boost::intrusive_ptr<UI_Node> keep(IsReferenced() ? this : nullptr);
    std::vector<boost::intrusive_ptr<WorkspaceFrame>> frames;
    for (std::size_t i = ChildSize(); i-- > 0;) {
        if (auto* frame = dynamic_cast<WorkspaceFrame*>(ChildGet(i))) {
            frames.emplace_back(frame);
        }
    }
    for (auto const& frame : frames) {
        for (long t = frame->GetTabCount() - 1; t >= 0; --t) {
            frame->GetTabPanel(t)->NotifyTopLevelWindowIsClosing();
        }
    }
    for (auto const& frame : frames) {
        frame->RemoveAllTabs(flag);
    }
}

void TopLevelWindow::DestroyTabPanels() {
    std::vector<boost::intrusive_ptr<WorkspaceFrame>> frames;
    for (std::size_t i = 0; i < ChildSize(); ++i) {
        if (auto* frame = dynamic_cast<WorkspaceFrame*>(ChildGet(i))) {
            frames.emplace_back(frame);
        }
    }
    for (auto const& frame : frames) {
        while (frame->GetTabCount() > 0) {
            frame->DetachTabPanel(0);
        }
        frame->DestroyHiddenTabs();
        RemoveFrame(frame, false);
    }
    for (auto const& frame : hiddenFrames_) {
        frame->DestroyHiddenTabs();
    }
    hiddenFrames_.clear();
}

// --- Edge drop zones ---

RectT TopLevelWindow::AreaWithoutStaticFrames() const {
    RectT area = ClientRectInScreen();
    // A tabless frame answers an empty local rectangle to the layout; its extent is where the layout
    // placed it.
    auto extent = [&](LayoutManager::InsertionType type) {
        TablessWorkspaceFrame* frame = GetBorderFrame(type);
        return frame ? frame->GetTabContentRect() : RectT();
    };
    if (layoutManager_->HasStaticBorderFrame(LayoutManager::Top)) {
        int h = extent(LayoutManager::Top).height;
        area.top += h;
        area.height -= h;
    }
    if (layoutManager_->HasStaticBorderFrame(LayoutManager::Left)) {
        RectT r = extent(LayoutManager::Left);
        if (layoutManager_->GetEnableLeftStaticBorderAsSecondTopFrame()) {
            area.top += r.height;
            area.height -= r.height;
        } else {
            area.left += r.width;
            area.width -= r.width;
        }
    }
    if (layoutManager_->HasStaticBorderFrame(LayoutManager::Bottom)) {
        area.height -= extent(LayoutManager::Bottom).height;
    }
    if (layoutManager_->HasStaticBorderFrame(LayoutManager::Right)) {
        area.width -= extent(LayoutManager::Right).width;
    }
    return area;
}

void TopLevelWindow::GetEdgeDropZoneRect(DropZone::DropType type, RectT& out, bool hitArea) const {
    int t = hitArea ? 10 : 20;
    RectT a = AreaWithoutStaticFrames();
    switch (type) {
    case DropZone::Top:
        out = RectT(a.left, a.top, a.width, hitArea ? 7 : 12);
        break;
    case DropZone::Left:
        out = RectT(a.left - 1, a.top, t + 1, a.height);
        break;
    case DropZone::Bottom:
        out = RectT(a.left, a.Bottom() - t, a.width, t + 1);
        break;
    case DropZone::Right:
        out = RectT(a.Right() - t, a.top, t + 1, a.height);
        break;
    default:
        break;
    }
}

DropZone::DropType TopLevelWindow::GetEdgeDropZone(PointT const& point, RectT& outRect,
                                                   std::vector<PointT>& outPolygon) const {
    for (DropZone::DropType type : {DropZone::Left, DropZone::Top, DropZone::Right, DropZone::Bottom}) {
        RectT hit;
        GetEdgeDropZoneRect(type, hit, true);
        if (hit.width <= 0 || hit.height <= 0 || !hit.Contains(point)) {
            continue;
        }
        GetEdgeDropZoneRect(type, outRect, false);
        RectT r = outRect;
        int d = (type == DropZone::Left || type == DropZone::Right) ? r.width : r.height;
        int L = r.left, T = r.top, W = r.width, H = r.height;
        switch (type) {
        case DropZone::Top:
            outPolygon = {PointT(L, T), PointT(L + d, T + d), PointT(L + W - d, T + d), PointT(L + W, T)};
            break;
        case DropZone::Left:
            outPolygon = {PointT(L, T), PointT(L + d, T + d), PointT(L + d, T + H - d), PointT(L, T + H)};
            break;
        case DropZone::Bottom:
            outPolygon = {PointT(L, T + H), PointT(L + d, T + H - d), PointT(L + W - d, T + H - d),
                          PointT(L + W, T + H)};
            break;
        default:
            outPolygon = {PointT(L + W, T + H), PointT(L + W - d, T + H - d), PointT(L + W - d, T + d),
                          PointT(L + W, T)};
            break;
        }
        return type;
    }
    return DropZone::None;
}

void TopLevelWindow::CalculateDropZoneExclusionsForEdges(RectT const& area,
                                                         std::vector<long>& exclusions) const {
    std::size_t base = exclusions.size();
    exclusions.insert(exclusions.end(), 4, 0);
    auto store = [&](std::size_t index, long overlap) {
        if (overlap > 0) {
            exclusions[base + index] = overlap - 1;
        }
    };
    RectT zone;
    GetEdgeDropZoneRect(DropZone::Top, zone, true);
    store(0, long(zone.top + zone.height) - area.top);
    GetEdgeDropZoneRect(DropZone::Left, zone, true);
    store(1, long(zone.left + zone.width) - area.left);
    GetEdgeDropZoneRect(DropZone::Bottom, zone, true);
    store(2, long(area.top + area.height) - zone.top);
    GetEdgeDropZoneRect(DropZone::Right, zone, true);
    store(3, long(area.left + area.width) - zone.left);
}

void TopLevelWindow::SetToGlobalTabSize(RectT const& rect) {
    RectT outer = UI_GetGlobalStructureRect();
    WorkspaceFrame* root = GetRootFrame();
    RectT panel = root ? root->UI_LocalToGlobal(root->GetTabPanelRect()) : ClientRectInScreen();
    // Keep the chrome and frame borders around a panel area of exactly the requested rectangle.
    RectT next(rect.left - (panel.left - outer.left), rect.top - (panel.top - outer.top),
               rect.width + (outer.width - panel.width), rect.height + (outer.height - panel.height));
    UI_SetGlobalStructureRect(next);
}

// --- Drop-zone overlays ---

DropZoneOverlayWindow* TopLevelWindow::CreateDropZoneOverlay(TabDragger* dragger, PointT const& point,
                                                             WorkspaceFrame* frame) {
    // Edges are offered unless docking at them would come from this very window and empty it.
    bool edges = true;
    if (WorkspaceFrame* source = dragger ? dragger->GetSourceFrame() : nullptr;
        source && source->GetTopLevelWindow() == this) {
        edges = GetFrameCount() >= 2 || (!dragger->IsWholeFrame() && source->GetTabCount() >= 2);
    }
    boost::intrusive_ptr<DropZoneOverlayWindow> made;
    if (edges) {
        made = CreateEdgeDropZoneOverlay(dragger, point);
    }
    if (!made && frame) {
        made = CreateFrameDropZoneOverlay(dragger, point, frame);
    }
    if (!made) {
        DestroyDropZoneOverlay();
        return nullptr;
    }
    DestroyDropZoneOverlay();
    dropZoneOverlay_ = made;
    return made.get();
}

DropZoneOverlayWindow* TopLevelWindow::CreateEdgeDropZoneOverlay(TabDragger* dragger, PointT const& point) {
    RectT rect;
    std::vector<PointT> polygon;
    DropZone::DropType type = GetEdgeDropZone(point, rect, polygon);
    if (type == DropZone::None || rect.width <= 0 || rect.height <= 0) {
        return nullptr;
    }
    return new EdgeDropZoneOverlayWindow(this, dragger, point, rect, polygon, type, false);
}

DropZoneOverlayWindow* TopLevelWindow::CreateFrameDropZoneOverlay(TabDragger* dragger, PointT const& point,
                                                                  WorkspaceFrame* frame) {
    if (!frame || !frame->GetFrontTabPanel()) {
        return nullptr;
    }
    RectT rect = frame->UI_LocalToGlobal(frame->GetFrameRect());
    std::vector<long> exclusions;
    CalculateDropZoneExclusionsForEdges(rect, exclusions);
    RectT visible(rect.left + std::int32_t(exclusions[1]), rect.top + std::int32_t(exclusions[0]),
                  rect.width - std::int32_t(exclusions[1] + exclusions[3]),
                  rect.height - std::int32_t(exclusions[0] + exclusions[2]));
    if (visible.width <= 0 || visible.height <= 0) {
        return nullptr; // a frame hidden entirely under the edge zones offers nothing of its own
    }
    return new FrameDropZoneOverlayWindow(dragger, point, rect, exclusions, frame, false);
}

void TopLevelWindow::DestroyDropZoneOverlay() {
    if (boost::intrusive_ptr<DropZoneOverlayWindow> overlay = std::move(dropZoneOverlay_)) {
        overlay->UI_SetOpacity(0);
        overlay->DetachFromParent();
    }
}

EdgeDropZoneOverlayWindow* TopLevelWindow::GetEdgeDropZoneOverlay() const {
    return dynamic_cast<EdgeDropZoneOverlayWindow*>(dropZoneOverlay_.get());
}

FrameDropZoneOverlayWindow* TopLevelWindow::GetFrameDropZoneOverlay() const {
    return dynamic_cast<FrameDropZoneOverlayWindow*>(dropZoneOverlay_.get());
}

// --- Drag position ---

void TopLevelWindow::SetDragPosition(PointT const& point, bool wholeFrame) {
    WorkspaceFrame* root = GetRootFrame();
    if (!root) {
        return;
    }
    RectT grip;
    if (wholeFrame) {
        if (auto* flyout = root->GetTabWell()->GetFlyout()) {
            grip = flyout->GetGlobalGripperRect();
        }
    } else if (auto* item = root->GetTabWell()->GetTab(root->GetFrontTabIndex())) {
        grip = item->GetGlobalGripperRect();
    }
    RectT outer = UI_GetGlobalStructureRect();
    PointT gripCentre(grip.left + grip.width / 2, grip.top + grip.height / 2);
    if (grip.width <= 0 || grip.height <= 0) {
        gripCentre = PointT(outer.left + outer.width / 2, outer.top + 11); // the title bar's middle
    }
    PointT topLeft(outer.left + (point.x - gripCentre.x), outer.top + (point.y - gripCentre.y));
    RectT monitor;
    orvui::utility::MonitorInfo* monitors = workspace_ ? workspace_->ORV_GetMonitorInfo() : nullptr;
    if (monitors && monitors->GetMonitorRectFromPoint(point, monitor)) {
        topLeft.x = std::clamp(topLeft.x, monitor.left,
                               std::max(monitor.left, monitor.left + monitor.width - outer.width));
        topLeft.y = std::clamp(topLeft.y, monitor.top,
                               std::max(monitor.top, monitor.top + monitor.height - outer.height));
    }
    UI_Move(topLeft);
}

void TopLevelWindow::ResetRootFrame(Splitter* splitter,
                                    std::vector<boost::intrusive_ptr<WorkspaceFrame>>& frames) {
    layoutManager_->SetMaximizedFrame(nullptr);
    layoutManager_->SwapRoot(splitter);
    for (auto const& frame : frames) {
        frame->GetLMFrame()->SetLayoutManager(layoutManager_.get());
    }
}

// --- Static elements ---

TablessWorkspaceFrame* TopLevelWindow::GetBorderFrame(LayoutManager::InsertionType side) const {
    Frame* f = layoutManager_->GetStaticBorderFrame(side);
    return f ? dynamic_cast<TablessWorkspaceFrame*>(static_cast<WorkspaceFrameBase*>(f->GetHostData()))
             : nullptr;
}

bool TopLevelWindow::HasStaticElement(LayoutManager::InsertionType side) const {
    return layoutManager_->HasStaticBorderFrame(side);
}

TabPanel* TopLevelWindow::GetStaticElement(LayoutManager::InsertionType side) const {
    TablessWorkspaceFrame* frame = GetBorderFrame(side);
    return frame ? frame->GetTab() : nullptr;
}

void TopLevelWindow::SetStaticElement(boost::intrusive_ptr<TabPanel> const& panel,
                                      LayoutManager::InsertionType side, bool relayout) {
    if (!panel) {
        return;
    }
    if (HasStaticElement(side)) {
        RemoveStaticElement(side, false); // one element per edge
    }
    RectT rect = ClientLocalRect();
    boost::intrusive_ptr<TablessWorkspaceFrame> frame = CreateTablessFrame(rect);
    frame->AddTab(panel);
    frame->UI_Show(true);
    ChildPushBack(frame);
    layoutManager_->SetStaticBorderFrame(frame->GetLMFrame(), rect, side, relayout);
}

TabPanel* TopLevelWindow::SetStaticElement(std::string const& tabType, LayoutManager::InsertionType side,
                                           bool relayout) {
    TabCreator* creator = workspace_ ? workspace_->FindCreator(tabType) : nullptr;
    boost::intrusive_ptr<TabPanel> panel = creator ? creator->CreateTabPanel(workspace_, nullptr) : nullptr;
    if (!panel) {
        return nullptr;
    }
    SetStaticElement(panel, side, relayout);
    return panel.get();
}

void TopLevelWindow::RemoveStaticElement(LayoutManager::InsertionType side, bool relayout) {
    boost::intrusive_ptr<TablessWorkspaceFrame> frame(GetBorderFrame(side));
    if (frame) {
        ChildRemove(frame.get());
    }
    layoutManager_->SetStaticBorderFrame(nullptr, ClientLocalRect(), side, relayout);
    UI_Invalidate();
}

// --- Mega zoom ---

RectT TopLevelWindow::GetMegaZoomMonitor(bool primary) const {
    orvui::utility::MonitorInfo* monitors = workspace_ ? workspace_->ORV_GetMonitorInfo() : nullptr;
    if (!monitors) {
        return RectT();
    }
    monitors->Refresh();
    RectT monitor;
    if (primary && monitors->GetMonitorRect(0, monitor) && monitor.width >= 1 && monitor.height >= 1) {
        return monitor;
    }
    monitors->GetMonitorRectFromRect(UI_GetGlobalStructureRect(), monitor);
    return monitor;
}

PointT TopLevelWindow::GetSingleWorkspaceFramePreferredTabSize() const {
    if (main_ || !HasSingleWorkspaceFrame()) {
        return PointT(0, 0);
    }
    WorkspaceFrame* frame = GetFrame(0);
    PointT snap;
    frame->GetLMFrame()->GetGreatestSnapSize(snap);
    if (snap.x == 0 || snap.y == 0) {
        return PointT(0, 0);
    }
    frame->ConvertFrameToTabSizeIgnoreScrollbar(snap);
    return snap;
}

bool TopLevelWindow::CanZoomToPreferredPanelSize() const {
    return GetSingleWorkspaceFramePreferredTabSize() != PointT(0, 0);
}

bool TopLevelWindow::IsMegaZoomedToWindow() const {
    if (main_ && GetPlatformWindow() && Desktop::Get().IsZoomed(GetPlatformWindow())) {
        return true;
    }
    RectT outer = UI_GetGlobalStructureRect();
    RectT monitor;
    orvui::utility::MonitorInfo* monitors = workspace_ ? workspace_->ORV_GetMonitorInfo() : nullptr;
    return monitors && monitors->GetMonitorRectFromRect(outer, monitor) && outer == monitor;
}

bool TopLevelWindow::IsMegaZoomedToPreferredSize() const {
    PointT preferred = GetSingleWorkspaceFramePreferredTabSize();
    if (preferred == PointT(0, 0)) {
        return false;
    }
    RectT panel = GetFrame(0)->GetTabPanelRect();
    return PointT(panel.width, panel.height) == preferred;
}

void TopLevelWindow::MegaZoom(MegaZoomType type, bool primary, RectT const* monitorRect) {
    RectT monitor = monitorRect ? *monitorRect : GetMegaZoomMonitor(primary);
    RectT outer = UI_GetGlobalStructureRect();
    switch (type) {
    case FitToMonitor:
        UI_SetGlobalStructureRect(monitor);
        break;
    case ZoomContentToMonitor: {
        RectT content;
        if (HasSingleWorkspaceFrame()) {
            WorkspaceFrame* frame = GetFrame(0);
            content = frame->UI_LocalToGlobal(frame->GetTabPanelRect());
            if (TabPanel* front = frame->GetFrontTabPanel()) {
                TabPanel::MegaZoomContentTrim trim = front->GetMegaZoomContentTrim();
                content = RectT(content.left + std::int32_t(trim.left), content.top + std::int32_t(trim.top),
                                content.width - std::int32_t(trim.left + trim.right),
                                content.height - std::int32_t(trim.top + trim.bottom));
            }
        }
        if (content.width <= 0 || content.height <= 0) {
            content = ClientRectInScreen();
            if (main_) {
                content.top -= Desktop::Get().GetMenuBarMetric();
                content.height += Desktop::Get().GetMenuBarMetric();
            }
        }
        // Push each side of the monitor outward by the chrome between the window's edge and the content.
        std::int32_t left = monitor.left - (content.left - outer.left);
        std::int32_t top = monitor.top - (content.top - outer.top);
        std::int32_t right = monitor.Right() + (outer.Right() - content.Right());
        std::int32_t bottom = monitor.Bottom() + (outer.Bottom() - content.Bottom());
        UI_SetGlobalStructureRect(RectT(left, top, right - left, bottom - top));
        break;
    }
    case ZoomToPreferredSize: {
        PointT preferred = GetSingleWorkspaceFramePreferredTabSize();
        if (preferred == PointT(0, 0)) {
            return;
        }
        RectT panel = GetFrame(0)->UI_LocalToGlobal(GetFrame(0)->GetTabPanelRect());
        std::int32_t width = preferred.x + (outer.width - panel.width);
        std::int32_t height = preferred.y + orvui::controls::UI_TabWell::GetTabScrollbarHeight() +
                              (outer.height - panel.height);
        std::int32_t left = monitor.left + monitor.width / 2 - width / 2;
        std::int32_t top = monitor.top + monitor.height / 2 - height / 2;
        UI_SetGlobalStructureRect(RectT(left, top, width, height));
        break;
    }
    }
}

void TopLevelWindow::MegaZoomToggle(bool primary) {
    RectT monitor = GetMegaZoomMonitor(primary);
    MegaZoomType next = FitToMonitor;
    if (IsMegaZoomedToWindow()) {
        next = ZoomContentToMonitor;
    } else if (UI_GetGlobalStructureRect().Intersection(monitor) == monitor &&
               !IsMegaZoomedToPreferredSize()) {
        next = CanZoomToPreferredPanelSize() ? ZoomToPreferredSize : FitToMonitor;
    }
    MegaZoom(next, primary, &monitor);
}

// --- Toolkit ---

void TopLevelWindow::UI_Draw(canvasor::Canvasor& c) {
    std::vector<RectF> segments;
    UI_GetDrawSegments(segments);
    for (RectF const& r : segments) {
        if (r.width > 0 && r.height > 0) {
            c.FillRect(r, GetColor(color::WindowBackground));
        }
    }
}

void TopLevelWindow::UI_GetDrawSegments(std::vector<RectF>& segments) const {
    RectT area = AreaWithoutStaticFrames();
    RectT client = ClientRectInScreen();
    segments.emplace_back(float(area.left - client.left), float(area.top - client.top), float(area.width),
                          float(area.height));
}

canvasor::SupplierInterface* TopLevelWindow::UI_GetDrawSupplier() const {
    return workspace_ ? workspace_->GetDrawSupplier() : OS_TopLevelWindow::UI_GetDrawSupplier();
}

bool TopLevelWindow::UI_DoCursor(PointF local) {
    int cursorNumber = 0;
    switch (layoutManager_->HitCheckCursor(long(local.x), long(local.y))) {
    case LayoutManager::VerticalSplitter:
        cursorNumber = cursor::VerticalSplitter;
        break;
    case LayoutManager::HorizontalSplitter:
        cursorNumber = cursor::HorizontalSplitter;
        break;
    case LayoutManager::SplitterCrossing:
        cursorNumber = cursor::SplitterCrossing;
        break;
    default:
        return false;
    }
    if (workspace_) {
        workspace_->SetToolkitCursor(cursorNumber);
    } else {
        Desktop::Get().SetCursor(cursorNumber);
    }
    return true;
}

bool TopLevelWindow::UI_DoKeyboardEvent(KeyboardEvent& event) {
    if (workspace_) {
        if (OS_Tracker* tracker = workspace_->GetTracker(); tracker && tracker->WantsKeyEvents()) {
            tracker->DoKeyEvent(event);
            if (workspace_->GetTracker() == tracker && tracker->HasBeenCancelled()) {
                workspace_->ReleaseTracker(false);
            }
            return true;
        }
    }
    return UI_DoAdvanceKeyboardFocus(event);
}

void TopLevelWindow::UI_ActivationChanged(bool active) {
    OS_TopLevelWindow::UI_ActivationChanged(active);
    if (!active || activating || !workspace_ || !Desktop::Get().IsApplicationActive() ||
        UI_NodeManager::Get()->IsUpdatingFocus()) {
        return;
    }
    TabPanel* focused = workspace_->GetFocusedTabPanel();
    if (focused && IsAncestorOf(focused)) {
        return;
    }
    activating = true;
    if (TabPanel* last = GetLastTouchedTabPanel()) {
        workspace_->SetFocusedTabPanel(last);
    }
    activating = false;
}

void TopLevelWindow::UI_SizeChanged() {
    RectT client = ClientLocalRect();
    if (layoutManager_ && client != layoutManager_->GetContainingRect()) {
        layoutManager_->Layout(client, true, true, false);
    }
    OS_TopLevelWindow::UI_SizeChanged();
}

} // namespace orvworkspace::workspace
