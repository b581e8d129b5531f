// The tabless frame: one panel, an optional gripper, and tearing the panel off.
#include "frames/TablessWorkspaceFrame.h"

#include "frames/WorkspaceBorderElement.h"
#include "host/core/Error.h"
#include "host/core/ErrorTable.h"
#include "host/ui/Desktop.h"
#include "host/ui/Theme.h"
#include "host/ui/canvasor/Canvasor.h"
#include "host/ui/controls/TabWell.h"
#include "workspace/TabCreator.h"
#include "workspace/TabDragger.h"
#include "workspace/TopLevelWindow.h"
#include "workspace/Workspace.h"

#include <cmath>

namespace orvworkspace::workspace {

using namespace orvui::ui;
using orvui::controls::UI_TablessDragger;

void DefaultDrawGripperFace::Draw(canvasor::Canvasor& c, RectF const& area) {
    c.FillRect(area, GetColor(color::PanelBackground));
}

TablessWorkspaceFrame::TablessWorkspaceFrame(TopLevelWindow* window, RectT const& rect)
    : WorkspaceFrameBase(window) {
    UI_SetNodeID("TablessWorkspaceFrame");
    boost::intrusive_ptr<UI_TablessDragger> dragger(new UI_TablessDragger(
        [this](int action, long index, RectT const* r) { HandleTabItemAction(action, index, r); }));
    dragger->UI_Show(false);
    ChildPushBack(dragger);
    SetSizeAndPos(window->GetLayoutManager()->ConstructFrameZones(rect));
}

TablessWorkspaceFrame::~TablessWorkspaceFrame() {
    if (panel_ && panel_->GetFrame() == this) {
        panel_->SetFrame(nullptr);
    }
}

UI_TablessDragger* TablessWorkspaceFrame::GetDragger() const {
    auto* dragger = dynamic_cast<UI_TablessDragger*>(ChildGet(0));
    if (!dragger) {
        orvcore::config::ThrowError(orvcore::config::errors::InvalidTypeConversion);
    }
    return dragger;
}

void TablessWorkspaceFrame::SetSizeAndPos(FrameZones const& zones) {
    WorkspaceFrameBase::SetSizeAndPos(zones);
    ArrangeChildren();
}

void TablessWorkspaceFrame::ArrangeChildren() {
    RectF local = UI_GetLocalBounds();
    float strip = gripperShown_ ? GripperWidth : 0.0f;
    if (gripperShown_) {
        GetDragger()->UI_SetRect(RectF(local.left, local.top, GripperWidth, local.height));
    }
    if (panel_) {
        panel_->UI_SetRect(RectF(local.left + strip, local.top, local.width - strip, local.height));
    }
    UI_Invalidate();
}

PointT TablessWorkspaceFrame::GetMinimumSize() const {
    if (!panel_) {
        return PointT(0, 0);
    }
    std::vector<PointT> sizes;
    panel_->GetSnapSizes(sizes);
    return sizes.empty() ? PointT(0, 0) : sizes.front();
}

void TablessWorkspaceFrame::GetSnapSizes(std::vector<PointT>& sizes) const {
    if (panel_) {
        panel_->GetSnapSizes(sizes);
    }
}

void TablessWorkspaceFrame::AddTab(boost::intrusive_ptr<TabPanel> const& panel) {
    if (!panel) {
        return;
    }
    if (panel_ && panel_ != panel) {
        panel_->SetFrame(nullptr);
        ChildRemove(panel_.get());
    }
    panel_ = panel;
    panel_->SetFrame(this);
    if (panel_->UI_GetParentNode() != this) {
        ChildPushBack(panel_);
    }
    panel_->UI_Show(true);
    auto* element = dynamic_cast<WorkspaceBorderElement*>(panel_.get());
    gripperShown_ = element && element->IsRippable();
    GetDragger()->UI_Show(gripperShown_);
    GetDragger()->SetGripperShown(gripperShown_);
    ArrangeChildren();
}

TabPanel* TablessWorkspaceFrame::AddTab(std::string const& tabType) {
    TabCreator* creator = GetWorkspace() ? GetWorkspace()->FindCreator(tabType) : nullptr;
    boost::intrusive_ptr<TabPanel> panel = creator ? creator->CreateTabPanel(GetWorkspace(), this) : nullptr;
    if (!panel) {
        return nullptr;
    }
    AddTab(panel);
    return panel.get();
}

boost::intrusive_ptr<TabPanel> TablessWorkspaceFrame::DetachTabPanel(long index) {
    if (index != 0 || !panel_) {
        return nullptr;
    }
    boost::intrusive_ptr<TabPanel> panel = std::move(panel_);
    panel->UI_Show(false);
    if (panel->UI_HasKeyboardFocus(true)) {
        panel->UI_LoseKeyboardFocus();
    }
    ChildRemove(panel.get());
    panel->SetFrame(nullptr);
    gripperShown_ = false;
    GetDragger()->UI_Show(false);
    UI_Invalidate();
    return panel;
}

void TablessWorkspaceFrame::HandleTabItemAction(int, long, RectT const*) {
    if (!panel_ || !GetWorkspace() || !GetTopLevelWindow()) {
        return;
    }
    boost::intrusive_ptr<UI_Node> keep(IsReferenced() ? this : nullptr);
    TopLevelWindow* window = GetTopLevelWindow();
    Workspace* workspace = GetWorkspace();
    if (auto* element = dynamic_cast<WorkspaceBorderElement*>(panel_.get())) {
        element->ConvertToRegularTab();
    }
    RectT rect = UI_LocalToGlobal(GetFrameRect());
    RectT outer = window->UI_GetGlobalStructureRect();
    RectF inner = window->UI_GetLocalBounds();
    double dx = double(outer.width) - double(inner.width);
    double dy = double(outer.height) - double(inner.height) + 19.0;
    rect.left += std::int32_t(std::lround(1.5 * dx));
    PointT snap;
    GetLMFrame()->GetGreatestSnapSize(snap);
    if (snap.x != 0) {
        rect.width = snap.x + std::int32_t(std::lround(dx));
    }
    if (snap.y != 0) {
        rect.height = snap.y + std::int32_t(std::lround(dy));
    }
    boost::intrusive_ptr<TabPanel> panel = DetachTabPanel(0);
    std::vector<boost::intrusive_ptr<TabPanel>> panels{panel};
    boost::intrusive_ptr<TopLevelWindow> floating =
        workspace->CreateDragSrcWindow(rect, PointT(rect.left, rect.top), panels);
    // Only this frame's own edge loses its element, whichever edge the frame was on.
    for (auto side : {LayoutManager::Top, LayoutManager::Left, LayoutManager::Bottom, LayoutManager::Right}) {
        if (window->GetLayoutManager()->GetStaticBorderFrame(side) == GetLMFrame()) {
            window->RemoveStaticElement(side, true);
            break;
        }
    }
    if (!floating) {
        return;
    }
    floating->UI_Show(true);
    // The press that tore the panel off goes on as a drag of the new window's tab.
    WorkspaceFrame* root = floating->GetRootFrame();
    auto* dragger = root ? dynamic_cast<TabDragger*>(workspace->AcquireTabDragger(root, false, 0)) : nullptr;
    if (!dragger) {
        workspace->MakeWindowPermanent(floating);
        return;
    }
    // The capture stays with the main window, as for every drag: the floating window may be
    // removed while the drag runs (docked into an empty main window), and a capture held by a
    // removed window would swallow the rest of the drag.
    dragger->AdoptDragWindow(floating);
    bool endAtOnce = false;
    dragger->Begin(orvui::ui::Desktop::Get().GetMousePosition(), &endAtOnce);
    if (endAtOnce) {
        workspace->ReleaseTracker(false);
    }
}

void TablessWorkspaceFrame::UI_Draw(canvasor::Canvasor& c) {
    WorkspaceFrameBase::UI_Draw(c);
    auto* element = dynamic_cast<WorkspaceBorderElement*>(panel_.get());
    if (element && gripperShown_) {
        std::unique_ptr<DrawGripperFace> face = element->GetGripperFaceDrawer();
        if (face) {
            face->Draw(c, GetDragger()->UI_GetRect());
        }
    }
}

} // namespace orvworkspace::workspace
