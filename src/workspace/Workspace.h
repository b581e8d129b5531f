// The one object a host creates for its whole interface: the root container of every top-level
// window, the registry of tab creators, the source of panel identifiers and touch stamps, the owner
// of the single active mouse tracker, and where the library reports its events through empty hooks.
// Hosts derive from it. Windows are its children, in child order; it keeps no other list of them.
#pragma once

#include "host/core/Flags.h"
#include "host/ui/canvasor/Image.h"
#include "layout/LayoutManager.h"
#include "platform/OS_Tracker.h"
#include "platform/OS_Workspace.h"

#include <boost/smart_ptr/intrusive_ref_counter.hpp>
#include <functional>
#include <list>
#include <map>
#include <memory>
#include <set>
#include <string>
#include <vector>

namespace canvasor {
class SupplierInterface;
}
namespace orvcore::proplist {
class PropList;
}
namespace orvui::utility {
class MonitorInfo;
class ResourceManager;
} // namespace orvui::utility

namespace orvworkspace::workspace {

class TabCreator;
class TabPanel;
class Tracker;
class TopLevelWindow;
class WorkspaceFrame;

class Workspace : public OS_Workspace {
public:
    // The memory of one closed floating window: the tab types its layout held, its description with
    // every frame as a placeholder, and the panels kept alive because their type hides when closed.
    class WindowReanimateData : public boost::intrusive_ref_counter<WindowReanimateData> {
    public:
        // Remembers a window that is being removed (its hiding panels are taken out of it).
        WindowReanimateData(TopLevelWindow& window);
        // Reads a record of the workspace's instance data, taking kept panels from the pool.
        WindowReanimateData(Workspace& workspace, orvcore::proplist::PropList const& list,
                            std::list<boost::intrusive_ptr<TabPanel>>& pool);
        ~WindowReanimateData();
        WindowReanimateData(WindowReanimateData const&) = delete;
        WindowReanimateData& operator=(WindowReanimateData const&) = delete;

        std::set<std::string> tabTypes;
        std::list<boost::intrusive_ptr<TabPanel>> hiddenPanels;
        std::string windowXml;
    };
    using WindowReanimateDataP = boost::intrusive_ptr<WindowReanimateData>;

    enum WorkspaceImage { CloseBox = 0, Gripper = 1, DownArrow = 2 };

    explicit Workspace(canvasor::SupplierInterface* supplier = nullptr);
    ~Workspace() override;

    // --- Windows ---
    // Refuses (true, nothing removed) for the main window; removes the window's panels first, and
    // keeps the window when one of its frames refuses to close.
    bool ChildRequestRemove(boost::intrusive_ptr<orvui::ui::UI_Node> node) override;
    void CreateMainTopLevelWindow(OSEventFunction osEventFunc) override;
    virtual void MakeWindowPermanent(boost::intrusive_ptr<TopLevelWindow> window);
    virtual boost::intrusive_ptr<TopLevelWindow> AddTopLevelWindow(bool interim, RectT const* rect);
    virtual boost::intrusive_ptr<TopLevelWindow> CreateTopLevelWindow(bool interim, RectT const* rect);
    virtual bool RemoveWindow(TopLevelWindow* window, bool record);
    TopLevelWindow* GetMainTopLevelWindow() const;
    std::vector<TopLevelWindow*> GetWindows() const;

    // --- Tracker ---
    // The one tracker a drag holds; acquiring another destroys (and so ends) the previous one.
    OS_Tracker* GetTracker() const override { return tracker_.get(); }
    void SetTracker(std::unique_ptr<OS_Tracker> tracker) { tracker_ = std::move(tracker); }
    // Cancels the tracker first when asked, then destroys it, which ends it.
    void ReleaseTracker(bool cancel) override;
    // A splitter drag at a point in the window's local coordinates; null (and no tracker) when no
    // splitter bar is there.
    virtual Tracker* AcquireSplitterDragger(TopLevelWindow* window, PointT const& point);
    // A drag of a frame's tab (or of the whole frame); null when the frame has no such tab.
    virtual Tracker* AcquireTabDragger(WorkspaceFrame* sourceFrame, bool wholeFrame, unsigned long tabIndex);
    // Floating interim windows that carry dragged content with the pointer.
    virtual boost::intrusive_ptr<TopLevelWindow>
    CreateDragSrcWindow(RectT const& rect, PointT const& point, boost::intrusive_ptr<WorkspaceFrame> frame);
    virtual boost::intrusive_ptr<TopLevelWindow>
    CreateDragSrcWindow(RectT const& rect, PointT const& point,
                        std::vector<boost::intrusive_ptr<TabPanel>>& panels);
    // Sets the toolkit cursor through the resources, or straight on the desktop when a host runs
    // without resources (moving the mouse must never raise).
    void SetToolkitCursor(int cursor) const;

