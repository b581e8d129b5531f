// The tab walk, the panel toggles, frame maximisation and focus cycling.
#include "workspace/WorkspaceUtils.h"

#include "frames/WorkspaceFrame.h"
#include "host/ui/Desktop.h"
#include "host/ui/NodeManager.h"
#include "workspace/TabPanel.h"
#include "workspace/TopLevelWindow.h"
#include "workspace/Workspace.h"

#include <algorithm>
#include <mutex>
#include <vector>

namespace orvworkspace::workspace::WorkspaceUtils {

namespace {

// Walks may call one another, and hosts may search from inside a visit.
std::recursive_mutex& TabWalkLock() {
    static std::recursive_mutex lock;
    return lock;
}
using WalkLock = std::lock_guard<std::recursive_mutex>;

// Whatever a toggle does to panels, it does not make new ones behind the host's back.
struct AssertingCreation {
    explicit AssertingCreation(Workspace& w)
        : workspace(w) {
        workspace.SetCreateTabPanelAssertionMode(true);
    }
    ~AssertingCreation() { workspace.SetCreateTabPanelAssertionMode(false); }
    AssertingCreation(AssertingCreation const&) = delete;
    AssertingCreation& operator=(AssertingCreation const&) = delete;
    Workspace& workspace;
};

// The walk holds what it visits: a visitor or a toggle may close a panel, and with it an emptied
// frame or floating window, while the walk still has them in its list.
using WindowList = std::vector<boost::intrusive_ptr<TopLevelWindow>>;
using FrameList = std::vector<boost::intrusive_ptr<WorkspaceFrame>>;

WindowList Windows(Workspace const& workspace) {
    WindowList windows;
    for (std::size_t w = 0; w < workspace.ChildSize(); ++w) {
        if (auto* window = dynamic_cast<TopLevelWindow*>(workspace.ChildGet(w))) {
            windows.push_back(window);
        }
    }
    return windows;
}

FrameList Frames(TopLevelWindow const& window) {
    FrameList frames;
    for (std::size_t f = 0; f < window.ChildSize(); ++f) {
        if (auto* frame = dynamic_cast<WorkspaceFrame*>(window.ChildGet(f))) {
            frames.push_back(frame);
        }
    }
    return frames;
}

// Calls visit(frame, index, panel) for each tab of the window until it returns false.
template <typename Visit> bool WalkWindow(TopLevelWindow const& window, Visit&& visit) {
    for (auto const& frame : Frames(window)) {
        for (long i = 0; i < frame->GetTabCount(); ++i) {
            if (TabPanel* panel = frame->GetTabPanel(i); panel && !visit(frame.get(), i, panel)) {
                return false;
            }
        }
    }
    return true;
}

template <typename Visit> bool WalkUnlocked(Workspace const& workspace, Visit&& visit) {
    for (auto const& window : Windows(workspace)) {
        if (!WalkWindow(*window, visit)) {
            return false;
        }
    }
    return true;
}

template <typename Visit> bool Walk(Workspace const& workspace, Visit&& visit) {
    WalkLock lock(TabWalkLock());
    return WalkUnlocked(workspace, std::forward<Visit>(visit));
}

struct Found {
    WorkspaceFrame* frame = nullptr;
    long index = -1;
    TabPanel* panel = nullptr;
};

Found FirstOfTypeIn(TopLevelWindow const& window, std::string const& tabType) {
    Found found;
    WalkWindow(window, [&](WorkspaceFrame* frame, long index, TabPanel* panel) {
        if (panel->GetTabType() != tabType) {
            return true;
        }
        found = {frame, index, panel};
        return false;
    });
    return found;
}

WorkspaceFrame* FrameToReanimate(TopLevelWindow const& window, std::string const& tabType) {
    for (auto const& frame : Frames(window)) {
        if (frame->CanReanimateTab(tabType)) {
            return frame.get();
        }
    }
    return nullptr;
}

void ClearMaximizedFrame(TopLevelWindow& window) {
    if (LayoutManager* layout = window.GetLayoutManager(); layout && layout->GetMaximizedFrame()) {
        layout->SetMaximizedFrame(nullptr);
    }
}

// A front panel closes; one behind others comes to the front with the focus.
// A panel found by its object closes through the workspace's panel form of RemoveTab, one found by
// type through its index form, so a host overriding either sees the call it expects.
enum class CloseBy { Index, Panel };

void CloseOrBringForward(Workspace& workspace, Found const& found, bool focusFirst,
                         CloseBy by = CloseBy::Index) {
    if (found.frame->GetFrontTabIndex() == found.index) {
        if (focusFirst && workspace.GetFocusedTabPanel() != found.panel) {
            workspace.SetFocusedTabPanel(found.panel);
        } else if (by == CloseBy::Panel) {
            workspace.RemoveTab(found.frame, found.panel, true, true);
        } else {
            workspace.RemoveTab(found.frame, found.index, true, true);
        }
    } else {
        found.frame->BringTabToFront(found.index);
        workspace.SetFocusedTabPanel(found.panel);
    }
}

TopLevelWindow* NewWindow(Workspace& workspace) {
    return workspace.AddTopLevelWindow(false, nullptr).get();
}

} // namespace

// --- Searches ---

bool VisitEachTab(Workspace const& workspace, TabVisitor& visitor) {
    return Walk(workspace, [&](WorkspaceFrame*, long, TabPanel* panel) { return visitor.VisitTab(panel); });
}

bool VisitEachTab(Workspace const& workspace, ConstTabVisitor& visitor) {
    return Walk(workspace, [&](WorkspaceFrame*, long, TabPanel* panel) { return visitor.VisitTab(panel); });
}

void FindAllTabsOfType(Workspace const& workspace, std::string const& tabType, std::list<TabPanel*>& out,
                       std::list<long>* indices) {
    Walk(workspace, [&](WorkspaceFrame*, long index, TabPanel* panel) {
        if (panel->GetTabType() == tabType) {
            out.push_back(panel);
            if (indices) {
                indices->push_back(index);
            }
        }
        return true;
    });
}

TabPanel* FindFirstTabOfType(Workspace const& workspace, std::string const& tabType, long* index) {
    TabPanel* found = nullptr;
    Walk(workspace, [&](WorkspaceFrame*, long i, TabPanel* panel) {
        if (panel->GetTabType() != tabType) {
            return true;
        }
        found = panel;
        if (index) {
            *index = i;
        }
        return false;
    });
    return found;
}

TabPanel* FindTabFromID(Workspace const& workspace, std::string const& id) {
    TabPanel* found = nullptr;
    if (!id.empty()) {
        Walk(workspace, [&](WorkspaceFrame*, long, TabPanel* panel) {
            found = panel->UI_GetNodeID() == id ? panel : nullptr;
            return !found;
        });
    }
    return found;
}

TabPanel* FindTabFromID(TopLevelWindow const& window, std::string const& id) {
    TabPanel* found = nullptr;
    if (!id.empty()) {
        WalkLock lock(TabWalkLock());
        WalkWindow(window, [&](WorkspaceFrame*, long, TabPanel* panel) {
            found = panel->UI_GetNodeID() == id ? panel : nullptr;
            return !found;
        });
    }
    return found;
}

TopLevelWindow* FindTopLevelWindowFromID(Workspace const& workspace, std::string const& id) {
    if (id.empty()) {
        return nullptr;
    }
    WalkLock lock(TabWalkLock());
    for (auto const& window : Windows(workspace)) {
        if (window->UI_GetNodeID() == id) {
            return window.get();
        }
    }
    return nullptr;
}

TabPanel* FindTabFromTabPanelID(Workspace const& workspace, unsigned long id) {
    TabPanel* found = nullptr;
    Walk(workspace, [&](WorkspaceFrame*, long, TabPanel* panel) {
        found = panel->GetID() == id ? panel : nullptr;
        return !found;
    });
    return found;
}

TopLevelWindow* FindMainTopLevelWindow() {
    for (orvui::ui::OS_Window* window : orvui::ui::OS_Window::UI_EnumerateAllWindows()) {
        if (auto* tlw = dynamic_cast<TopLevelWindow*>(window); tlw && tlw->GetWorkspace()) {
            if (TopLevelWindow* main = tlw->GetWorkspace()->GetMainTopLevelWindow()) {
                return main;
            }
        }
    }
    return nullptr;
}

orvui::ui::OS_Window* GetModalDialogParentNode() {
    orvui::ui::UI_NodeManager* manager = orvui::ui::UI_NodeManager::Get();
    if (manager && manager->HasModalWindow()) {
        return manager->GetModalWindow();
    }
    return FindMainTopLevelWindow();
}

orvui::ui::NativeWindow GetModalDialogParent() {
    orvui::ui::OS_Window* parent = GetModalDialogParentNode();
    return parent ? parent->GetPlatformWindow() : 0;
}

// --- Shown panels ---

bool TabIsShownInTLW(TopLevelWindow const& window, TabPanel const& tab, bool& front, bool honourMaximized) {
    front = false;
    LayoutManager const* layout = window.GetLayoutManager();
    if (!layout) {
        return false;
    }
    auto* frame = dynamic_cast<WorkspaceFrame*>(tab.GetFrame());
    if (honourMaximized && layout->GetMaximizedFrame()) {
        if (!frame || frame->GetLMFrame() != layout->GetMaximizedFrame()) {
            return false;
        }
        front = tab.IsFrontmost();
        return true;
    }
    if (!frame || frame->GetTopLevelWindow() != &window) {
        return false;
    }
    front = frame->GetFrontTabPanel() == &tab;
    return true;
}

bool TabIsShown(Workspace const& workspace, std::string const& tabType, bool& front) {
    WalkLock lock(TabWalkLock());
    front = false;
    for (auto const& window : Windows(workspace)) {
        Found found = FirstOfTypeIn(*window, tabType);
        if (found.panel && TabIsShownInTLW(*window, *found.panel, front, true)) {
            return true;
        }
    }
    return false;
}

bool TabIsShown(Workspace const& workspace, boost::intrusive_ptr<TabPanel> const& tab, bool& front) {
    front = false;
    if (!tab) {
        return false;
    }
    for (auto const& window : Windows(workspace)) {
        if (TabIsShownInTLW(*window, *tab, front, true)) {
            return true;
        }
    }
    return false;
}

// --- Toggles ---

void ToggleTabState(Workspace& workspace, boost::intrusive_ptr<TabPanel> tab, bool focusFirst) {
    if (!tab) {
        return;
    }
    AssertingCreation asserting(workspace);
    WalkLock lock(TabWalkLock());
    WindowList windows = Windows(workspace);
    bool front = false;
    bool shown = std::any_of(windows.begin(), windows.end(),
                             [&](auto const& w) { return TabIsShownInTLW(*w, *tab, front, false); });
    if (!shown) {
        // Back where it was last: its frame, a frame of its window, its closed window, or a new one.
        for (auto const& window : windows) {
            for (auto const& frame : Frames(*window)) {
                if (frame->CanReanimateTab(tab.get())) {
                    frame->ReanimateTab(tab);
                    return;
                }
            }
        }
        for (auto const& window : windows) {
            if (window->CanReanimateFrame(tab) && window->ReanimateFrame(tab)) {
                return;
            }
        }
        if (workspace.CanReanimateWindow(tab) && workspace.ReanimateWindow(tab)) {
            return;
        }
        if (TopLevelWindow* window = NewWindow(workspace)) {
            window->CreateRootFrame(tab, true);
        }
        return;
    }
    auto* frame = dynamic_cast<WorkspaceFrame*>(tab->GetFrame());
    TopLevelWindow* window = frame ? frame->GetTopLevelWindow() : nullptr;
    if (!frame || !window) {
        return;
    }
    if (Frame* maximized = window->GetLayoutManager()->GetMaximizedFrame();
        maximized && maximized != frame->GetLMFrame()) {
        window->GetLayoutManager()->SetMaximizedFrame(nullptr);
        return;
    }
    CloseOrBringForward(workspace, Found{frame, frame->IndexOf(tab.get()), tab.get()}, focusFirst,
                        CloseBy::Panel);
}

void ToggleTabState(Workspace& workspace, std::string const& tabType, bool focusFirst) {
    WalkLock lock(TabWalkLock());
    WorkspaceFrame* frameToReanimate = nullptr;
    TopLevelWindow* windowToReanimate = nullptr;
    for (auto const& window : Windows(workspace)) {
        Found found = FirstOfTypeIn(*window, tabType);
        if (found.panel) {
            if (Frame* maximized = window->GetLayoutManager()->GetMaximizedFrame();
                maximized && maximized != found.frame->GetLMFrame()) {
                window->GetLayoutManager()->SetMaximizedFrame(nullptr);
                if (found.frame->GetFrontTabIndex() == found.index) {
                    return; // showing it again was the whole toggle
                }
            }
            CloseOrBringForward(workspace, found, focusFirst);
            return;
        }
        if (!frameToReanimate) {
            frameToReanimate = FrameToReanimate(*window, tabType);
        }
        if (!windowToReanimate && window->CanReanimateFrame(tabType)) {
            windowToReanimate = window.get();
        }
    }
    if (frameToReanimate) {
        if (TopLevelWindow* window = frameToReanimate->GetTopLevelWindow()) {
            ClearMaximizedFrame(*window);
        }
        frameToReanimate->ReanimateTab(tabType);
    } else if (windowToReanimate) {
        windowToReanimate->ReanimateFrame(tabType);
    } else if (!(workspace.CanReanimateWindow(tabType) && workspace.ReanimateWindow(tabType))) {
        if (TopLevelWindow* window = NewWindow(workspace)) {
            window->CreateRootFrame(tabType, true, true);
        }
    }
}

void ToggleToolbarTabState(Workspace& workspace, std::string const& tabType) {
    WalkLock lock(TabWalkLock());
    TopLevelWindow* main = workspace.GetMainTopLevelWindow();
    if (main && main->HasStaticElement(LayoutManager::Top)) {
        main->RemoveStaticElement(LayoutManager::Top, true);
        return;
    }
    for (auto const& window : Windows(workspace)) {
        Found found = FirstOfTypeIn(*window, tabType);
        if (found.panel) {
            CloseOrBringForward(workspace, found, false);
            return;
        }
        if (WorkspaceFrame* frame = FrameToReanimate(*window, tabType)) {
            frame->ReanimateTab(tabType);
            return;
        }
        if (window->CanReanimateFrame(tabType) && window->ReanimateFrame(tabType)) {
            return;
        }
    }
    if (workspace.CanReanimateWindow(tabType)) {
        workspace.ReanimateWindow(tabType);
    } else if (main) {
        main->SetStaticElement(tabType, LayoutManager::Top, true);
    }
}

void ToggleStatusbarTabState(Workspace& workspace, std::string const& tabType) {
    WalkLock lock(TabWalkLock());
    TopLevelWindow* main = workspace.GetMainTopLevelWindow();
    if (!main) {
        return;
    }
    if (main->HasStaticElement(LayoutManager::Bottom)) {
        main->RemoveStaticElement(LayoutManager::Bottom, true);
    } else {
        main->SetStaticElement(tabType, LayoutManager::Bottom, true);
    }
}

TabPanel* CreateOrReanimateTab(Workspace& workspace, std::string const& tabType) {
    WalkLock lock(TabWalkLock());
    for (auto const& window : Windows(workspace)) {
        if (WorkspaceFrame* frame = FrameToReanimate(*window, tabType)) {
            frame->ReanimateTab(tabType);
            return FirstOfTypeIn(*window, tabType).panel;
        }
        if (window->CanReanimateFrame(tabType) && window->ReanimateFrame(tabType)) {
            return FirstOfTypeIn(*window, tabType).panel;
        }
    }
    if (workspace.CanReanimateWindow(tabType) && workspace.ReanimateWindow(tabType)) {
        return FindFirstTabOfType(workspace, tabType);
    }
    TopLevelWindow* window = NewWindow(workspace);
    if (!window) {
        return nullptr;
    }
    window->CreateRootFrame(tabType, true, true);
    return FirstOfTypeIn(*window, tabType).panel;
}

void CloseTab(Workspace& workspace, boost::intrusive_ptr<TabPanel> tab) {
    if (!tab) {
        return;
    }
    AssertingCreation asserting(workspace);
    WalkLock lock(TabWalkLock());
    if (auto* frame = dynamic_cast<WorkspaceFrame*>(tab->GetFrame())) {
        workspace.RemoveTab(frame, tab.get(), true, true);
    }
}

// --- Maximisation and focus ---

bool CanHaveMaximizedFrame(TopLevelWindow const* window) {
    return window && window->GetFrameCount() > 1;
}

bool ToggleThisFrameMaximizationState(Workspace& workspace, WorkspaceFrame* frame) {
    TopLevelWindow* window = frame ? frame->GetTopLevelWindow() : nullptr;
    if (!window || window->GetFrameCount() < 2) {
        return false;
    }
    LayoutManager* layout = window->GetLayoutManager();
    if (!layout->GetMaximizedFrame()) {
        layout->SetMaximizedFrame(frame->GetLMFrame());
        workspace.SetFocusedTabPanel(frame->GetFrontTabPanel());
    } else {
        layout->SetMaximizedFrame(nullptr);
    }
    return true;
}

bool ToggleFrameMaximizationState(Workspace& workspace) {
    orvui::ui::PointT mouse = orvui::ui::Desktop::Get().GetMousePosition();
    auto* window = dynamic_cast<TopLevelWindow*>(workspace.GetTopLevelWindowFromPos(mouse));
    WorkspaceFrame* frame = window ? window->GetFrameFromPos(mouse) : nullptr;
    return frame && ToggleThisFrameMaximizationState(workspace, frame);
}

bool ChangeFocusTabPanel(Workspace& workspace, bool forward) {
    std::vector<TabPanel*> tabs;
    WalkUnlocked(workspace, [&](WorkspaceFrame*, long, TabPanel* panel) {
        tabs.push_back(panel);
        return true;
    });
    if (tabs.empty()) {
        return false;
    }
    auto focused = std::find(tabs.begin(), tabs.end(), workspace.GetFocusedTabPanel());
    TabPanel* target = nullptr;
    if (focused == tabs.end()) {
        target = forward ? tabs.front() : tabs.back();
    } else if (forward) {
        target = std::next(focused) == tabs.end() ? tabs.front() : *std::next(focused);
    } else {
        target = focused == tabs.begin() ? tabs.back() : *std::prev(focused);
    }
    if (!target) {
        return false;
    }
    workspace.SetFocusedTabPanel(target);
    return true;
}

} // namespace orvworkspace::workspace::WorkspaceUtils
