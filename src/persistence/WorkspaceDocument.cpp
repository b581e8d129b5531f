// Writing and reading the workspace document.
#include "persistence/WorkspaceDocument.h"

#include "frames/TablessWorkspaceFrame.h"
#include "frames/WorkspaceBorderElement.h"
#include "frames/WorkspaceFrame.h"
#include "host/core/Error.h"
#include "host/core/ErrorTable.h"
#include "host/core/PropList.h"
#include "host/core/PropListUtils.h"
#include "host/ui/MonitorInfo.h"
#include "host/ui/NodeManager.h"
#include "layout/FrameDataProxy.h"
#include "layout/Splitter.h"
#include "workspace/TabCreator.h"
#include "workspace/TabPanel.h"
#include "workspace/TopLevelWindow.h"
#include "workspace/Workspace.h"

#include <algorithm>
#include <functional>
#include <set>
#include <unordered_set>

namespace orvworkspace::workspace {

using orvcore::proplist::PropList;
using orvui::ui::UI_Node;
using orvui::ui::UI_NodeManager;

namespace {

struct StaticPlace {
    LayoutManager::InsertionType side;
    char const* flagKey;
    char const* typeKey;
};
// In the order they are written and read.
constexpr StaticPlace StaticPlaces[] = {{LayoutManager::Top, "HasToolBar", "ToolBarTabType"},
                                        {LayoutManager::Left, "HasLeftBar", "LeftBarTabType"},
                                        {LayoutManager::Right, "HasRightBar", "RightBarTabType"},
                                        {LayoutManager::Bottom, "HasStatBar", "StatBarTabType"}};

std::string Numbered(char const* prefix, std::size_t index) {
    return prefix + std::to_string(index);
}

// --- Saving ---

void SaveFrameProxy(TabDataList const& entries, PropList& list) {
    PropList* proxy = list.NewSubList("FrameProxy");
    std::vector<std::string> types;
    for (std::size_t k = 0; k < entries.size(); ++k) {
        proxy->SetValue(Numbered("HidTabState-", k), entries[k].second);
        types.push_back(entries[k].first);
    }
    proxy->SetValue("TabIDs", types);
}

void SaveFrame(Frame const& frame, PropList& list, bool framesAsProxies) {
    TabDataList visible, removed, hidden;
    frame.GetTabData(visible, removed, hidden);
    if (framesAsProxies) {
        TabDataList all = visible;
        all.insert(all.end(), hidden.begin(), hidden.end());
        all.insert(all.end(), removed.begin(), removed.end());
        SaveFrameProxy(all, list);
        return;
    }
    auto* host = static_cast<WorkspaceFrameBase*>(const_cast<Frame&>(frame).GetHostData());
    PropList* out = list.NewSubList("Frame");
    out->SetValue("Vis", frame.IsFrameShown());
    out->SetValue("CurrTab", std::int32_t(host ? host->GetFrontTabIndex() : 0));
    std::vector<std::string> types;
    for (long i = 0; host && i < host->GetTabCount(); ++i) {
        types.push_back(host->GetTabPanel(i)->GetTabType());
    }
    out->SetValue("TabIDs", types);
    for (std::size_t j = 0; j < visible.size(); ++j) {
        out->SetValue(Numbered("VisTabState-", j), visible[j].second);
    }
    std::vector<std::string> reanimTypes;
    for (TabDataList const* group : {&hidden, &removed}) {
        for (auto const& entry : *group) {
            out->SetValue(Numbered("HidTabState-", reanimTypes.size()), entry.second);
            reanimTypes.push_back(entry.first);
        }
    }
    if (!reanimTypes.empty()) {
        out->SetValue("ReanimTabs", reanimTypes);
    }
}

void SaveSplitter(Splitter const& splitter, PropList& list, bool framesAsProxies);

void SaveLayoutElement(LayoutManagerElement* element, PropList& list, bool framesAsProxies) {
    if (Splitter* s = AsSplitter(element)) {
        SaveSplitter(*s, list, framesAsProxies);
    } else if (FrameDataProxy* proxy = AsPlaceholder(element)) {
        SaveFrameProxy(proxy->GetTabData(), list);
    } else if (Frame* f = AsFrame(element)) {
        SaveFrame(*f, list, framesAsProxies);
    }
}

void SaveSplitter(Splitter const& splitter, PropList& list, bool framesAsProxies) {
    PropList* out = list.NewSubList("Splitter");
    out->SetValue("Orient", splitter.IsVertical());
    out->SetValue("Place", splitter.GetPlacement());
    out->SetValue("Sub1Vis", splitter.IsLeftOrTopSubtreeVisible());
    out->SetValue("Sub2Vis", splitter.IsRightOrBottomSubtreeVisible());
    if (splitter.GetLeftOrTop()) {
        SaveLayoutElement(splitter.GetLeftOrTop(), *out->NewSubList("Sub1"), framesAsProxies);
    }
    if (splitter.GetRightOrBottom()) {
        SaveLayoutElement(splitter.GetRightOrBottom(), *out->NewSubList("Sub2"), framesAsProxies);
    }
}

} // namespace

// --- Restoring ---

void Unplace(TabPanel& panel) {
    if (auto* frame = dynamic_cast<WorkspaceFrame*>(panel.GetFrame())) {
        for (long i = 0; i < frame->GetTabCount(); ++i) {
            if (frame->GetTabPanel(i) == &panel) {
                frame->DetachTabPanel(i);
                return;
            }
        }
    } else if (auto* tabless = dynamic_cast<TablessWorkspaceFrame*>(panel.GetFrame())) {
        tabless->DetachTabPanel(0);
    }
}

boost::intrusive_ptr<TabPanel> TakeOrCreateTabPanel(Workspace& workspace, std::string const& type,
                                                    ReusableTabPool& pool, WorkspaceFrameBase* frame) {
    auto found =
        std::find_if(pool.begin(), pool.end(), [&](auto const& p) { return p->GetTabType() == type; });
    if (found != pool.end()) {
        boost::intrusive_ptr<TabPanel> panel = *found;
        pool.erase(found);
        Unplace(*panel);
        return panel;
    }
    TabCreator* creator = workspace.FindCreator(type);
    return creator ? creator->CreateTabPanel(&workspace, frame) : nullptr;
}

namespace {

void LoadState(TabPanel& panel, std::string const& state) {
    if (state.empty()) {
        return;
    }
    PropList list;
    try {
        orvcore::proplist::utils::ReadPropList(state, list);
    } catch (orvcore::config::Error const&) {
        return; // a damaged state leaves the panel as it is; the rest of the document still restores
    }
    panel.LoadStateData(&list);
}

struct Restorer {
    TopLevelWindow& window;
    Workspace& workspace;
    ReusableTabPool& pool;
    std::vector<boost::intrusive_ptr<WorkspaceFrame>>& frames;

