// What a host's Window menu and key commands call: searches over every panel of a workspace (by
// type, by node ID, by panel number), visitors, toggles that show, bring forward or close a panel
// of a type, frame maximisation, focus cycling, and the parent for modal dialogs.
//
// Every search follows the tab walk: the workspace's windows in child order, each window's tabbed
// frames in child order (tabless frames, which hold bars and borders, are not visited), each
// frame's tabs in order. One process-wide recursive lock is held for each walk and each toggle, so
// a visitor or a host hook may search again from inside a walk.
#pragma once

#include "host/ui/UITypes.h"

#include <boost/intrusive_ptr.hpp>
#include <list>
#include <string>

namespace orvui::ui {
class OS_Window;
}

namespace orvworkspace::workspace {

class TabPanel;
class TopLevelWindow;
class Workspace;
class WorkspaceFrame;

namespace WorkspaceUtils {

class TabVisitor {
public:
    virtual ~TabVisitor() = default;
    // False stops the walk.
    virtual bool VisitTab(TabPanel* tab) = 0;
};

class ConstTabVisitor {
public:
    virtual ~ConstTabVisitor() = default;
    // False stops the walk.
    virtual bool VisitTab(TabPanel const* tab) = 0;
};

// Calls the visitor for each tab until it returns false; false when the visitor stopped the walk.
bool VisitEachTab(Workspace const& workspace, TabVisitor& visitor);
bool VisitEachTab(Workspace const& workspace, ConstTabVisitor& visitor);

// Appends every panel of the type to out, in walk order, and its index within its frame to indices.
void FindAllTabsOfType(Workspace const& workspace, std::string const& tabType, std::list<TabPanel*>& out,
                       std::list<long>* indices = nullptr);
// The first panel of the type, or null; index receives its index within its frame.
TabPanel* FindFirstTabOfType(Workspace const& workspace, std::string const& tabType, long* index = nullptr);
// The first panel whose node ID is id; an empty id finds nothing.
TabPanel* FindTabFromID(Workspace const& workspace, std::string const& id);
TabPanel* FindTabFromID(TopLevelWindow const& window, std::string const& id);
// The first window whose node ID is id; an empty id finds nothing.
TopLevelWindow* FindTopLevelWindowFromID(Workspace const& workspace, std::string const& id);
// The panel with the workspace-wide number id (TabPanel::GetID), or null.
TabPanel* FindTabFromTabPanelID(Workspace const& workspace, unsigned long id);

// The main window of the first workspace found among the desktop's windows (topmost first), or null.
TopLevelWindow* FindMainTopLevelWindow();
// What a modal dialog should be modal to: the toolkit's current modal window, else the main window.
orvui::ui::OS_Window* GetModalDialogParentNode();
orvui::ui::NativeWindow GetModalDialogParent();

// Whether the panel shows in the window, and whether it is its frame's front tab. With
// honourMaximized, a window with a maximised frame shows only that frame's panels.
bool TabIsShownInTLW(TopLevelWindow const& window, TabPanel const& tab, bool& front, bool honourMaximized);
// The first panel of the type in each window, tested window by window.
bool TabIsShown(Workspace const& workspace, std::string const& tabType, bool& front);
bool TabIsShown(Workspace const& workspace, boost::intrusive_ptr<TabPanel> const& tab, bool& front);

// A Window-menu item for a panel type: a hidden panel comes back where it was last (its frame, a
// frame of its window, its closed window, or a new window); a panel behind another comes to the
// front and gets the focus; a front panel is closed (with focusFirst, it is first focused when it
// does not have the focus). A maximised frame hiding the panel is restored first.
void ToggleTabState(Workspace& workspace, std::string const& tabType, bool focusFirst);
void ToggleTabState(Workspace& workspace, boost::intrusive_ptr<TabPanel> tab, bool focusFirst);
// The main window's tool bar (its top static element) or, where the type lives in frames, that panel.
void ToggleToolbarTabState(Workspace& workspace, std::string const& tabType);
// The main window's status bar (its bottom static element).
void ToggleStatusbarTabState(Workspace& workspace, std::string const& tabType);
// Adds a panel of the type, in a remembered place when there is one, else in a new window.
TabPanel* CreateOrReanimateTab(Workspace& workspace, std::string const& tabType);
// Closes the panel as its close box would.
void CloseTab(Workspace& workspace, boost::intrusive_ptr<TabPanel> tab);

// A window can maximise one of its frames when it has more than one.
bool CanHaveMaximizedFrame(TopLevelWindow const* window);
// Maximises the frame (focusing its front panel), or, when a frame is maximised, restores the
// layout. False when the window has fewer than two frames.
bool ToggleThisFrameMaximizationState(Workspace& workspace, WorkspaceFrame* frame);
// The same for the frame under the mouse.
bool ToggleFrameMaximizationState(Workspace& workspace);
// Moves the focus to the next (or previous) panel of the walk, wrapping around; with no focused
// panel, to the first (or last). False when the workspace has no panel.
bool ChangeFocusTabPanel(Workspace& workspace, bool forward);

} // namespace WorkspaceUtils

} // namespace orvworkspace::workspace
