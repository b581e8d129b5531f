// The workspace: creators, counters, windows, closing tabs, focus and images.
#include "workspace/Workspace.h"

#include "frames/WorkspaceFrame.h"
#include "host/core/Error.h"
#include "host/core/ErrorTable.h"
#include "host/core/PropList.h"
#include "host/core/PropListUtils.h"
#include "host/ui/Desktop.h"
#include "host/ui/MonitorInfo.h"
#include "host/ui/NodeManager.h"
#include "host/ui/ResourceManager.h"
#include "host/ui/canvasor/SupplierInterface.h"
#include "layout/FrameDataProxy.h"
#include "layout/Splitter.h"
#include "persistence/WorkspaceDocument.h"
#include "workspace/TabCreator.h"
#include "workspace/TabDragger.h"
#include "workspace/TabPanel.h"
#include "workspace/TopLevelWindow.h"
#include "workspace/Tracker.h"

#include <algorithm>

namespace orvworkspace::workspace {

using namespace orvui::ui;

Workspace::Workspace(canvasor::SupplierInterface* supplier)
    : drawSupplier_(supplier ? supplier : UI_NodeManager::Get()->GetOSDrawSupplier())
    , monitorInfo_(std::make_unique<orvui::utility::MonitorInfo>())
    , resourceManager_(std::make_unique<orvui::utility::ResourceManager>()) {
    InstallThemeChangedFunction([this] { InvalidateTopLevelWindows(); });
    UI_NodeManager::Get()->InstallUserResizeFunction(
        [this](bool begin, UI_Node* node, bool flag) { HandleUserResize(begin, node, flag); });
}

Workspace::~Workspace() {
    InstallThemeChangedFunction(nullptr);
    UI_NodeManager::Get()->InstallUserResizeFunction(nullptr);
    // A drag still running when the host goes away ends without docking anything.
    if (auto* tracker = dynamic_cast<Tracker*>(tracker_.get())) {
        tracker->Abandon();
    }
    tracker_.reset();
    retiredTrackers_.clear();
    tabCreators_.clear();
    Theme::Terminate();
    DeleteChildren();
}

// --- Windows ---

std::vector<TopLevelWindow*> Workspace::GetWindows() const {
    std::vector<TopLevelWindow*> windows;
    for (std::size_t i = 0; i < ChildSize(); ++i) {
        if (auto* w = dynamic_cast<TopLevelWindow*>(ChildGet(i))) {
            windows.push_back(w);
        }
    }
    return windows;
}

TopLevelWindow* Workspace::GetMainTopLevelWindow() const {
    for (TopLevelWindow* w : GetWindows()) {
        if (w->IsMain()) {
            return w;
        }
    }
    return nullptr;
}

void Workspace::CreateMainTopLevelWindow(OSEventFunction osEventFunc) {
    ChildPushBack(new TopLevelWindow(this, osEventFunc, true));
}

boost::intrusive_ptr<TopLevelWindow> Workspace::CreateTopLevelWindow(bool interim, RectT const* rect) {
    return new TopLevelWindow(this, interim, rect);
}

boost::intrusive_ptr<TopLevelWindow> Workspace::AddTopLevelWindow(bool interim, RectT const* rect) {
    boost::intrusive_ptr<TopLevelWindow> window = CreateTopLevelWindow(interim, rect);
    ChildPushBack(window);
    return window;
}

void Workspace::MakeWindowPermanent(boost::intrusive_ptr<TopLevelWindow> window) {
    if (window) {
        window->MakePermanent();
        OnTopLevelWindowActivated(window.get());
    }
}

bool Workspace::RemoveWindow(TopLevelWindow* window, bool record) {
    recordRemovedWindows_ = record;
    bool removed = ChildRequestRemove(window);
    recordRemovedWindows_ = true;
    return removed;
}

bool Workspace::ChildRequestRemove(boost::intrusive_ptr<UI_Node> node) {
    auto* window = dynamic_cast<TopLevelWindow*>(node.get());
    if (!window || window->IsMain()) {
        return true;
    }
    if (windowsBeingRemoved_.count(window)) {
        return true; // emptied by its own removal: the outer request finishes it
    }
    // Ask first: a window that stays must not have lost panels on the way.
    for (std::size_t i = 0; i < window->ChildSize(); ++i) {
        auto* frame = dynamic_cast<WorkspaceFrame*>(window->ChildGet(i));
        if (frame && !frame->AllowFrameClose()) {
            return false;
        }
    }
    boost::intrusive_ptr<TopLevelWindow> keep(window->IsReferenced() ? window : nullptr);
    bool record = recordRemovedWindows_;
    windowsBeingRemoved_.insert(window);
    window->RemoveTabPanels(true);
    if (record) {
        removedWindowData_.push_back(new WindowReanimateData(*window));
    }
    windowsBeingRemoved_.erase(window);
    if (window->UI_GetParentNode()) {
        return UI_Container::ChildRequestRemove(node);
    }
    return true;
}

void Workspace::ReleaseTracker(bool cancel) {
    // Taken out first: ending may bring the workspace back here (a release inside a release).
    std::unique_ptr<OS_Tracker> ending = std::move(tracker_);
    if (ending && cancel) {
        ending->Cancel();
    }
    if (ending && ending->IsBusy()) {
        // Released from inside its own step: it ends now and is destroyed once that step is over.
        ending->End();
        retiredTrackers_.push_back(std::move(ending));
        return;
    }
    ending.reset();
    DestroyIdleRetiredTrackers();
}

void Workspace::DestroyIdleRetiredTrackers() {
    retiredTrackers_.erase(std::remove_if(retiredTrackers_.begin(), retiredTrackers_.end(),
                                          [](auto const& t) { return !t->IsBusy(); }),
                           retiredTrackers_.end());
}

Tracker* Workspace::AcquireSplitterDragger(TopLevelWindow* window, PointT const& point) {
    // The previous drag ends before the next one looks at the layout it may change.
    ReleaseTracker(false);
    if (!window || !window->GetLayoutManager()) {
        return nullptr;
    }
    auto dragger = std::make_unique<SplitterDragger>(this, window, point);
    if (!dragger->HasLayoutTracker()) {
        return nullptr;
    }
    SplitterDragger* raw = dragger.get();
    tracker_ = std::move(dragger);
    return raw;
}

Tracker* Workspace::AcquireTabDragger(WorkspaceFrame* sourceFrame, bool wholeFrame, unsigned long tabIndex) {
    boost::intrusive_ptr<WorkspaceFrame> keep(sourceFrame);
    ReleaseTracker(false);
    if (!sourceFrame || !sourceFrame->GetTopLevelWindow() || long(tabIndex) >= sourceFrame->GetTabCount()) {
        return nullptr;
    }
    auto dragger = std::make_unique<TabDragger>(this, sourceFrame, wholeFrame, tabIndex);
    TabDragger* raw = dragger.get();
    tracker_ = std::move(dragger);
    return raw;
}

boost::intrusive_ptr<TopLevelWindow>
Workspace::CreateDragSrcWindow(RectT const& rect, PointT const& point,
                               boost::intrusive_ptr<WorkspaceFrame> frame) {
    if (!frame) {
        return nullptr;
    }
    boost::intrusive_ptr<TopLevelWindow> window = AddTopLevelWindow(true, nullptr);
    window->SetRootFrame(frame, true);
    return ShowDragSrcWindow(window, rect, point, true);
}

boost::intrusive_ptr<TopLevelWindow>
Workspace::CreateDragSrcWindow(RectT const& rect, PointT const& point,
                               std::vector<boost::intrusive_ptr<TabPanel>>& panels) {
    if (panels.empty()) {
        return nullptr;
    }
    boost::intrusive_ptr<TopLevelWindow> window = AddTopLevelWindow(true, nullptr);
    window->CreateRootFrame(panels, true);
    return ShowDragSrcWindow(window, rect, point, false);
}

boost::intrusive_ptr<TopLevelWindow> Workspace::ShowDragSrcWindow(boost::intrusive_ptr<TopLevelWindow> window,
                                                                  RectT const& rect, PointT const& point,
                                                                  bool wholeFrame) {
    window->SetToGlobalTabSize(rect);
    window->SetDragPosition(point, wholeFrame);
    window->UI_Show(true);
    window->UI_DispatchNodeChange(5);
    if (WorkspaceFrame* root = window->GetRootFrame()) {
        root->UI_UpdateNow(~0u);
    }
    // Translucent, the window lets the pointer reach the windows beneath it while it follows.
    window->UI_SetOpacity(0.8f);
    return window;
}

void Workspace::SetToolkitCursor(int cursor) const {
    try {
        GetResourceManager()->SetCursor(cursor);
    } catch (orvcore::config::Error const&) {
        orvui::ui::Desktop::Get().SetCursor(cursor);
    }
}

// --- Panels ---

void Workspace::NewTabInFocused(std::string const& tabType) {
    if (TabPanel* focused = GetFocusedTabPanel()) {
        if (auto* frame = dynamic_cast<WorkspaceFrame*>(focused->GetFrame())) {
            frame->AddTab(tabType, true);
            return;
        }
    }
    TopLevelWindow* main = GetMainTopLevelWindow();
    if (main && main->AcceptsTabs()) {
        if (WorkspaceFrame* root = main->GetRootFrame()) {
            root->AddTab(tabType, true);
        } else {
            main->CreateRootFrame(tabType, true, true);
        }
        return;
    }
    AddTopLevelWindow(main == nullptr, nullptr)->CreateRootFrame(tabType, true, true);
}

WorkspaceFrame* Workspace::NewFrameInFocused(std::string const& tabType, LayoutManager::InsertionType side) {
    if (TabPanel* focused = GetFocusedTabPanel()) {
        if (auto* frame = dynamic_cast<WorkspaceFrame*>(focused->GetFrame())) {
            return frame->GetTopLevelWindow()->AddTabbedFrame(frame, tabType, side);
        }
    }
    TopLevelWindow* main = GetMainTopLevelWindow();
    if (main && main->AcceptsTabs()) {
        if (WorkspaceFrame* root = main->GetRootFrame()) {
            return main->AddTabbedFrame(root, tabType, side);
        }
        return main->CreateRootFrame(tabType, true, true);
    }
    return AddTopLevelWindow(main == nullptr, nullptr)->CreateRootFrame(tabType, true, true);
}

bool Workspace::RemoveTab(WorkspaceFrame* frame, long index, bool cacheData, bool honourObliterate) {
    if (!frame) {
        return false;
    }
    boost::intrusive_ptr<UI_Node> keepFrame(frame->IsReferenced() ? frame : nullptr);
    boost::intrusive_ptr<TopLevelWindow> window(frame->GetTopLevelWindow());
    bool hadFocus = frame->UI_HasKeyboardFocus(false) || frame->UI_HasKeyboardFocus(true);
    bool obliterated = false;
    if (honourObliterate) {
        if (TabPanel* panel = frame->GetTabPanel(index); panel && panel->ObliterateWhenClosed()) {
            NotifyObliterating(panel);
            obliterated = true;
            cacheData = cacheData && panel->SaveStateWhenObliterated();
        }
    }
    boost::intrusive_ptr<TabPanel> panel = frame->DetachTabPanel(index);
    if (!panel) {
        return false;
    }
    if (cacheData) {
        // A panel announced as destroyed is remembered by its type and state, never kept alive.
        frame->CacheTabData(panel, panel->HideWhenClosed() && !obliterated);
    }
    // A frame that still has tabs has already focused its new front panel when it held the focus;
    // moving the focus to the window's root frame from there would take it away from where the user
    // was working. Refocusing is for frames that empty out.
    bool refocus = false;
    TopLevelWindow* focusWindow = window.get();
    if (frame->GetTabCount() == 0) {
        refocus = hadFocus;
        bool keepPlace = frame->HasRemovedTabData() || frame->HasHiddenTabs();
        window->RemoveFrame(frame, keepPlace);
        if (!window->GetRootFrame()) {
            if (!window->IsMain()) {
                RemoveWindow(window.get(), keepPlace);
            }
            focusWindow = GetMainTopLevelWindow();
            refocus = true;
        }
    }
    if (refocus && focusWindow) {
        if (WorkspaceFrame* root = focusWindow->GetRootFrame()) {
            SetFocusedTabPanel(root->GetFrontTabPanel());
        }
    }
    return true;
}

bool Workspace::RemoveTab(WorkspaceFrame* frame, TabPanel* panel, bool cacheData, bool honourObliterate) {
    if (!frame) {
        return false;
    }
    for (long i = 0; i < frame->GetTabCount(); ++i) {
        if (frame->GetTabPanel(i) == panel) {
            return RemoveTab(frame, i, cacheData, honourObliterate);
        }
    }
    return false;
}

void Workspace::RegisterTabCreator(TabCreator* creator) {
    if (!creator) {
        return;
    }
    // The first registration wins; a second creator for the type is neither kept nor destroyed.
    if (tabCreators_.count(creator->GetTabType())) {
        return;
    }
    tabCreators_[creator->GetTabType()].reset(creator);
}

void Workspace::UnregisterTabCreator(std::string const& tabType) {
    auto it = tabCreators_.find(tabType);
    if (it != tabCreators_.end()) {
        (void)it->second.release(); // unregistering hands the creator back to whoever made it
        tabCreators_.erase(it);
    }
}

TabCreator* Workspace::FindCreator(std::string const& tabType) const {
    auto it = tabCreators_.find(tabType);
    return it == tabCreators_.end() ? nullptr : it->second.get();
}

bool Workspace::TabTypeHidesWhenClosed(std::string const& tabType) const {
    TabCreator* creator = FindCreator(tabType);
    return creator && creator->HidesWhenClosed();
}

bool Workspace::TabTypeObliteratesWhenClosed(std::string const& tabType) const {
    TabCreator* creator = FindCreator(tabType);
    return creator && creator->ObliteratesWhenClosed();
}

bool Workspace::TabTypeSavesStateWhenObliterated(std::string const& tabType) const {
    TabCreator* creator = FindCreator(tabType);
    return creator && creator->SavesStateWhenObliterated();
}

struct Workspace::LayoutDisabled {
    explicit LayoutDisabled(Workspace& w)
        : workspace(w) {
        workspace.SetLayoutEnabled(false);
    }
    ~LayoutDisabled() { workspace.SetLayoutEnabled(true); }
    Workspace& workspace;
};

void Workspace::SetLayoutEnabled(bool enabled) {
    layoutDisableCount_ += enabled ? -1 : 1;
}

// --- Focus ---

TabPanel* Workspace::GetFocusedTabPanel() const {
    for (UI_Node* n = UI_Node::UI_GetKeyboardFocusLeafNode(); n; n = n->UI_GetParentNode()) {
        if (auto* panel = dynamic_cast<TabPanel*>(n)) {
            return panel;
        }
    }
    return nullptr;
}

void Workspace::SetFocusedTabPanel(TabPanel* panel) {
    if (settingFocus_ || !panel) {
        return;
    }
    settingFocus_ = true;
    UI_Node* leaf = UI_Node::UI_GetKeyboardFocusLeafNode();
    bool needFocus = !(leaf && panel->IsAncestorOf(leaf));
    if (auto* frame = dynamic_cast<WorkspaceFrame*>(panel->GetFrame())) {
        frame->BringTabToFront(panel);
    }
    if (needFocus && GetFocusedTabPanel() != panel) {
        if (auto* frame = panel->GetFrame()) {
            if (TopLevelWindow* window = frame->GetTopLevelWindow()) {
                window->Activate(false);
            }
        }
        panel->UI_GainKeyboardFocus(FocusByProgram);
    }
    settingFocus_ = false;
}

TabPanel* Workspace::GetLastTouchedTabPanel() const {
    TabPanel* best = nullptr;
    for (TopLevelWindow* window : GetWindows()) {
        TabPanel* candidate = window->GetLastTouchedTabPanel();
        if (candidate && (!best || candidate->GetTouchStamp() > best->GetTouchStamp())) {
            best = candidate;
        }
    }
    return best;
}

TabPanel* Workspace::GetTabPanelFromPos(PointT const& global) const {
    auto* window = dynamic_cast<TopLevelWindow*>(GetTopLevelWindowFromPos(global));
    WorkspaceFrame* frame = window ? window->GetFrameFromPos(global) : nullptr;
    if (!frame) {
        return nullptr;
    }
    for (long i = 0; i < frame->GetTabCount(); ++i) {
        TabPanel* panel = frame->GetTabPanel(i);
        if (panel->UI_IsShown() && panel->UI_GetGlobalRect().Contains(global)) {
            return panel;
        }
    }
    return nullptr;
}

// --- Windows en masse ---

void Workspace::InvalidateTopLevelWindows() {
    for (TopLevelWindow* w : GetWindows()) {
        w->UI_Invalidate(nullptr, 0);
    }
}

void Workspace::UpdateNowTopLevelWindows(orvcore::utility::Flags<unsigned long> flags) {
    for (TopLevelWindow* w : GetWindows()) {
        w->UI_UpdateNow(unsigned(flags.Get()));
    }
}

void Workspace::ReLayoutTopLevelWindows() {
    for (TopLevelWindow* w : GetWindows()) {
        w->GetLayoutManager()->ReLayout(false, true, false);
    }
}

void Workspace::ForEachWindowWithLayoutOff(std::function<void(TopLevelWindow&)> const& action) {
    {
        LayoutDisabled disabled(*this);
        // Held, because the action may take a window out of the workspace.
        std::vector<boost::intrusive_ptr<TopLevelWindow>> windows;
        for (TopLevelWindow* w : GetWindows()) {
            windows.emplace_back(w);
        }
        for (auto const& w : windows) {
            action(*w);
        }
        ClearRemovedWindowData();
    }
    if (GetLayoutEnabled()) {
        ReLayoutTopLevelWindows();
    }
}

void Workspace::RemoveTabPanels() {
    ForEachWindowWithLayoutOff([](TopLevelWindow& w) {
        w.RemoveTabPanels(false);
        if (!w.IsMain()) {
            w.UI_Show(false);
        }
    });
}

void Workspace::DestroyTabPanels() {
    ForEachWindowWithLayoutOff([](TopLevelWindow& w) { w.DestroyTabPanels(); });
}

void Workspace::BringAppToFront() {
    TopLevelWindow* main = GetMainTopLevelWindow();
    if (!main) {
        return;
    }
    if (main->UI_IsMinimized()) {
        main->UI_Minimize(false);
    }
    main->UI_Activate();
    main->UI_UpdateNow(~0u);
}

// --- Closed windows ---

namespace {
void TakeOutOfTree(TabPanel& panel) {
    panel.SetFrame(nullptr);
    panel.UI_SetParent(nullptr);
}
} // namespace

Workspace::WindowReanimateData::WindowReanimateData(TopLevelWindow& window) {
    std::vector<LayoutManagerElement*> pending;
    if (Splitter* root = window.GetLayoutManager()->GetRootSplitter()) {
        pending.push_back(root);
    }
    while (!pending.empty()) {
        LayoutManagerElement* e = pending.back();
        pending.pop_back();
        if (Splitter* s = AsSplitter(e)) {
            // Right or bottom pushed first, so the left or top side is walked first.
            for (LayoutManagerElement* child : {s->GetRightOrBottom(), s->GetLeftOrTop()}) {
                if (child) {
                    pending.push_back(child);
                }
            }
            continue;
        }
        TabDataList visible, removed, hidden;
        if (FrameDataProxy* proxy = AsPlaceholder(e)) {
            visible = proxy->GetTabData();
        } else if (Frame* frame = AsFrame(e)) {
            frame->GetTabData(visible, removed, hidden);
        }
        for (TabDataList const* group : {&visible, &removed, &hidden}) {
            for (auto const& entry : *group) {
                tabTypes.insert(entry.first);
            }
        }
    }
    orvcore::proplist::PropList description;
    SaveTopLevelWindow(window, description, true);
    description.OutputAsXMLFragment(windowXml);

    auto keepFrom = [&](WorkspaceFrame& frame) {
        for (long i = 0; i < frame.GetTabCount();) {
            if (frame.GetTabPanel(i)->HideWhenClosed()) {
                hiddenPanels.push_back(frame.DetachTabPanel(i));
            } else {
                ++i;
            }
        }
        hiddenPanels.insert(hiddenPanels.end(), frame.HiddenTabs().begin(), frame.HiddenTabs().end());
    };
    for (std::size_t i = 0; i < window.ChildSize(); ++i) {
        if (auto* frame = dynamic_cast<WorkspaceFrame*>(window.ChildGet(i))) {
            keepFrom(*frame);
        }
    }
    for (auto const& frame : window.HiddenFrames()) {
        keepFrom(*frame);
    }
    for (auto const& panel : hiddenPanels) {
        TakeOutOfTree(*panel);
    }
}

Workspace::WindowReanimateData::~WindowReanimateData() = default;

Workspace::WindowReanimateData::WindowReanimateData(Workspace& workspace,
                                                    orvcore::proplist::PropList const& list,
                                                    std::list<boost::intrusive_ptr<TabPanel>>& pool) {
    std::vector<std::string> types;
    list.GetValue("RemovedTabs", types);
    tabTypes.insert(types.begin(), types.end());
    list.GetValue("WinSerData", windowXml);
    std::vector<std::string> hiddenList;
    list.GetValue("HiddenTabs", hiddenList);
    std::set<std::string> hiddenTypes(hiddenList.begin(), hiddenList.end());
    TopLevelWindow* main = workspace.GetMainTopLevelWindow();
    if (hiddenTypes.empty() || !main) {
        return;
    }
    boost::intrusive_ptr<WorkspaceFrame> scratch = main->CreateWorkspaceFrame(RectT());
    for (std::string const& type : hiddenTypes) {
        if (boost::intrusive_ptr<TabPanel> panel =
                TakeOrCreateTabPanel(workspace, type, pool, scratch.get())) {
            TakeOutOfTree(*panel);
            hiddenPanels.push_back(panel);
        }
    }
    main->ChildRemove(scratch.get());
}

bool Workspace::CanReanimateWindow(std::string const& tabType) const {
    return std::any_of(removedWindowData_.begin(), removedWindowData_.end(),
                       [&](WindowReanimateDataP const& r) { return r->tabTypes.count(tabType) != 0; });
}

bool Workspace::CanReanimateWindow(boost::intrusive_ptr<TabPanel> const& panel) const {
    return std::any_of(
        removedWindowData_.begin(), removedWindowData_.end(), [&](WindowReanimateDataP const& r) {
            return std::find(r->hiddenPanels.begin(), r->hiddenPanels.end(), panel) != r->hiddenPanels.end();
        });
}

bool Workspace::RebuildWindow(WindowReanimateData const& record,
                              std::function<void(TopLevelWindow&)> const& bringBack) {
    orvcore::proplist::PropList description;
    try {
        orvcore::proplist::utils::ReadPropList(record.windowXml, description);
    } catch (orvcore::config::Error const&) {
        return false; // a damaged description cannot be rebuilt; the record stays as it was
    }
    boost::intrusive_ptr<TopLevelWindow> window =
        AddTopLevelWindow(GetMainTopLevelWindow() == nullptr, nullptr);
    ReusableTabPool pool(record.hiddenPanels.begin(), record.hiddenPanels.end());
    RestoreTopLevelWindow(*window, description, pool, true, false, false);
    bringBack(*window);
    return true;
}

bool Workspace::ReanimateWindow(std::string const& tabType) {
    for (auto it = removedWindowData_.begin(); it != removedWindowData_.end(); ++it) {
        WindowReanimateDataP record = *it;
        if (!record->tabTypes.count(tabType)) {
            continue;
        }
        bool rebuilt = RebuildWindow(*record, [&](TopLevelWindow& window) {
            if (!window.ReanimateFrame(tabType)) {
                window.CreateRootFrame(tabType, true, false);
            }
        });
        if (rebuilt) {
            removedWindowData_.remove(record);
            return true;
        }
    }
    return false;
}

bool Workspace::ReanimateWindow(boost::intrusive_ptr<TabPanel> const& panel) {
    for (auto it = removedWindowData_.begin(); it != removedWindowData_.end(); ++it) {
        WindowReanimateDataP record = *it;
        if (std::find(record->hiddenPanels.begin(), record->hiddenPanels.end(), panel) ==
            record->hiddenPanels.end()) {
            continue;
        }
        bool rebuilt = RebuildWindow(*record, [&](TopLevelWindow& window) {
            if (!window.CanReanimateFrame(panel) || !window.ReanimateFrame(panel)) {
                window.CreateRootFrame(panel, true);
            }
        });
        if (rebuilt) {
            removedWindowData_.remove(record);
            return true;
        }
    }
    return false;
}

void Workspace::FindAllHiddenTabs(std::list<boost::intrusive_ptr<TabPanel>>& out) {
    auto gather = [&](WorkspaceFrame& frame) {
        for (auto const& panel : frame.HiddenTabs()) {
            panel->UI_SetParent(nullptr);
            out.push_back(panel);
        }
        frame.DestroyHiddenTabs();
    };
    for (TopLevelWindow* window : GetWindows()) {
        for (std::size_t i = 0; i < window->ChildSize(); ++i) {
            if (auto* frame = dynamic_cast<WorkspaceFrame*>(window->ChildGet(i))) {
                gather(*frame);
            }
        }
        for (auto const& frame : window->HiddenFrames()) {
            gather(*frame);
        }
    }
    for (auto const& record : removedWindowData_) {
        for (auto const& panel : record->hiddenPanels) {
            panel->UI_SetParent(nullptr);
            out.push_back(panel);
        }
    }
}

void Workspace::SaveWorkspaceData(orvcore::proplist::PropList& list) const {
    std::int32_t i = 0;
    for (auto const& record : removedWindowData_) {
        orvcore::proplist::PropList* out = list.NewSubList("FrameReanim-" + std::to_string(i++));
        out->SetValue("RemovedTabs",
                      std::vector<std::string>(record->tabTypes.begin(), record->tabTypes.end()));
        out->SetValue("WinSerData", record->windowXml);
        std::set<std::string> hiddenTypes;
        for (auto const& panel : record->hiddenPanels) {
            hiddenTypes.insert(panel->GetTabType());
        }
        out->SetValue("HiddenTabs", std::vector<std::string>(hiddenTypes.begin(), hiddenTypes.end()));
    }
    list.SetValue("FrameReanimMax", i);
}

void Workspace::ReadWorkspaceData(orvcore::proplist::PropList const& list,
                                  std::list<boost::intrusive_ptr<TabPanel>>& pool) {
    removedWindowData_.clear();
    std::int32_t count = 0;
    list.GetValue("FrameReanimMax", count);
    for (std::int32_t i = 0; i < count; ++i) {
        // A count naming a record that is not there skips it.
        if (orvcore::proplist::PropList const* entry = list.GetSubList("FrameReanim-" + std::to_string(i))) {
            removedWindowData_.push_back(new WindowReanimateData(*this, *entry, pool));
        }
    }
}

// --- Drawing and resources ---

canvasor::SupplierInterface* Workspace::GetOSDrawSupplier() const {
    return UI_NodeManager::Get()->GetOSDrawSupplier();
}

void Workspace::ResetDisplaySettings() {
    monitorInfo_->Refresh();
}

orvui::utility::ResourceManager* Workspace::GetResourceManager() const {
    if (!resourceManager_) {
        orvcore::config::ThrowError(orvcore::config::errors::UnableToAccessResource);
    }
    return resourceManager_.get();
}

void Workspace::SetResourceManager(std::unique_ptr<orvui::utility::ResourceManager> manager) {
    resourceManager_ = std::move(manager);
    for (int i = 0; i < 3; ++i) {
        images_[i] = nullptr;
        imagesLoaded_[i] = false;
    }
}

canvasor::FileImageP Workspace::GetImage(WorkspaceImage image) const {
    int index = int(image);
    if (index < 0 || index > 2) {
        return nullptr;
    }
    if (!imagesLoaded_[index]) {
        static char const* const names[] = {"closebox", "gripper", "DownArrow"};
        if (resourceManager_ && drawSupplier_) {
            images_[index] = drawSupplier_->MakeFileImage(resourceManager_->GetResource("png", names[index]));
        }
        imagesLoaded_[index] = true;
    }
    return images_[index];
}

void Workspace::HandleUserResize(bool begin, UI_Node* node, bool flag) {
    auto* window = dynamic_cast<TopLevelWindow*>(node);
    if (!window) {
        return;
    }
    if (begin) {
        NotifyTopLevelUserResizeBegin(window, flag);
    } else {
        NotifyTopLevelUserResizeEnd(window, flag);
    }
}

} // namespace orvworkspace::workspace
