// One top-level window of the workspace: its client area is laid out by one LayoutManager, whose
// host it is, and its frames are its child nodes. It creates and removes frames, keeps frames that
// still hold hidden panels, brings closed frames back, and answers the geometry of the edge drop
// zones. One window is the main window (never removed); others float, owned by it.
#pragma once

#include "frames/WorkspaceFrame.h"
#include "host/ui/canvasor/Color.h"
#include "layout/DropZone.h"
#include "layout/LayoutManager.h"
#include "platform/OS_TopLevelWindow.h"
#include "workspace/DropZoneOverlay.h"

#include <list>
#include <memory>
#include <string>
#include <vector>

namespace orvworkspace::workspace {

class TablessWorkspaceFrame;
class TabPanel;
class Workspace;
class WorkspaceFrame;
class WorkspaceFrameBase;

class TopLevelWindow : public OS_TopLevelWindow {
public:
    using OSEventFunction = void (*)(orvui::ui::OS_Event*);

    // The default rectangle of a floating window.
    static constexpr RectT DefaultRect{100, 100, 640, 480};

    // The main window, over the host's application window.
    TopLevelWindow(Workspace* workspace, OSEventFunction osEventFunc, bool flag);
    // A floating window owned by the main window, at rect (or the default one).
    TopLevelWindow(Workspace* workspace, bool interim, RectT const* rect,
                   OSEventFunction osEventFunc = nullptr, bool flag = false);
    ~TopLevelWindow() override;

    // --- LayoutManagerHostInterface ---
    bool GetSplitterSnappingEnabled() override;
    bool GetLayoutEnabled() override;
    long GetTabMinHeight() override;
    long GetTabMinWidth() override;

    bool IsMain() const { return main_; }
    bool IsInterim() const { return interim_; }
    bool AcceptsTabs() const { return acceptsTabs_; }
    void SetAcceptsTabs(bool accepts) { acceptsTabs_ = accepts; }
    LayoutManager* GetLayoutManager() const { return layoutManager_.get(); }
    Workspace* GetWorkspace() const { return workspace_; }

    virtual void MakePermanent();
    virtual void Activate(bool focusPanel);

    // --- Frames ---
    virtual boost::intrusive_ptr<WorkspaceFrame>
    CreateWorkspaceFrame(std::vector<boost::intrusive_ptr<TabPanel>>& panels);
    virtual boost::intrusive_ptr<WorkspaceFrame>
    CreateWorkspaceFrame(std::vector<std::string> const& tabTypes);
    virtual boost::intrusive_ptr<WorkspaceFrame> CreateWorkspaceFrame(boost::intrusive_ptr<TabPanel> panel);
    virtual boost::intrusive_ptr<WorkspaceFrame> CreateWorkspaceFrame(std::string const& tabType);
    virtual boost::intrusive_ptr<WorkspaceFrame> CreateWorkspaceFrame(RectT const& rect);
    virtual boost::intrusive_ptr<WorkspaceFrame> CreateWorkspaceFrame();
    virtual boost::intrusive_ptr<TablessWorkspaceFrame> CreateTablessFrame(RectT const& rect);
    // Makes the frame the whole layout.
    virtual void SetRootFrame(boost::intrusive_ptr<WorkspaceFrame> frame, bool select);
    virtual WorkspaceFrame* CreateRootFrame(std::string const& tabType, bool select, bool show);
    virtual WorkspaceFrame* CreateRootFrame(boost::intrusive_ptr<TabPanel> panel, bool select);
    virtual WorkspaceFrame* CreateRootFrame(std::vector<std::string> const& tabTypes, bool select);
    virtual WorkspaceFrame* CreateRootFrame(std::vector<boost::intrusive_ptr<TabPanel>>& panels, bool select);
    // The first shown child frame; with none shown, the last child frame; null when there is none.
    virtual WorkspaceFrame* GetRootFrame() const;
    virtual unsigned long GetFrameCount() const;
    virtual WorkspaceFrame* GetFrame(unsigned long index) const;
    // Puts a frame beside another (beside the whole layout when null).
    virtual void AddTabbedFrame(WorkspaceFrameBase* beside, boost::intrusive_ptr<WorkspaceFrame> frame,
                                LayoutManager::InsertionType side);
    virtual WorkspaceFrame* AddTabbedFrame(WorkspaceFrameBase* beside, std::string const& tabType,
                                           LayoutManager::InsertionType side);
    virtual WorkspaceFrame* AddTabbedFrame(WorkspaceFrameBase* beside,
                                           std::vector<boost::intrusive_ptr<TabPanel>>& panels,
                                           TabPanel* front, LayoutManager::InsertionType side);
    // Takes a frame out of the layout and the window; one that still holds hidden panels is kept hidden
    // when its place is kept.
    virtual void RemoveFrame(boost::intrusive_ptr<WorkspaceFrameBase> frame, bool keepPlace);
    // A host's window answers true to offer mega zoom.
    virtual bool CanMegaZoom() const { return false; }
    bool UI_IsRootViewOpaque() const override;

    WorkspaceFrame* GetFrameFromLMFrame(Frame const* frame) const;
    // The first shown frame whose inner rectangle holds a global point.
    WorkspaceFrame* GetFrameFromPos(PointT const& global) const;
    TabPanel* GetLastTouchedTabPanel() const;

