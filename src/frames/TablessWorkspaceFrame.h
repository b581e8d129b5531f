// The frame of a static border element: exactly one panel, no tab well, and, when the panel is a
// rippable border element, a gripper strip of 8 units along its left side from which the panel is
// torn off. It adds no chrome to the panel's sizes and contributes no tabs to a saved document.
// Child 0 is the gripper (the toolkit's tabless dragger); the panel, when there is one, is child 1.
#pragma once

#include "frames/WorkspaceFrameBase.h"
#include "workspace/TabPanel.h"

#include <string>

namespace orvui::controls {
class UI_TablessDragger;
}

namespace orvworkspace::workspace {

class TablessWorkspaceFrame : public WorkspaceFrameBase {
public:
    static constexpr float GripperWidth = 8.0f;

    TablessWorkspaceFrame(TopLevelWindow* window, RectT const& rect);
    ~TablessWorkspaceFrame() override;

    // --- Layout host ---
    void SetSizeAndPos(FrameZones const& zones) override;
    PointT GetMinimumSize() const override;
    void GetSnapSizes(std::vector<PointT>& sizes) const override;
    RectT GetTabPanelFrameGlobalRect() const override { return RectT(); }
    RectT GetFrameLocalRect() const override { return RectT(); }
    RectT GetTabWellGlobalRect() const override { return RectT(); }
    RectT GetTabPanelRect() const override { return GetFrameRect(); }

    // --- The one panel ---
    long GetTabCount() const override { return panel_ ? 1 : 0; }
    long GetFrontTabIndex() const override { return 0; }
    TabPanel* GetTabPanel(long index) const override { return index == 0 ? panel_.get() : nullptr; }
    TabPanel* GetFrontTabPanel() const override { return panel_.get(); }
    TabPanel* GetTab() const { return panel_.get(); }
    boost::intrusive_ptr<TabPanel> DetachTabPanel(long index) override;
    // The panel replaces any previous one.
    virtual void AddTab(boost::intrusive_ptr<TabPanel> const& panel);
    virtual TabPanel* AddTab(std::string const& tabType);

    bool IsGripperShown() const { return gripperShown_; }
    orvui::controls::UI_TablessDragger* GetDragger() const;
    // A press on the gripper: the panel is torn off into a floating window.
    void HandleTabItemAction(int action, long index, RectT const* rect);

    void UI_Draw(canvasor::Canvasor& c) override;

private:
    void ArrangeChildren();

    boost::intrusive_ptr<TabPanel> panel_;
    bool gripperShown_ = false;
};

} // namespace orvworkspace::workspace