    // --- Host commands and hooks ---
    virtual void DoWorkspaceCmdNew() {}
    virtual void DoWorkspaceCmdDelete() {}
    virtual void DoWorkspaceCmdReset() {}
    virtual void NotifyObliterating(TabPanel*) {}
    virtual void NotifyPreOrphaning(TabPanel*) {}
    virtual void NotifyOrphaning(TabPanel*) {}
    virtual void NotifyRestoreWorkspaceBegin() {}
    virtual void NotifyRestoreWorkspaceEnd() {}
    virtual void NotifyTabDragBegin(TabPanel*) {}
    virtual void NotifyTabDragEnd(TabPanel*) {}
    virtual void NotifySplitterDragBegin(TopLevelWindow*) {}
    virtual void NotifySplitterDragEnd(TopLevelWindow*) {}
    virtual void NotifyTopLevelUserResizeBegin(TopLevelWindow*, bool) {}
    virtual void NotifyTopLevelUserResizeEnd(TopLevelWindow*, bool) {}
    virtual void OnTopLevelWindowActivated(TopLevelWindow*) {}
    virtual void OnTabPanelGainedFocus(TabPanel*) {}

    // --- Panels ---
    // A new panel of the type in the focused frame (or the main window, or a new window).
    virtual void NewTabInFocused(std::string const& tabType);
    virtual WorkspaceFrame* NewFrameInFocused(std::string const& tabType, LayoutManager::InsertionType side);
    virtual unsigned short GetTabMinWidth() const { return 35; }
    // Closes a tab: returns whether a panel was detached. Caching keeps what reopening it needs; an
    // emptied frame leaves the layout (keeping its place while it holds closed panels), and an
    // emptied floating window is removed.
    virtual bool RemoveTab(WorkspaceFrame* frame, long index, bool cacheData, bool honourObliterate);
    virtual bool RemoveTab(WorkspaceFrame* frame, TabPanel* panel, bool cacheData, bool honourObliterate);

    void RegisterTabCreator(TabCreator* creator);
    void UnregisterTabCreator(std::string const& tabType);
    TabCreator* FindCreator(std::string const& tabType) const;
    bool TabTypeHidesWhenClosed(std::string const& tabType) const;
    bool TabTypeObliteratesWhenClosed(std::string const& tabType) const;
    bool TabTypeSavesStateWhenObliterated(std::string const& tabType) const;

    unsigned long NewUniqueID() { return nextUniqueID_++; }
    unsigned long FreshTabTimeStamp() { return ++freshTabTimeStamp_; }
    void SetFreshTabTimeStamp(unsigned long value) { freshTabTimeStamp_ = value; }
    void SetCreateTabPanelAssertionMode(bool on) { createTabPanelAssertionCount_ += on ? 1 : -1; }
    bool GetCreateTabPanelAssertionMode() const { return createTabPanelAssertionCount_ != 0; }
    void SetLayoutEnabled(bool enabled);
    bool GetLayoutEnabled() const { return layoutDisableCount_ == 0; }
    void SetSplitterSnappingEnabled(bool enabled) { splitterSnappingEnabled_ = enabled; }
    bool GetSplitterSnappingEnabled() const { return splitterSnappingEnabled_; }
    static void SetDragTabSoundFeedbackEnabled(bool enabled) { dragTabSoundFeedbackEnabled = enabled; }
    static bool GetDragTabSoundFeedbackEnabled() { return dragTabSoundFeedbackEnabled; }

    // --- Focus ---
    // The panel at or above the keyboard-focus leaf; focus is never stored here.
    TabPanel* GetFocusedTabPanel() const;
    void SetFocusedTabPanel(TabPanel* panel);
    void TabPanelGainedFocus(TabPanel* panel) { OnTabPanelGainedFocus(panel); }
    TabPanel* GetLastTouchedTabPanel() const;
    TabPanel* GetTabPanelFromPos(PointT const& global) const;

