// What every frame of a window has: its leaf in the window's split tree, the zone rectangles the
// layout gave it (kept relative to the frame), its workspace and window, and the size rules the
// layout asks of it. The tabbed frame (WorkspaceFrame) and the tabless frame derive from it.
#pragma once

#include "layout/Frame.h"
#include "layout/FrameHostInterface.h"
#include "platform/OS_ChildWindows.h"

namespace orvworkspace::workspace {

class TabPanel;
class TopLevelWindow;
class Workspace;

class WorkspaceFrameBase : public FrameHostInterface, public OS_WorkspaceFrame {
public:
    explicit WorkspaceFrameBase(TopLevelWindow* window);
    ~WorkspaceFrameBase() override;

    // --- FrameHostInterface ---
    void SetSizeAndPos(FrameZones const& zones) override;
    void ShowFrame(bool show) override { UI_Show(show); }
    bool IsFrameShown() const override { return UI_IsShown(); }
    PointT GetMinimumSize() const override;
    void GetSnapSizes(std::vector<PointT>&) const override {}
    RectT FrameRectToTabPanelRect(RectT const& r) const override { return r; }
    RectT FrameRectToTabWellRect(RectT const& r) const override { return r; }
    RectT GetTabPanelFrameGlobalRect() const override;
    RectT GetFrameLocalRect() const override;
    RectT GetTabWellGlobalRect() const override;
    void* GetHostData() override { return this; }
    void DoGetTabData(TabDataList&, TabDataList&, TabDataList&) const override {}

    // --- Frames ---
    virtual RectT GetTabPanelRect() const;
    virtual void TabPanelNameChanged(TabPanel const&) {}
    virtual void TabColorChanged(TabPanel const&) {}
    virtual long GetTabCount() const = 0;
    virtual long GetFrontTabIndex() const = 0;
    virtual TabPanel* GetTabPanel(long index) const = 0;
    // Takes a panel out of the frame and hands it to the caller.
    virtual boost::intrusive_ptr<TabPanel> DetachTabPanel(long index) = 0;
    virtual TabPanel* GetFrontTabPanel() const = 0;
    virtual bool TabsAreReorderable() const { return false; }
    // 0: tabs along the top; 1: along the side.
    virtual int GetTabPosition() const { return 0; }
    virtual void ConvertTabToFrameSize(PointT& size) const;
    virtual void ConvertFrameToTabSize(PointT& size) const;

    // Stores the zones, made relative to the frame (zone 5 then starts at 0, 0).
    void SetZoneRects(FrameZones const& zones);
    FrameZones const& GetZones() const { return zones_; }
    RectT GetFrameZoneRect(int index) const { return zones_[index]; }
    // Zone 4: the area inside the edge zones.
    RectT GetFrameRect() const { return zones_[FrameZones::Interior]; }
    // Zone 5: the whole frame.
    RectT GetTabContentRect() const { return zones_[FrameZones::Whole]; }
    Workspace* GetWorkspace() const { return workspace_; }
    TopLevelWindow* GetTopLevelWindow() const { return window_; }
    // Moves the frame to another window: its layout element then belongs to that window's layout.
    void SetTopLevelWindow(TopLevelWindow* window);
    Frame* GetLMFrame() { return &frame_; }
    Frame const* GetLMFrame() const { return &frame_; }

    // The frame's border: colour 284 along its edges (290 while it holds the focus) on 293.
    virtual void DrawBorders(canvasor::Canvasor* c);
    void UI_Draw(canvasor::Canvasor& c) override;
    void UI_FocusChanged(int reason) override;
    // Tab does not walk out of a frame into the next one.
    bool AllowFocusToAdvanceFromChildren() const override { return false; }

protected:
    RectT LocalToWindow(RectT const& r) const;
    RectT WindowToLocal(RectT const& r) const;

private:
    FrameZones zones_;
    Workspace* workspace_;
    TopLevelWindow* window_;
    Frame frame_;
};

} // namespace orvworkspace::workspace
