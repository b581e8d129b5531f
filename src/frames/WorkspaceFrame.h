// The tabbed frame: a tab well along the top (or the side) and a stack of panels below it, the front
// one shown. It remembers closed panels so they can be reopened in place: the tab type and saved
// state of destroyed ones (removed-tab data) and the panels themselves when they only hide.
// Child 0 is the tab well and child 1 the panel container; tab i and panel i are the same panel.
#pragma once

#include "frames/TabPanelContainer.h"
#include "frames/WorkspaceFrameBase.h"
#include "host/ui/controls/TabWell.h"
#include "workspace/TabPanel.h"

#include <list>
#include <string>
#include <vector>

namespace orvui::utility {
class OS_Menu;
}

namespace orvworkspace::workspace {

class Splitter;

class WorkspaceFrame : public WorkspaceFrameBase {
public:
    WorkspaceFrame(TopLevelWindow* window, RectT const& rect);
    ~WorkspaceFrame() override;

    // --- Layout host ---
    void SetSizeAndPos(FrameZones const& zones) override;
    PointT GetMinimumSize() const override;
    void GetSnapSizes(std::vector<PointT>& sizes) const override;
    RectT FrameRectToTabPanelRect(RectT const& r) const override;
    RectT FrameRectToTabWellRect(RectT const& r) const override;
    void DoGetTabData(TabDataList& visible, TabDataList& removed, TabDataList& hidden) const override;

    // --- Tabs ---
    long GetTabCount() const override;
    long GetFrontTabIndex() const override;
    TabPanel* GetTabPanel(long index) const override;
    TabPanel* GetFrontTabPanel() const override;
    boost::intrusive_ptr<TabPanel> DetachTabPanel(long index) override;
    bool TabsAreReorderable() const override { return true; }
    int GetTabPosition() const override;
    void ConvertTabToFrameSize(PointT& size) const override;
    void ConvertFrameToTabSize(PointT& size) const override;
    void ConvertTabToFrameSizeIgnoreScrollbar(PointT& size) const;
    void ConvertFrameToTabSizeIgnoreScrollbar(PointT& size) const;
    RectT GetTabPanelRect() const override;
    RectT GetTabWellRect() const;

    void AddTab(boost::intrusive_ptr<TabPanel> panel, long index, bool select);
    void AddTab(boost::intrusive_ptr<TabPanel> panel, bool select) {
        AddTab(std::move(panel), GetTabCount(), select);
    }
    // A new panel of a type from its creator; null when there is none.
    TabPanel* AddTab(std::string const& tabType, bool select);
    // Moves the other frame's tabs here (in order), then its removed and hidden tabs.
    void AddTabs(WorkspaceFrame* other);
    void AddTabs(std::vector<boost::intrusive_ptr<TabPanel>> const& panels);
    void AddTabs(std::vector<std::string> const& tabTypes);
    // The tab index of a panel, or -1.
    long IndexOf(TabPanel const* panel) const;
    void BringTabToFront(long index);
    void BringTabToFront(TabPanel* panel);
    void MoveTabPanel(long from, long to);
    // A tab's item rectangle in frame coordinates, rounded down.
    bool GetTabRect(long index, RectT& out) const;
    bool GetTabIndexFromPos(PointT const& global, long& index) const;
    // Every tab's rectangle (frame coordinates), in tab order.
    std::vector<RectT> GetTabRects() const;
    // The tab under a global point among the given rectangles (the current ones when none).
    bool GetTabInsertIndexFromPos(PointT const& global, long& index,
                                  std::vector<RectT> const* tabRects) const;
    orvui::controls::UI_TabWell* GetTabWell() const;
    TabPanelContainer* GetContainer() const;

    void TabPanelNameChanged(TabPanel const& panel) override;
    void TabColorChanged(TabPanel const& panel) override;
    void TabPanelCanCloseChanged(TabPanel const& panel);
    void TabPanelLockableChanged(TabPanel const& panel);
    void TabPanelLockedChanged(TabPanel const& panel);
    void TabPanelMultitabChanged(TabPanel const& panel);

