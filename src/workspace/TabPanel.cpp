// Panels: identity, touch stamps, names and colours that reach the tab, focus on press.
#include "workspace/TabPanel.h"

#include "frames/WorkspaceFrame.h"
#include "host/core/PropList.h"
#include "host/ui/Theme.h"
#include "host/ui/canvasor/Canvasor.h"
#include "workspace/Workspace.h"

namespace orvworkspace::workspace {

using namespace orvui::ui;

TabPanel::TabPanel(Workspace* workspace, WorkspaceFrameBase* frame, bool wantsKeyboardFocus,
                   std::string tabType, std::u16string const& name, OSEventFunction osEventFunc, bool)
    : id_(workspace ? workspace->NewUniqueID() : 0)
    , tabType_(std::move(tabType))
    , wantsKeyboardFocus_(wantsKeyboardFocus)
    , frame_(frame)
    , workspace_(workspace)
    , name_(name) {
    RectT rect = frame ? frame->GetTabPanelRect() : RectT();
    ConstructOSWindow(frame ? frame->GetPlatformWindow() : 0, rect);
    UI_SetNodeID(tabType_);
    if (osEventFunc) {
        UI_SetEventFunction(osEventFunc);
    }
    if (frame && workspace) {
        touchStamp_ = workspace->FreshTabTimeStamp();
    }
}

TabPanel::~TabPanel() = default;

bool TabPanel::HideWhenClosed() const {
    return workspace_ && workspace_->TabTypeHidesWhenClosed(tabType_);
}
bool TabPanel::ObliterateWhenClosed() const {
    return workspace_ && workspace_->TabTypeObliteratesWhenClosed(tabType_);
}
bool TabPanel::SaveStateWhenObliterated() const {
    return workspace_ && workspace_->TabTypeSavesStateWhenObliterated(tabType_);
}

void TabPanel::Touch() {
    if (frame_ && workspace_) {
        touchStamp_ = workspace_->FreshTabTimeStamp();
    }
}

void TabPanel::SetLocked(bool locked) {
    if (locked == locked_) {
        return;
    }
    locked_ = locked;
    if (auto* frame = dynamic_cast<WorkspaceFrame*>(frame_); frame && IsLockable()) {
        frame->TabPanelLockedChanged(*this);
    }
}

std::string TabPanel::SaveStateText() {
    orvcore::proplist::PropList state;
    SaveStateData(&state);
    std::string text;
    state.OutputAsXMLFragment(text);
    return text;
}

void TabPanel::SetName(std::u16string const& name) {
    name_ = name;
    if (frame_ && UI_GetParentNode()) {
        frame_->TabPanelNameChanged(*this);
    }
}

void TabPanel::SetTabColor(canvasor::ColorRGBA const& color) {
    tabColor_ = color;
    if (frame_ && UI_GetParentNode()) {
        frame_->TabColorChanged(*this);
    }
}

bool TabPanel::IsFocused() const {
    return workspace_ && workspace_->GetFocusedTabPanel() == this;
}

bool TabPanel::IsFrontmost() const {
    auto* frame = dynamic_cast<WorkspaceFrame*>(frame_);
    return frame && frame->GetTabWell()->FrontmostIsValid() &&
           frame->GetTabPanel(frame->GetFrontTabIndex()) == this;
}

void TabPanel::UI_Show(bool show) {
    OS_TabPanel::UI_Show(show);
    if (show && IsFrontmost()) {
        Touch();
    }
}

bool TabPanel::UI_AreAllParentsVisible() const {
    return OS_TabPanel::UI_AreAllParentsVisible() && IsFrontmost();
}

canvasor::SupplierInterface* TabPanel::UI_GetDrawSupplier() const {
    return workspace_ ? workspace_->GetDrawSupplier() : OS_TabPanel::UI_GetDrawSupplier();
}

bool TabPanel::UI_DoMouseEvent(UI_Node*, MouseEvent& event) {
    if (event.IsAction(action::Press) && wantsKeyboardFocus_ && !IsFocused() && workspace_) {
        workspace_->SetFocusedTabPanel(this);
        return true;
    }
    return false;
}

bool TabPanel::UI_DoMouseActivate() {
    if (wantsKeyboardFocus_ && workspace_) {
        workspace_->SetFocusedTabPanel(this);
    }
    return true;
}

void TabPanel::UI_FocusChanged(int reason) {
    // A panel may show its focus in what it draws; its frame repaints only its own borders.
    UI_Invalidate();
    if (UI_HasKeyboardFocus(false)) {
        Touch();
        if (workspace_) {
            workspace_->TabPanelGainedFocus(this);
        }
    }
    OS_TabPanel::UI_FocusChanged(reason);
}

void TabPanel::UI_Draw(canvasor::Canvasor& c) {
    c.FillRect(UI_GetLocalBounds(), GetColor(color::PanelBackground));
}

} // namespace orvworkspace::workspace