    // --- Windows en masse ---
    void InvalidateTopLevelWindows();
    void UpdateNowTopLevelWindows(orvcore::utility::Flags<unsigned long> flags);
    void ReLayoutTopLevelWindows();
    void RemoveTabPanels();
    void DestroyTabPanels();
    // --- Closed windows ---
    void ClearRemovedWindowData() { removedWindowData_.clear(); }
    std::list<WindowReanimateDataP> const& GetRemovedWindowData() const { return removedWindowData_; }
    bool CanReanimateWindow(std::string const& tabType) const;
    bool CanReanimateWindow(boost::intrusive_ptr<TabPanel> const& panel) const;
    // Rebuilds the first remembered window that held the type (or the panel); true when one came back.
    bool ReanimateWindow(std::string const& tabType);
    bool ReanimateWindow(boost::intrusive_ptr<TabPanel> const& panel);
    // Every kept panel: hidden tabs of frames and hidden frames (taken from them), then those of the
    // closed-window records (which keep them too).
    void FindAllHiddenTabs(std::list<boost::intrusive_ptr<TabPanel>>& out);
    void SaveWorkspaceData(orvcore::proplist::PropList& list) const;
    void ReadWorkspaceData(orvcore::proplist::PropList const& list,
                           std::list<boost::intrusive_ptr<TabPanel>>& pool);
    void BringAppToFront();

    // --- Drawing and resources ---
    canvasor::SupplierInterface* GetDrawSupplier() const { return drawSupplier_; }
    void SetDrawSupplier(canvasor::SupplierInterface* supplier) { drawSupplier_ = supplier; }
    canvasor::SupplierInterface* GetOSDrawSupplier() const;
    orvui::utility::MonitorInfo* ORV_GetMonitorInfo() const { return monitorInfo_.get(); }
    void ResetDisplaySettings();
    canvasor::FileImageP GetImage(WorkspaceImage image) const;
    // The library's resources; raises UnableToAccessResource when there are none.
    orvui::utility::ResourceManager* GetResourceManager() const;
    // A host may supply its own resources (or none); images are looked up again.
    void SetResourceManager(std::unique_ptr<orvui::utility::ResourceManager> manager);
    void DrawDockProgress(int, int) {}

protected:
    void HandleUserResize(bool begin, orvui::ui::UI_Node* node, bool flag);

private:
    struct LayoutDisabled;
    // Runs the action on every window with layout off, forgets closed windows, then lays out again.
    boost::intrusive_ptr<TopLevelWindow> ShowDragSrcWindow(boost::intrusive_ptr<TopLevelWindow> window,
                                                           RectT const& rect, PointT const& point,
                                                           bool wholeFrame);
    void ForEachWindowWithLayoutOff(std::function<void(TopLevelWindow&)> const& action);

    std::unique_ptr<OS_Tracker> tracker_;
    // Trackers released from inside one of their own steps; destroyed once nothing runs in them.
    std::vector<std::unique_ptr<OS_Tracker>> retiredTrackers_;
    void DestroyIdleRetiredTrackers();
    unsigned long freshTabTimeStamp_ = 0;
    unsigned long nextUniqueID_ = 0;
    long createTabPanelAssertionCount_ = 0;
    std::map<std::string, std::unique_ptr<TabCreator>> tabCreators_;
    bool splitterSnappingEnabled_ = true;
    bool settingFocus_ = false;
    long layoutDisableCount_ = 0;
    canvasor::SupplierInterface* drawSupplier_;
    std::unique_ptr<orvui::utility::MonitorInfo> monitorInfo_;
    mutable canvasor::FileImageP images_[3];
    mutable bool imagesLoaded_[3] = {false, false, false};
    bool recordRemovedWindows_ = true;
    std::list<WindowReanimateDataP> removedWindowData_;
    // Windows whose removal is under way; a nested request for one of them leaves it to the outer one.
    std::set<TopLevelWindow*> windowsBeingRemoved_;
    bool RebuildWindow(WindowReanimateData const& record,
                       std::function<void(TopLevelWindow&)> const& bringBack);
    std::unique_ptr<orvui::utility::ResourceManager> resourceManager_;
    static inline bool dragTabSoundFeedbackEnabled = false;
};

} // namespace orvworkspace::workspace