    // --- Closed frames ---
    bool HasReanimatableFrames() const { return layoutManager_->HasAnyReanimatableFrames(); }
    bool CanReanimateFrame(std::string const& tabType) const;
    bool CanReanimateFrame(boost::intrusive_ptr<TabPanel> const& panel) const;
    bool ReanimateFrame(std::string const& tabType);
    bool ReanimateFrame(boost::intrusive_ptr<TabPanel> const& panel);
    std::list<boost::intrusive_ptr<WorkspaceFrame>> const& HiddenFrames() const { return hiddenFrames_; }
    void AddHiddenFrame(boost::intrusive_ptr<WorkspaceFrame> const& frame);
    // Hands the hidden frames to the caller and forgets them (a restore replaces them).
    std::list<boost::intrusive_ptr<WorkspaceFrame>> TakeHiddenFrames() { return std::move(hiddenFrames_); }
    void DestroyHiddenFrames();
    void RemoveTabPanels(bool flag);
    void DestroyTabPanels();

    // --- Static elements: one panel in a tabless frame kept along a window edge ---
    void SetStaticElement(boost::intrusive_ptr<TabPanel> const& panel, LayoutManager::InsertionType side,
                          bool relayout);
    TabPanel* SetStaticElement(std::string const& tabType, LayoutManager::InsertionType side, bool relayout);
    TabPanel* GetStaticElement(LayoutManager::InsertionType side) const;
    bool HasStaticElement(LayoutManager::InsertionType side) const;
    void RemoveStaticElement(LayoutManager::InsertionType side, bool relayout);

    // --- Mega zoom: the window made to fill a monitor ---
    enum MegaZoomType { FitToMonitor = 0, ZoomContentToMonitor = 1, ZoomToPreferredSize = 2 };
    // The primary monitor when asked for and present, else the monitor holding the window.
    RectT GetMegaZoomMonitor(bool primary) const;
    void MegaZoom(MegaZoomType type, bool primary, RectT const* monitor = nullptr);
    // Cycles fit, content zoom, preferred size (when there is one), fit.
    void MegaZoomToggle(bool primary);
    bool IsMegaZoomedToWindow() const;
    bool IsMegaZoomedToPreferredSize() const;

    // --- Edge drop zones ---
    // The hit (thin) or display rectangle of an edge zone in screen coordinates.
    void GetEdgeDropZoneRect(DropZone::DropType type, RectT& out, bool hitArea) const;
    // The edge zone under a screen point (Left, Top, Right, Bottom tried in that order), or None.
    DropZone::DropType GetEdgeDropZone(PointT const& point, RectT& outRect,
                                       std::vector<PointT>& outPolygon) const;
    void CalculateDropZoneExclusionsForEdges(RectT const& area, std::vector<long>& exclusions) const;

    // --- Drop-zone overlays (while a tab is dragged) ---
    // An edge overlay when the point is on an allowed edge, else a frame overlay for frame; stored as
    // this window's overlay (the previous one destroyed). Null, and no overlay, when neither applies.
    DropZoneOverlayWindow* CreateDropZoneOverlay(TabDragger* dragger, PointT const& point,
                                                 WorkspaceFrame* frame);
    DropZoneOverlayWindow* CreateEdgeDropZoneOverlay(TabDragger* dragger, PointT const& point);
    DropZoneOverlayWindow* CreateFrameDropZoneOverlay(TabDragger* dragger, PointT const& point,
                                                      WorkspaceFrame* frame);
    void DestroyDropZoneOverlay();
    DropZoneOverlayWindow* GetDropZoneOverlay() const { return dropZoneOverlay_.get(); }
    EdgeDropZoneOverlayWindow* GetEdgeDropZoneOverlay() const;
    FrameDropZoneOverlayWindow* GetFrameDropZoneOverlay() const;

    // Moves an interim window so that the grip of what it carries (the front tab's gripper, or the
    // flyout gripper for a whole frame) is centred under the pointer, kept on the pointer's monitor.
    void SetDragPosition(PointT const& point, bool wholeFrame);

    // The outer rectangle so that the root frame's front panel covers a screen rectangle.
    void SetToGlobalTabSize(RectT const& rect);
    // A built tree swapped in with the frames it holds.
    void ResetRootFrame(Splitter* splitter, std::vector<boost::intrusive_ptr<WorkspaceFrame>>& frames);

    // --- Toolkit ---
    void UI_Draw(canvasor::Canvasor& c) override;
    void UI_GetDrawSegments(std::vector<RectF>& segments) const override;
    canvasor::SupplierInterface* UI_GetDrawSupplier() const override;
    bool UI_DoCursor(PointF local) override;
    bool UI_DoKeyboardEvent(orvui::ui::KeyboardEvent& event) override;
    bool UI_WantsKeyboardFocus() const override { return false; }
    void UI_ActivationChanged(bool active) override;
    void UI_SizeChanged() override;

protected:
    TablessWorkspaceFrame* GetBorderFrame(LayoutManager::InsertionType side) const;
    bool CanZoomToPreferredPanelSize() const;
    // The single frame's preferred panel size; (0, 0) for the main window or several frames.
    PointT GetSingleWorkspaceFramePreferredTabSize() const;
    bool HasSingleWorkspaceFrame() const { return GetFrameCount() == 1; }

private:
    // Makes a frame from elsewhere (another window, or none) one of this window's.
    void AdoptFrame(WorkspaceFrame* frame);
    RectT ClientRectInScreen() const;
    RectT ClientLocalRect() const;
    RectT AreaWithoutStaticFrames() const;

    bool interim_;
    boost::intrusive_ptr<DropZoneOverlayWindow> dropZoneOverlay_;
    bool main_;
    bool acceptsTabs_ = true;
    std::unique_ptr<LayoutManager> layoutManager_;
    Workspace* workspace_;
    std::list<boost::intrusive_ptr<WorkspaceFrame>> hiddenFrames_;
};

using TopLevelWindowP = boost::intrusive_ptr<TopLevelWindow>;

} // namespace orvworkspace::workspace