    // --- Closing ---
    bool AllowFrameClose() const;
    void RemoveAllTabs(bool obliteratingOnly);
    // Keeps what reopening a closed panel here needs: the panel itself, or its type and state.
    void CacheTabData(boost::intrusive_ptr<TabPanel> const& panel, bool keepPanel);
    bool HasHiddenTabs() const { return !hiddenTabs_.empty(); }
    std::list<boost::intrusive_ptr<TabPanel>> const& HiddenTabs() const { return hiddenTabs_; }
    void DetachHiddenTabs();
    void DestroyHiddenTabs() { hiddenTabs_.clear(); }
    bool HasRemovedTabData() const { return !removedTabData_.empty(); }
    TabDataList const& GetRemovedTabData() const { return removedTabData_; }
    void AddRemovedTabData(std::string const& tabType, std::string const& state);
    void SetRemovedTabData(TabDataList const& data) { removedTabData_ = data; }
    bool CanReanimateTab(std::string const& tabType) const;
    bool CanReanimateTab(TabPanel const* panel) const;
    TabPanel* ReanimateTab(std::string const& tabType);
    bool ReanimateTab(boost::intrusive_ptr<TabPanel> const& panel);

    // Whether every other panel of the workspace of this tab's type may close (and there is one).
    bool AllowCloseOtherSimilar(long index) const;
    void RemoveOtherSimilarTabs(long index, bool obliteratingOnly);

    // --- Flyout menu ---
    // The frame's commands; a panel's own commands are positive numbers.
    enum FlyoutCommand : long {
        UndockPanel = -1,
        UndockFrame = -2,
        ClosePanel = -3,
        CloseOtherSimilarPanels = -4,
        CloseFrame = -5,
        MaximizeFrame = -6,
    };
    static unsigned long CommandNumber(FlyoutCommand command) {
        return static_cast<unsigned long>(long(command));
    }
    // Fills the flyout menu of a tab: the frame's items, enabled as they apply, then (for the front
    // tab) the panel's own.
    void PopulateTabMenu(long index, orvui::utility::OS_Menu& menu) const;
    // Shows the flyout menu of a tab (as a popup under the global rectangle, or as a context menu at
    // its corner) and carries out the chosen command.
    void DoTabMenu(long index, bool asContextMenu, RectT const* rect);
    void DoTabMenuCommand(long index, unsigned long command);
    // Moves a tab's panel, or the whole frame, into a new floating window over the panel's place.
    void Undock(long index, bool wholeFrame);

    // --- Neighbours in the split tree ---
    // The first shown frame other than this one among the splitter's children, then in its child
    // splitters, searched from the left or top side first when asked; side tells where it was found
    // (fromLeftOrTop: 3 across a horizontal bar, 4 across a vertical one; otherwise 1 or 2).
    Frame* RecurseFindFirstVisibleFrame(Splitter* splitter, bool fromLeftOrTop, long& side) const;
    void RecurseCountVisibleFrames(Splitter* splitter, long& count) const;
    // The nearest shown frame beside this one, or null.
    WorkspaceFrame* GetNearestVisibleSibling(long& side) const;

    // The tab well's gestures.
    void HandleTabItemAction(int action, long index, RectT const* rect);
    void SetTabMargin(float margin);
    void RestoreDefaultMargin();

    void UI_FocusChanged(int reason) override;
    bool UI_DoMouseEvent(orvui::ui::UI_Node* target, orvui::ui::MouseEvent& event) override;

private:
    // Starts a drag of a tab (or of the whole frame) at the pointer.
    void OfferTabDrag(bool wholeFrame, long index);

    void UpdateForTabContainerChanges();
    void FocusFrontPanel();

    RectT cachedTabPanelRect_{-1, -1, -1, -1};
    // The tab well and panel container made with the frame, so that asking for them (as layout and
    // every tab query do) needs no type check while they are still children 0 and 1. Held, so that
    // no other node can take their addresses.
    boost::intrusive_ptr<orvui::controls::UI_TabWell> well_;
    boost::intrusive_ptr<TabPanelContainer> container_;
    TabDataList removedTabData_;
    std::list<boost::intrusive_ptr<TabPanel>> hiddenTabs_;
};

using WorkspaceFrameP = boost::intrusive_ptr<WorkspaceFrame>;

} // namespace orvworkspace::workspace