    LayoutManager* Layout() const { return window.GetLayoutManager(); }

    void RestoreSplitter(Splitter* splitter, PropList const& list, int depth) {
        PropList const* in = list.GetSubList("Splitter");
        if (!in) {
            return;
        }
        bool flag = false;
        splitter->SetVertical(in->GetValue("Orient", flag) && flag);
        float place = 0.0f;
        in->GetValue("Place", place);
        splitter->SetPlacement(place);
        flag = false;
        splitter->SetLeftOrTopVisible(in->GetValue("Sub1Vis", flag) && flag);
        flag = false;
        splitter->SetRightOrBottomVisible(in->GetValue("Sub2Vis", flag) && flag);
        if (depth >= MaxSplitterDepth) {
            return;
        }
        if (PropList const* sub = in->GetSubList("Sub1")) {
            RestoreLayoutElement(splitter, *sub, true, depth);
        }
        if (PropList const* sub = in->GetSubList("Sub2")) {
            RestoreLayoutElement(splitter, *sub, false, depth);
        }
    }

    void RestoreLayoutElement(Splitter* parent, PropList const& list, bool leftOrTop, int depth) {
        if (PropList const* splitterList = list.GetSubList("Splitter")) {
            bool vertical = false;
            splitterList->GetValue("Orient", vertical);
            auto* splitter = new Splitter(Layout(), vertical);
            PutOnSide(parent, splitter, leftOrTop);
            RestoreSplitter(splitter, list, depth + 1);
        } else if (PropList const* frameList = list.GetSubList("Frame")) {
            RestoreFrame(parent, *frameList, leftOrTop);
        } else if (PropList const* proxyList = list.GetSubList("FrameProxy")) {
            TabDataList pairs;
            std::vector<std::string> types;
            proxyList->GetValue("TabIDs", types);
            for (std::size_t k = 0; k < types.size(); ++k) {
                std::string state;
                proxyList->GetValue(Numbered("HidTabState-", k), state);
                pairs.emplace_back(types[k], state);
            }
            MakeFrameProxy(window, workspace, pairs, pool, parent, leftOrTop);
        }
    }

