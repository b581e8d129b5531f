// One dockable panel: the content a frame shows under one tab. Hosts derive their panels from it.
// A panel carries its unique identifier, tab type (also its node ID), user-visible name, tab colour,
// lock state and last-touched stamp, and saves and restores its own state through private hooks.
// Panels are reference-counted nodes held through intrusive pointers.
#pragma once

#include "host/ui/canvasor/Color.h"
#include "layout/LayoutTypes.h"
#include "platform/OS_ChildWindows.h"

#include <string>
#include <vector>

namespace orvcore::proplist {
class PropList;
}
namespace orvui::utility {
class OS_Menu;
}

namespace orvworkspace::workspace {

class Workspace;
class WorkspaceFrameBase;

class TabPanel : public OS_TabPanel {
public:
    using OSEventFunction = void (*)(orvui::ui::OS_Event*);

    struct MegaZoomContentTrim {
        long left = 0, top = 0, right = 0, bottom = 0;
    };

    TabPanel(Workspace* workspace, WorkspaceFrameBase* frame, bool wantsKeyboardFocus, std::string tabType,
             std::u16string const& name, OSEventFunction osEventFunc = nullptr, bool flag = false);
    ~TabPanel() override;

    virtual std::u16string GetDisplayName() const { return GetName(); }
    virtual bool HideWhenClosed() const;
    virtual bool ObliterateWhenClosed() const;
    virtual bool SaveStateWhenObliterated() const;
    virtual bool AllowClose() const { return true; }
    // Whether the panel may show in a frame without tabs.
    virtual bool AllowTabless() const { return false; }
    virtual void NotifyTopLevelWindowIsClosing() {}
    virtual void NotifyFrameIsClosing() {}
    virtual void NotifyOrientationChanged(bool) {}
    // Marks the panel as the last touched one (with a frame only).
    virtual void Touch();
    virtual bool IsMultiPaned() const { return false; }
    virtual bool IsLockable() const { return false; }
    virtual bool GetLocked() const { return locked_; }
    virtual void SetLocked(bool locked);
    virtual void ToggleLock() { SetLocked(!GetLocked()); }
    virtual void HandleMultiPaneClick(RectT const&) {}
    // The panel's own items in the frame's flyout menu, and their commands.
    virtual void PopulateFlyoutMenu(orvui::utility::OS_Menu&) {}
    virtual bool DoFlyoutMenuCommand(unsigned long) { return false; }
    virtual MegaZoomContentTrim GetMegaZoomContentTrim() const { return {}; }

    void GetSnapSizes(std::vector<PointT>& sizes) const { DoGetSnapSizes(sizes); }
    void SaveStateData(orvcore::proplist::PropList* list) { DoSaveStateData(list); }
    void LoadStateData(orvcore::proplist::PropList* list) { DoLoadStateData(list); }
    // The XML fragment of the panel's saved state.
    std::string SaveStateText();

    unsigned long GetID() const { return id_; }
    unsigned long GetTouchStamp() const { return touchStamp_; }
    std::string GetTabType() const { return tabType_; }
    bool WantsFocus() const { return wantsKeyboardFocus_; }
    WorkspaceFrameBase* GetFrame() const { return frame_; }
    void SetFrame(WorkspaceFrameBase* frame) { frame_ = frame; }
    Workspace* GetWorkspace() const { return workspace_; }
    std::u16string const& GetName() const { return name_; }
    void SetName(std::u16string const& name);
    canvasor::ColorRGBA GetTabColor() const { return tabColor_; }
    void SetTabColor(canvasor::ColorRGBA const& color);
    void EnableCloseOtherSimilarPanels(bool enable) { closeOtherSimilarPanelsEnabled_ = enable; }
    bool IsCloseOtherSimilarPanelsEnabled() const { return closeOtherSimilarPanelsEnabled_; }
    std::u16string const& GetCustomCloseOtherSimilarPanelsDisplayString() const {
        return customCloseOtherSimilar_;
    }
    void SetCustomCloseOtherSimilarPanelsDisplayString(std::u16string const& text) {
        customCloseOtherSimilar_ = text;
    }

    // The workspace's focused panel is this one.
    bool IsFocused() const;
    // This panel is its frame's front tab.
    bool IsFrontmost() const;
    // A hook for rewriting display names; leaves the text as it is.
    static void TransformDisplayName(std::u16string&) {}

    void UI_Show(bool show) override;
    bool UI_AreAllParentsVisible() const override;
    canvasor::SupplierInterface* UI_GetDrawSupplier() const override;
    bool UI_DoMouseEvent(orvui::ui::UI_Node* target, orvui::ui::MouseEvent& event) override;
    bool UI_DoMouseActivate() override;
    bool UI_WantsKeyboardFocus() const override { return wantsKeyboardFocus_; }
    void UI_FocusChanged(int reason) override;
    void UI_Draw(canvasor::Canvasor& c) override;

private:
    virtual void DoGetSnapSizes(std::vector<PointT>&) const {}
    virtual void DoSaveStateData(orvcore::proplist::PropList*) {}
    virtual void DoLoadStateData(orvcore::proplist::PropList*) {}

    unsigned long id_;
    unsigned long touchStamp_ = 0;
    std::string tabType_;
    bool wantsKeyboardFocus_;
    bool locked_ = false;
    WorkspaceFrameBase* frame_;
    Workspace* workspace_;
    bool closeOtherSimilarPanelsEnabled_ = false;
    std::u16string customCloseOtherSimilar_;
    std::u16string name_;
    canvasor::ColorRGBA tabColor_;
};

using TabPanelP = boost::intrusive_ptr<TabPanel>;

} // namespace orvworkspace::workspace