    void RestoreFrame(Splitter* parent, PropList const& list, bool leftOrTop) {
        boost::intrusive_ptr<WorkspaceFrame> frame = window.CreateWorkspaceFrame();
        std::vector<std::string> types;
        list.GetValue("TabIDs", types);
        for (std::size_t j = 0; j < types.size(); ++j) {
            boost::intrusive_ptr<TabPanel> panel =
                TakeOrCreateTabPanel(workspace, types[j], pool, frame.get());
            if (!panel) {
                continue;
            }
            std::string state;
            if (list.GetValue(Numbered("VisTabState-", j), state)) {
                LoadState(*panel, state);
            }
            if (auto* element = dynamic_cast<WorkspaceBorderElement*>(panel.get())) {
                element->ConvertToRegularTab();
            }
            frame->AddTab(panel, false);
        }
        bool kept = frame->GetTabCount() > 0;
        TabDataList pairs;
        std::vector<std::string> reanim;
        list.GetValue("ReanimTabs", reanim);
        for (std::size_t k = 0; k < reanim.size(); ++k) {
            std::string state;
            if (list.GetValue(Numbered("HidTabState-", k), state)) {
                pairs.emplace_back(reanim[k], state);
            }
        }
        if (!kept) {
            window.ChildRemove(frame.get());
            if (!pairs.empty()) {
                MakeFrameProxy(window, workspace, pairs, pool, parent, leftOrTop);
            }
            return;
        }
        PutOnSide(parent, frame->GetLMFrame(), leftOrTop);
        TabDataList removed =
            KeepClosedTabs(workspace, pairs, pool, [&]() -> WorkspaceFrame& { return *frame; });
        if (!removed.empty()) {
            frame->SetRemovedTabData(removed);
        }
        std::int32_t current = 0;
        list.GetValue("CurrTab", current);
        current = std::clamp<std::int32_t>(current, 0, std::int32_t(frame->GetTabCount() - 1));
        frame->BringTabToFront(current);
        frames.push_back(frame);
    }
};

} // namespace

// --- Shared with the builders ---

boost::intrusive_ptr<TopLevelWindow>
NextWindowToFill(Workspace& workspace, std::list<boost::intrusive_ptr<TopLevelWindow>>& existing) {
    if (existing.empty()) {
        return workspace.AddTopLevelWindow(workspace.GetMainTopLevelWindow() == nullptr, nullptr);
    }
    boost::intrusive_ptr<TopLevelWindow> window = existing.front();
    existing.pop_front();
    RemoveStaticElements(*window);
    return window;
}

void RemoveStaticElements(TopLevelWindow& window) {
    for (StaticPlace const& place : StaticPlaces) {
        if (window.HasStaticElement(place.side)) {
            window.RemoveStaticElement(place.side, false);
        }
    }
}

void PutOnSide(Splitter* parent, LayoutManagerElement* child, bool leftOrTop) {
    child->SetParent(parent);
    if (leftOrTop) {
        parent->SetLeftOrTop(child);
    } else {
        parent->SetRightOrBottom(child);
    }
}

TabDataList KeepClosedTabs(Workspace& workspace, TabDataList const& pairs, ReusableTabPool& pool,
                           std::function<WorkspaceFrame&()> const& keeper) {
    TabDataList removed;
    for (auto const& pair : pairs) {
        if (!workspace.TabTypeHidesWhenClosed(pair.first)) {
            removed.push_back(pair);
            continue;
        }
        if (boost::intrusive_ptr<TabPanel> panel =
                TakeOrCreateTabPanel(workspace, pair.first, pool, nullptr)) {
            panel->SetFrame(nullptr);
            LoadState(*panel, pair.second);
            keeper().CacheTabData(panel, true);
        }
    }
    return removed;
}

void MakeFrameProxy(TopLevelWindow& window, Workspace& workspace, TabDataList const& pairs,
                    ReusableTabPool& pool, Splitter* parent, bool leftOrTop) {
    boost::intrusive_ptr<WorkspaceFrame> hiddenFrame;
    TabDataList removed = KeepClosedTabs(workspace, pairs, pool, [&]() -> WorkspaceFrame& {
        if (!hiddenFrame) {
            hiddenFrame = window.CreateWorkspaceFrame();
            window.ChildRemove(hiddenFrame.get()); // kept out of the window until it comes back
        }
        return *hiddenFrame;
    });
    FrameDataProxy* proxy = nullptr;
    if (hiddenFrame) {
        hiddenFrame->ShowFrame(false);
        window.AddHiddenFrame(hiddenFrame);
        hiddenFrame->SetRemovedTabData(removed);
        // The placeholder carries the remembered tabs as well, as one left by removing a frame
        // does; it alone is what the next save writes.
        proxy = new FrameDataProxy(window.GetLayoutManager(), hiddenFrame->GetLMFrame(), removed);
    } else {
        proxy = new FrameDataProxy(window.GetLayoutManager(), removed);
    }
    PutOnSide(parent, proxy, leftOrTop);
    if (leftOrTop) {
        parent->SetLeftOrTopVisible(false);
    } else {
        parent->SetRightOrBottomVisible(false);
    }
}

void InstallTree(TopLevelWindow& window, Splitter* root,
                 std::vector<boost::intrusive_ptr<WorkspaceFrame>>& frames) {
    window.ResetRootFrame(root, frames);
    std::unordered_set<UI_Node const*> built;
    for (auto const& frame : frames) {
        built.insert(frame.get());
    }
    window.ChildRemoveIf(
        [&](UI_Node* child) { return dynamic_cast<WorkspaceFrame*>(child) && !built.count(child); });
}

// --- Paths ---

std::string GetMaximizedFramePath(Frame const* frame) {
    std::string path;
    for (LayoutManagerElement const* e = frame; e && e->GetParent(); e = e->GetParent()) {
        path += e->GetParent()->GetLeftOrTop() == e ? '0' : '1';
    }
    std::reverse(path.begin(), path.end());
    return path;
}

Frame* FindFrameByPath(std::string const& path, Splitter* root) {
    if (!root || root->GetParent() || path.empty()) {
        return nullptr;
    }
    LayoutManagerElement* e = root;
    for (char c : path) {
        Splitter* s = AsSplitter(e);
        if (!s || (c != '0' && c != '1')) {
            return nullptr;
        }
        e = c == '0' ? s->GetLeftOrTop() : s->GetRightOrBottom();
    }
    return AsPlaceholder(e) ? nullptr : AsFrame(e);
}

// --- Windows ---

void SaveTopLevelWindow(TopLevelWindow& window, PropList& list, bool framesAsProxies) {
    RectT r = window.UI_GetGlobalStructureRect();
    list.SetValue("SzPos", std::vector<std::int32_t>{r.left, r.top, r.width, r.height});
    if (window.IsMain()) {
        window.SaveWindowStateData(*list.NewSubList("WinState"));
    }
    LayoutManager* layout = window.GetLayoutManager();
    if (layout->HasMaximizedFrame()) {
        list.SetValue("MaxFramePath", GetMaximizedFramePath(layout->GetMaximizedFrame()));
    }
    if (Splitter* root = layout->GetRootSplitter()) {
        SaveSplitter(*root, list, framesAsProxies);
    }
    for (StaticPlace const& place : StaticPlaces) {
        TabPanel* element =
            window.HasStaticElement(place.side) ? window.GetStaticElement(place.side) : nullptr;
        list.SetValue(place.flagKey, element != nullptr);
        if (element) {
            list.SetValue(place.typeKey, element->GetTabType());
        }
    }
}

void RestoreTopLevelWindow(TopLevelWindow& window, PropList const& list, ReusableTabPool& pool,
                           bool restoreBounds, bool restoreMaximizedFrame, bool forceRelayout) {
    Workspace* workspace = window.GetWorkspace();
    if (!workspace) {
        return;
    }
    UI_NodeManager::GroupingFocusChanges grouping;
    boost::intrusive_ptr<TopLevelWindow> keep(window.IsReferenced() ? &window : nullptr);
    // The window is painted once, after the restore, not after every step of rebuilding it. It is
    // marked whole from the start, so the many nodes that move on the way mark nothing more.
    struct RedrawsSuspended {
        TopLevelWindow& window;
        explicit RedrawsSuspended(TopLevelWindow& w)
            : window(w) {
            window.SuspendRedraws(true);
            window.UI_Invalidate();
        }
        ~RedrawsSuspended() {
            window.SuspendRedraws(false);
            window.UI_Invalidate();
        }
    } suspended(window);
    std::vector<std::int32_t> sz;
    list.GetValue("SzPos", sz);
    sz.resize(4, 0);
    RectT saved(sz[0], sz[1], sz[2], sz[3]);

    // The hidden frames the window had go with the old tree; their panels are in the pool.
    auto oldHidden = window.TakeHiddenFrames();

    std::vector<boost::intrusive_ptr<WorkspaceFrame>> frames;
    auto* root = new Splitter(window.GetLayoutManager(), false);
    Restorer restorer{window, *workspace, pool, frames};
    restorer.RestoreSplitter(root, list, 0);

    bool relayout = false;
    if (restoreBounds) {
        PropList const* state = list.GetSubList("WinState");
        if (!state || !window.RestoreWindowStateData(*state)) {
            relayout = forceRelayout;
            RectT rect = saved;
            if (orvui::utility::MonitorInfo* monitors = workspace->ORV_GetMonitorInfo()) {
                monitors->EnsureRectIsVisible(rect);
            }
            if (rect.width > 0 && rect.height > 0) {
                window.UI_SetGlobalStructureRect(rect);
            }
        }
    }
    window.UI_Show(true);
    InstallTree(window, root, frames);
    if (window.IsMain()) {
        for (StaticPlace const& place : StaticPlaces) {
            bool has = false;
            std::string type;
            if (list.GetValue(place.flagKey, has) && has && list.GetValue(place.typeKey, type)) {
                // A bar's panel comes through the pool like any tab, so it keeps its identity.
                if (auto panel = TakeOrCreateTabPanel(*workspace, type, pool, nullptr)) {
                    window.SetStaticElement(panel, place.side, false);
                }
            }
        }
    }
    RectT outer = window.UI_GetGlobalStructureRect();
    if (saved.width != outer.width || saved.height != outer.height) {
        relayout = true;
    }
    orvui::ui::RectF local = window.UI_GetLocalBounds();
    RectT localRect(0, 0, std::int32_t(local.width), std::int32_t(local.height));
    window.GetLayoutManager()->Layout(localRect, false, true, false);
    if (relayout) {
        window.GetLayoutManager()->Layout(localRect, true, true, false);
    }
    std::string path;
    if (restoreMaximizedFrame && list.GetValue("MaxFramePath", path)) {
        if (Frame* frame = FindFrameByPath(path, window.GetLayoutManager()->GetRootSplitter())) {
            window.GetLayoutManager()->SetMaximizedFrame(frame);
        }
    }
}

ReusableTabPool CollectReusableTabs(Workspace& workspace) {
    ReusableTabPool pool;
    for (TopLevelWindow* window : workspace.GetWindows()) {
        for (std::size_t i = 0; i < window->ChildSize(); ++i) {
            if (auto* frame = dynamic_cast<WorkspaceFrameBase*>(window->ChildGet(i))) {
                for (long t = 0; t < frame->GetTabCount(); ++t) {
                    if (TabPanel* panel = frame->GetTabPanel(t); panel && panel->IsReferenced()) {
                        pool.emplace_back(panel);
                    }
                }
            }
        }
    }
    workspace.FindAllHiddenTabs(pool);
    // A panel kept by a closed-window record may also sit in a frame's list; each is pooled once, at
    // its first place. Duplicates are rare, so they are found by sorting a copy of the pointers.
    std::vector<TabPanel*> sorted;
    sorted.reserve(pool.size());
    for (auto const& panel : pool) {
        sorted.push_back(panel.get());
    }
    std::sort(sorted.begin(), sorted.end());
    if (std::adjacent_find(sorted.begin(), sorted.end()) != sorted.end()) {
        std::set<TabPanel*> seen;
        pool.remove_if([&](auto const& panel) { return !seen.insert(panel.get()).second; });
    }
    return pool;
}

// --- Documents ---

void SaveWorkspace(Workspace& workspace, PropList& list, std::u16string const& userName) {
    list.SetValue("ORV_Wrkspce", std::string(WorkspaceDocumentVersion));
    if (!userName.empty()) {
        list.SetValue("UserName", userName);
    }
    if (orvui::utility::MonitorInfo* monitors = workspace.ORV_GetMonitorInfo()) {
        monitors->SaveToPropList(*list.NewSubList("MonitorInfo"));
    }
    std::int32_t count = 0;
    for (TopLevelWindow* window : workspace.GetWindows()) {
        SaveTopLevelWindow(*window, *list.NewSubList(Numbered("TopLevelFrame-", std::size_t(count))), false);
        ++count;
    }
    list.SetValue("SerCfgMax", count);
    workspace.SaveWorkspaceData(*list.NewSubList("WSInstanceData"));
}

bool IsCompatibleVersion(PropList const& list) {
    std::string version;
    return list.GetValue("ORV_Wrkspce", version) && version == WorkspaceDocumentVersion;
}

std::u16string GetWorkspaceUserName(PropList const& list) {
    std::u16string name;
    list.GetValue("UserName", name);
    return name;
}

void SetMainWindowGlobalRect(PropList& list, RectT const& rect) {
    std::string version;
    PropList* first = list.GetSubList("TopLevelFrame-0");
    if (!list.GetValue("ORV_Wrkspce", version) || !first) {
        orvcore::config::ThrowError(orvcore::config::errors::InvalidWorkspace);
    }
    first->SetValue("SzPos", std::vector<std::int32_t>{rect.left, rect.top, rect.width, rect.height});
    first->RemoveValue("WinState");
}

bool RestoreWorkspace(Workspace& workspace, PropList const& list, bool restoreMainWindowBounds,
                      bool restoreMaximizedFrames, bool forceRelayout) {
    workspace.NotifyRestoreWorkspaceBegin();
    UI_NodeManager::GroupingFocusChanges grouping;
    std::string version;
    if (!list.GetValue("ORV_Wrkspce", version)) {
        orvcore::config::ThrowError(orvcore::config::errors::InvalidWorkspace);
    }
    if (version != WorkspaceDocumentVersion) {
        orvcore::config::ThrowError(orvcore::config::errors::UnableToLoadWorkspace);
    }
    ReusableTabPool pool = CollectReusableTabs(workspace);

    std::list<boost::intrusive_ptr<TopLevelWindow>> existing;
    for (TopLevelWindow* window : workspace.GetWindows()) {
        existing.emplace_back(window);
        if (!window->IsMain()) {
            window->UI_Show(false);
        }
        window->GetLayoutManager()->SetMaximizedFrame(nullptr);
    }
    std::int32_t count = 0;
    list.GetValue("SerCfgMax", count);
    for (std::int32_t i = 0; i < count; ++i) {
        boost::intrusive_ptr<TopLevelWindow> window = NextWindowToFill(workspace, existing);
        if (PropList const* windowList = list.GetSubList(Numbered("TopLevelFrame-", std::size_t(i)))) {
            RestoreTopLevelWindow(*window, *windowList, pool,
                                  window->IsMain() ? restoreMainWindowBounds : true, restoreMaximizedFrames,
                                  forceRelayout);
        }
        if (!window->IsMain() && window->GetFrameCount() == 0) {
            existing.push_back(window);
        }
    }
    if (PropList const* instance = list.GetSubList("WSInstanceData")) {
        workspace.ReadWorkspaceData(*instance, pool);
    }
    for (auto const& window : existing) {
        if (window->IsMain()) {
            continue;
        }
        // Whatever such a window still holds came through the pool and is orphaned below.
        RemoveStaticElements(*window);
        workspace.RemoveWindow(window.get(), false);
    }
    for (auto const& panel : pool) {
        workspace.NotifyPreOrphaning(panel.get());
    }
    while (!pool.empty()) {
        boost::intrusive_ptr<TabPanel> panel = std::move(pool.front());
        pool.pop_front();
        Unplace(*panel);
        workspace.NotifyOrphaning(panel.get());
    }
    if (TopLevelWindow* main = workspace.GetMainTopLevelWindow()) {
        main->Activate(true);
    }
    workspace.NotifyRestoreWorkspaceEnd();
    return true;
}

} // namespace orvworkspace::workspace

namespace orvworkspace::config {
std::u16string GetVersionString() {
    return u"2.0.0"
           u"."
           u"420171";
}
} // namespace orvworkspace::config
