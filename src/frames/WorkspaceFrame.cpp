// The tabbed frame: tabs and panels kept in step, the frame's rectangles, closed panels remembered
// for reopening, and the tab well's gestures.
#include "frames/WorkspaceFrame.h"

#include "host/core/Error.h"
#include "host/core/ErrorTable.h"
#include "host/core/Localizer.h"
#include "host/core/PropList.h"
#include "host/core/PropListUtils.h"
#include "host/ui/Desktop.h"
#include "host/ui/Menu.h"
#include "host/ui/NodeManager.h"
#include "layout/Splitter.h"
#include "workspace/TabCreator.h"
#include "workspace/TabPanel.h"
#include "workspace/TopLevelWindow.h"
#include "workspace/Tracker.h"
#include "workspace/Workspace.h"
#include "workspace/WorkspaceUtils.h"

#include <algorithm>
#include <cmath>

namespace orvworkspace::workspace {

using namespace orvui::ui;
using orvui::controls::UI_TabWell;

namespace {
// The focus stroke inset, read once, rounded half away from zero.
std::int32_t const FocusStrokeInset =
    std::int32_t(std::lround(orvui::controls::GetFrontmostFocusedStrokeSize()));
} // namespace

WorkspaceFrame::WorkspaceFrame(TopLevelWindow* window, RectT const& rect)
    : WorkspaceFrameBase(window) {
    UI_SetNodeID("WorkspaceFrame");
    boost::intrusive_ptr<UI_TabWell> well(new UI_TabWell(
        [this](int action, long index, RectT const* r) { HandleTabItemAction(action, index, r); }));
    ChildPushBack(well);
    boost::intrusive_ptr<TabPanelContainer> container(new TabPanelContainer);
    ChildPushBack(container);
    well_ = well;
    container_ = container;
    SetSizeAndPos(window->GetLayoutManager()->ConstructFrameZones(rect));
    ChildGet(0)->UI_Show(true);
    ChildGet(1)->UI_Show(true);
}

WorkspaceFrame::~WorkspaceFrame() {
    // Panels that outlive their frame (held by the host) must not point at it any more.
    auto* container = ChildSize() > 1 ? dynamic_cast<TabPanelContainer*>(ChildGet(1)) : nullptr;
    for (std::size_t i = 0; container && i < container->ChildSize(); ++i) {
        if (auto* panel = dynamic_cast<TabPanel*>(container->ChildGet(i));
            panel && panel->GetFrame() == this) {
            panel->SetFrame(nullptr);
        }
    }
    for (auto const& hidden : hiddenTabs_) {
        if (hidden->GetFrame() == this) {
            hidden->SetFrame(nullptr);
        }
    }
}

UI_TabWell* WorkspaceFrame::GetTabWell() const {
    if (well_ && ChildSize() > 0 && ChildGet(0) == well_.get()) {
        return well_.get();
    }
    auto* well = dynamic_cast<UI_TabWell*>(ChildGet(0));
    if (!well) {
        orvcore::config::ThrowError(orvcore::config::errors::InvalidTypeConversion);
    }
    return well;
}

TabPanelContainer* WorkspaceFrame::GetContainer() const {
    if (container_ && ChildSize() > 1 && ChildGet(1) == container_.get()) {
        return container_.get();
    }
    auto* container = dynamic_cast<TabPanelContainer*>(ChildGet(1));
    if (!container) {
        orvcore::config::ThrowError(orvcore::config::errors::InvalidTypeConversion);
    }
    return container;
}

// --- Rectangles and sizes ---

int WorkspaceFrame::GetTabPosition() const {
    RectT inner = GetFrameRect();
    if (inner.width <= inner.height) {
        return 0;
    }
    return GetTabWell()->ShouldDisplayTabless() ? 1 : 0;
}

RectT WorkspaceFrame::FrameRectToTabWellRect(RectT const& r) const {
    UI_TabWell* well = GetTabWell();
    if (GetTabPosition() == 1) {
        return RectT(r.left, r.top, well->GetTabWellHeight(r.height), r.height);
    }
    return RectT(r.left, r.top, r.width, well->GetTabWellHeight(r.width));
}

RectT WorkspaceFrame::FrameRectToTabPanelRect(RectT const& r) const {
    RectT panel = r.Inset(FocusStrokeInset, FocusStrokeInset);
    RectT well = FrameRectToTabWellRect(r);
    if (GetTabPosition() == 1) {
        std::int32_t right = panel.Right();
        panel.left = well.left + well.width;
        panel.width = right - panel.left;
    } else {
        std::int32_t bottom = panel.Bottom();
        panel.top = well.top + well.height;
        panel.height = bottom - panel.top;
    }
    return panel;
}

RectT WorkspaceFrame::GetTabPanelRect() const {
    return FrameRectToTabPanelRect(GetFrameRect());
}

RectT WorkspaceFrame::GetTabWellRect() const {
    return FrameRectToTabWellRect(GetFrameRect());
}

PointT WorkspaceFrame::GetMinimumSize() const {
    FrameZones const& z = GetZones();
    Workspace* workspace = GetWorkspace();
    long tabMin = workspace ? workspace->GetTabMinWidth() : 0;
    return PointT(std::int32_t(tabMin + z.EdgeSize(FrameZones::Left) + z.EdgeSize(FrameZones::Right)),
                  std::int32_t(z.EdgeSize(FrameZones::Top) + z.EdgeSize(FrameZones::Bottom) +
                               orvui::controls::GetTabWellMinHeight()));
}

void WorkspaceFrame::GetSnapSizes(std::vector<PointT>& sizes) const {
    TabPanel* front = GetFrontTabPanel();
    if (!front) {
        return;
    }
    std::vector<PointT> panelSizes;
    front->GetSnapSizes(panelSizes);
    for (PointT size : panelSizes) {
        PointT converted = size;
        ConvertTabToFrameSize(converted);
        // 0 means no wish in that direction and stays 0.
        sizes.emplace_back(size.x ? converted.x : 0, size.y ? converted.y : 0);
    }
}

void WorkspaceFrame::ConvertTabToFrameSize(PointT& size) const {
    WorkspaceFrameBase::ConvertTabToFrameSize(size);
    (GetTabPosition() == 1 ? size.x : size.y) += GetTabWell()->GetTabWellHeight(0);
}

void WorkspaceFrame::ConvertFrameToTabSize(PointT& size) const {
    WorkspaceFrameBase::ConvertFrameToTabSize(size);
    (GetTabPosition() == 1 ? size.x : size.y) -= GetTabWell()->GetTabWellHeight(0);
}

void WorkspaceFrame::ConvertTabToFrameSizeIgnoreScrollbar(PointT& size) const {
    ConvertTabToFrameSize(size);
    (GetTabPosition() == 1 ? size.x : size.y) -= UI_TabWell::GetTabScrollbarHeight();
}

void WorkspaceFrame::ConvertFrameToTabSizeIgnoreScrollbar(PointT& size) const {
    ConvertFrameToTabSize(size);
    (GetTabPosition() == 1 ? size.x : size.y) += UI_TabWell::GetTabScrollbarHeight();
}

void WorkspaceFrame::SetSizeAndPos(FrameZones const& zones) {
    FrameZones previous = GetZones();
    WorkspaceFrameBase::SetSizeAndPos(zones);
    bool vertical = GetTabPosition() == 1;
    bool turned = GetTabWell()->SetTabWellIsVertical(vertical);
    if (GetZones() != previous || turned) {
        cachedTabPanelRect_ = RectT(-1, -1, -1, -1); // everything is laid out again
        UpdateForTabContainerChanges();
        if (turned) {
            for (long i = 0; i < GetTabCount(); ++i) {
                GetTabPanel(i)->NotifyOrientationChanged(vertical);
            }
        }
    }
}

void WorkspaceFrame::UpdateForTabContainerChanges() {
    RectT panelRect = GetTabPanelRect();
    if (panelRect == cachedTabPanelRect_) {
        return;
    }
    bool vertical = GetTabPosition() == 1;
    bool turned = GetTabWell()->SetTabWellIsVertical(vertical);
    cachedTabPanelRect_ = GetTabPanelRect();
    RectT well = GetTabWellRect();
    GetTabWell()->UI_SetRect(RectF(float(well.left), float(well.top), float(well.width), float(well.height)));
    RectT p = cachedTabPanelRect_;
    GetContainer()->UI_SetRect(RectF(float(p.left), float(p.top), float(p.width), float(p.height)));
    // Panels fill the container, which sits at the panel rectangle.
    for (long i = 0; i < GetTabCount(); ++i) {
        GetTabPanel(i)->UI_SetRect(RectF(0, 0, float(p.width), float(p.height)));
        if (turned) {
            GetTabPanel(i)->NotifyOrientationChanged(vertical);
        }
    }
}

// --- Tabs ---

long WorkspaceFrame::GetTabCount() const {
    return long(GetContainer()->ChildSize());
}

long WorkspaceFrame::GetFrontTabIndex() const {
    return GetTabWell()->GetFrontmost();
}

TabPanel* WorkspaceFrame::GetTabPanel(long index) const {
    if (index < 0 || index >= GetTabCount()) {
        return nullptr;
    }
    return dynamic_cast<TabPanel*>(GetContainer()->ChildGet(std::size_t(index)));
}

TabPanel* WorkspaceFrame::GetFrontTabPanel() const {
    if (!GetTabWell()->FrontmostIsValid() || GetTabCount() == 0) {
        return nullptr;
    }
    return GetTabPanel(GetFrontTabIndex());
}

long WorkspaceFrame::IndexOf(TabPanel const* panel) const {
    for (long i = 0; i < GetTabCount(); ++i) {
        if (GetTabPanel(i) == panel) {
            return i;
        }
    }
    return -1;
}

void WorkspaceFrame::AddTab(boost::intrusive_ptr<TabPanel> panel, long index, bool select) {
    if (!panel) {
        return;
    }
    index = std::clamp(index, 0L, GetTabCount());
    panel->SetFrame(this);
    GetContainer()->ChildInsert(std::size_t(index), panel);
    UI_TabWell* well = GetTabWell();
    well->AddTab(index, panel->GetDisplayName(), panel->AllowTabless(), panel->AllowClose());
    well->UpdateTabColor(index, panel->GetTabColor());
    well->SetMultitab(index, panel->IsMultiPaned());
    well->SetLockable(index, panel->IsLockable());
    if (panel->IsLockable()) {
        well->SetLocked(index, panel->GetLocked());
    }
    if (GetTabPanelRect() == cachedTabPanelRect_) {
        panel->UI_SetRect(RectF(0, 0, float(cachedTabPanelRect_.width), float(cachedTabPanelRect_.height)));
    } else {
        UpdateForTabContainerChanges();
    }
    BringTabToFront(index);
    if (!GetTopLevelWindow()->IsInterim() && select && GetWorkspace()) {
        GetWorkspace()->SetFocusedTabPanel(panel.get());
    }
    panel->NotifyOrientationChanged(well->GetTabWellIsVertical());
    UI_Invalidate();
}

TabPanel* WorkspaceFrame::AddTab(std::string const& tabType, bool select) {
    TabCreator* creator = GetWorkspace() ? GetWorkspace()->FindCreator(tabType) : nullptr;
    boost::intrusive_ptr<TabPanel> panel = creator ? creator->CreateTabPanel(GetWorkspace(), this) : nullptr;
    if (!panel) {
        return nullptr;
    }
    AddTab(panel, select);
    return panel.get();
}

void WorkspaceFrame::AddTabs(std::vector<boost::intrusive_ptr<TabPanel>> const& panels) {
    for (auto const& panel : panels) {
        AddTab(panel, GetTabCount(), true);
    }
}

void WorkspaceFrame::AddTabs(std::vector<std::string> const& tabTypes) {
    for (std::string const& type : tabTypes) {
        AddTab(type, true);
    }
}

void WorkspaceFrame::AddTabs(WorkspaceFrame* other) {
    if (!other || other == this) {
        return;
    }
    removedTabData_.insert(removedTabData_.end(), other->removedTabData_.begin(),
                           other->removedTabData_.end());
    other->removedTabData_.clear();
    hiddenTabs_.insert(hiddenTabs_.end(), other->hiddenTabs_.begin(), other->hiddenTabs_.end());
    other->hiddenTabs_.clear();
    std::vector<boost::intrusive_ptr<TabPanel>> moved;
    while (other->GetTabCount() > 0) {
        moved.push_back(other->DetachTabPanel(0));
    }
    AddTabs(moved);
}

boost::intrusive_ptr<TabPanel> WorkspaceFrame::DetachTabPanel(long index) {
    boost::intrusive_ptr<TabPanel> panel(GetTabPanel(index));
    if (!panel) {
        return nullptr;
    }
    panel->UI_Show(false);
    bool hadFocus = UI_HasKeyboardFocus(true);
    if (panel->UI_HasKeyboardFocus(true)) {
        panel->UI_LoseKeyboardFocus();
    }
    panel->SetFrame(nullptr);
    UI_TabWell* well = GetTabWell();
    // Taking out a tab behind the front one leaves the front panel in front (the well moves its
    // index along); taking out the front tab brings the next one forward, or the previous one when
    // it was the last.
    long front = well->GetFrontmost();
    bool cleared = front == index;
    if (cleared) {
        well->SetFrontmost(-1);
    }
    well->RemoveTab(index);
    GetContainer()->ChildRemove(panel.get());
    UpdateForTabContainerChanges();
    if (cleared && GetTabCount() > 0) {
        well->SetFrontmost(front < GetTabCount() ? front : front - 1);
    }
    if (GetTabCount() > 0 && hadFocus) {
        FocusFrontPanel();
    }
    return panel;
}

void WorkspaceFrame::BringTabToFront(long index) {
    GetTabWell()->SetFrontmost(index);
}

void WorkspaceFrame::BringTabToFront(TabPanel* panel) {
    long index = IndexOf(panel);
    if (index >= 0) {
        BringTabToFront(index);
    }
}

void WorkspaceFrame::MoveTabPanel(long from, long to) {
    if (from < 0 || to < 0 || from >= GetTabCount() || to >= GetTabCount()) {
        return;
    }
    GetContainer()->ChildMove(GetContainer()->ChildGet(std::size_t(from)), std::size_t(to));
    GetTabWell()->MoveTab(from, to);
}

bool WorkspaceFrame::GetTabRect(long index, RectT& out) const {
    UI_TabWell* well = GetTabWell();
    if (index < 0 || index >= well->GetTabCount()) {
        return false;
    }
    RectF r = well->GetTabRect(index);
    RectF origin = well->UI_GetRect();
    out = RectT(std::int32_t(std::floor(r.left + origin.left)), std::int32_t(std::floor(r.top + origin.top)),
                std::int32_t(std::floor(r.width)), std::int32_t(std::floor(r.height)));
    return true;
}

bool WorkspaceFrame::GetTabIndexFromPos(PointT const& global, long& index) const {
    return GetTabInsertIndexFromPos(global, index, nullptr);
}

std::vector<RectT> WorkspaceFrame::GetTabRects() const {
    std::vector<RectT> rects;
    for (long i = 0; i < GetTabCount(); ++i) {
        RectT r;
        GetTabRect(i, r);
        rects.push_back(r);
    }
    return rects;
}

bool WorkspaceFrame::GetTabInsertIndexFromPos(PointT const& global, long& index,
                                              std::vector<RectT> const* tabRects) const {
    RectT well = GetTabWellGlobalRect();
    if (well.IsEmpty() || !well.Contains(global)) {
        return false;
    }
    std::vector<RectT> computed;
    if (!tabRects) {
        computed = GetTabRects();
        tabRects = &computed;
    }
    PointT local = UI_GlobalToLocal(global);
    for (std::size_t i = 0; i < tabRects->size(); ++i) {
        RectT const& r = (*tabRects)[i];
        if (!r.IsEmpty() && r.Contains(local)) {
            index = long(i);
            return true;
        }
    }
    return false;
}

void WorkspaceFrame::OfferTabDrag(bool wholeFrame, long index) {
    Workspace* workspace = GetWorkspace();
    if (!workspace || index < 0) {
        return;
    }
    Tracker* tracker = workspace->AcquireTabDragger(this, wholeFrame, static_cast<unsigned long>(index));
    if (!tracker) {
        return;
    }
    bool endAtOnce = false;
    tracker->Begin(orvui::ui::Desktop::Get().GetMousePosition(), &endAtOnce);
    if (endAtOnce) {
        workspace->ReleaseTracker(false);
    }
}

void WorkspaceFrame::TabPanelNameChanged(TabPanel const& panel) {
    long index = IndexOf(&panel);
    if (index >= 0) {
        GetTabWell()->UpdateTabName(index, panel.GetDisplayName());
        UpdateForTabContainerChanges();
    }
}

void WorkspaceFrame::TabColorChanged(TabPanel const& panel) {
    long index = IndexOf(&panel);
    if (index >= 0) {
        GetTabWell()->UpdateTabColor(index, panel.GetTabColor());
        UpdateForTabContainerChanges();
    }
}

void WorkspaceFrame::TabPanelCanCloseChanged(TabPanel const& panel) {
    if (long index = IndexOf(&panel); index >= 0) {
        GetTabWell()->SetCanClose(index, panel.AllowClose());
        UpdateForTabContainerChanges();
    }
}

void WorkspaceFrame::TabPanelLockableChanged(TabPanel const& panel) {
    if (long index = IndexOf(&panel); index >= 0) {
        GetTabWell()->SetLockable(index, panel.IsLockable());
        UpdateForTabContainerChanges();
    }
}

void WorkspaceFrame::TabPanelLockedChanged(TabPanel const& panel) {
    if (long index = IndexOf(&panel); index >= 0) {
        GetTabWell()->SetLocked(index, panel.GetLocked());
        UpdateForTabContainerChanges();
    }
}

void WorkspaceFrame::TabPanelMultitabChanged(TabPanel const& panel) {
    if (long index = IndexOf(&panel); index >= 0) {
        GetTabWell()->SetMultitab(index, panel.IsMultiPaned());
        UpdateForTabContainerChanges();
    }
}

// --- Closing ---

bool WorkspaceFrame::AllowFrameClose() const {
    for (long i = 0; i < GetTabCount(); ++i) {
        if (!GetTabPanel(i)->AllowClose()) {
            return false;
        }
    }
    return true;
}

void WorkspaceFrame::RemoveAllTabs(bool obliteratingOnly) {
    boost::intrusive_ptr<UI_Node> keep(IsReferenced() ? this : nullptr);
    for (long i = GetTabCount() - 1; i >= 0; --i) {
        GetTabPanel(i)->NotifyFrameIsClosing();
    }
    for (long i = GetTabCount() - 1; i >= 0; --i) {
        TabPanel* panel = GetTabPanel(i);
        if (panel && (!obliteratingOnly || panel->ObliterateWhenClosed())) {
            GetWorkspace()->RemoveTab(this, panel, true, true);
        }
    }
}

void WorkspaceFrame::CacheTabData(boost::intrusive_ptr<TabPanel> const& panel, bool keepPanel) {
    if (!panel) {
        return;
    }
    if (keepPanel) {
        hiddenTabs_.push_back(panel);
    } else {
        removedTabData_.emplace_back(panel->GetTabType(), panel->SaveStateText());
    }
}

void WorkspaceFrame::DetachHiddenTabs() {
    for (auto const& hidden : hiddenTabs_) {
        hidden->UI_SetParent(nullptr);
    }
}

void WorkspaceFrame::AddRemovedTabData(std::string const& tabType, std::string const& state) {
    removedTabData_.emplace_back(tabType, state);
}

bool WorkspaceFrame::CanReanimateTab(std::string const& tabType) const {
    return std::any_of(removedTabData_.begin(), removedTabData_.end(),
                       [&](auto const& entry) { return entry.first == tabType; });
}

bool WorkspaceFrame::CanReanimateTab(TabPanel const* panel) const {
    return std::any_of(hiddenTabs_.begin(), hiddenTabs_.end(),
                       [&](auto const& p) { return p.get() == panel; });
}

TabPanel* WorkspaceFrame::ReanimateTab(std::string const& tabType) {
    auto entry = std::find_if(removedTabData_.begin(), removedTabData_.end(),
                              [&](auto const& e) { return e.first == tabType; });
    if (entry == removedTabData_.end()) {
        return nullptr;
    }
    std::string state = entry->second;
    TabPanel* panel = AddTab(tabType, true);
    if (!panel) {
        return nullptr; // no creator made one: the remembered state stays for a later try
    }
    auto used = std::find(removedTabData_.begin(), removedTabData_.end(), std::make_pair(tabType, state));
    if (used != removedTabData_.end()) {
        removedTabData_.erase(used);
    }
    if (!state.empty()) {
        orvcore::proplist::PropList list;
        try {
            orvcore::proplist::utils::ReadPropList(state, list);
            panel->LoadStateData(&list);
        } catch (orvcore::config::Error const&) {
            // A damaged saved state leaves the panel as it was made; the panel still comes back.
        }
    }
    return panel;
}

bool WorkspaceFrame::ReanimateTab(boost::intrusive_ptr<TabPanel> const& panel) {
    auto found = std::find(hiddenTabs_.begin(), hiddenTabs_.end(), panel);
    if (found == hiddenTabs_.end()) {
        return false;
    }
    boost::intrusive_ptr<TabPanel> keep = *found;
    hiddenTabs_.erase(found);
    AddTab(keep, true);
    return true;
}

void WorkspaceFrame::DoGetTabData(TabDataList& visible, TabDataList& removed, TabDataList& hidden) const {
    for (long i = 0; i < GetTabCount(); ++i) {
        TabPanel* panel = GetTabPanel(i);
        visible.emplace_back(panel->GetTabType(), panel->SaveStateText());
    }
    removed = removedTabData_;
    for (auto const& panel : hiddenTabs_) {
        hidden.emplace_back(panel->GetTabType(), panel->SaveStateText());
    }
}

// --- Gestures, focus, margins ---

void WorkspaceFrame::FocusFrontPanel() {
    if (TabPanel* front = GetFrontTabPanel(); front && GetWorkspace()) {
        GetWorkspace()->SetFocusedTabPanel(front);
    }
}

void WorkspaceFrame::HandleTabItemAction(int action, long index, RectT const* rect) {
    boost::intrusive_ptr<UI_Node> keep(IsReferenced() ? this : nullptr);
    TabPanel* panel = GetTabPanel(index);
    switch (action) {
    case orvui::controls::TabPressed:
        BringTabToFront(index);
        FocusFrontPanel();
        OfferTabDrag(false, index);
        break;
    case orvui::controls::FlyoutGripperPressed:
        OfferTabDrag(true, GetFrontTabIndex());
        break;
    case orvui::controls::TabKeyboardActivated:
    case orvui::controls::TabDoubleClicked:
        BringTabToFront(index);
        FocusFrontPanel();
        break;
    case orvui::controls::FlyoutMenuClicked:
        if (panel && GetWorkspace()) {
            GetWorkspace()->SetFocusedTabPanel(panel);
        }
        DoTabMenu(index, false, rect);
        break;
    case orvui::controls::TabSecondaryPressed:
        BringTabToFront(index);
        FocusFrontPanel();
        DoTabMenu(index, true, rect);
        break;
    case orvui::controls::TabCloseClicked:
        if (panel) {
            if (panel->UI_HasKeyboardFocus(true)) {
                panel->UI_LoseKeyboardFocus();
            }
            GetWorkspace()->RemoveTab(this, index, true, true);
        }
        break;
    case orvui::controls::TabMultiPaneClicked:
        if (panel && panel->IsMultiPaned() && rect) {
            panel->HandleMultiPaneClick(*rect);
        }
        break;
    case orvui::controls::TabBecameFront:
        if (panel) {
            panel->UI_Show(true);
        }
        break;
    case orvui::controls::TabLeftFront:
        if (panel) {
            panel->UI_Show(false);
        }
        break;
    case orvui::controls::TabLockClicked:
        if (panel && panel->IsLockable()) {
            bool before = panel->GetLocked();
            panel->ToggleLock();
            if (panel->GetLocked() != before) {
                TabPanelLockedChanged(*panel);
            }
        }
        break;
    default:
        break;
    }
}

// --- Flyout menu ---

bool WorkspaceFrame::AllowCloseOtherSimilar(long index) const {
    TabPanel* panel = GetTabPanel(index);
    if (!panel || !GetWorkspace()) {
        return false;
    }
    std::list<TabPanel*> similar;
    WorkspaceUtils::FindAllTabsOfType(*GetWorkspace(), panel->GetTabType(), similar);
    bool another = false;
    for (TabPanel* other : similar) {
        if (other == panel) {
            continue;
        }
        if (!other->AllowClose()) {
            return false;
        }
        another = true;
    }
    return another;
}

void WorkspaceFrame::RemoveOtherSimilarTabs(long index, bool obliteratingOnly) {
    TabPanel* panel = GetTabPanel(index);
    if (!panel || !GetWorkspace()) {
        return;
    }
    boost::intrusive_ptr<UI_Node> keep(IsReferenced() ? this : nullptr);
    std::list<TabPanel*> similar;
    WorkspaceUtils::FindAllTabsOfType(*GetWorkspace(), panel->GetTabType(), similar);
    // Removing one may empty its frame and window; hold every panel until the end.
    std::vector<boost::intrusive_ptr<TabPanel>> held;
    for (TabPanel* other : similar) {
        if (other != panel && other->IsReferenced()) {
            held.emplace_back(other);
        }
    }
    for (auto const& other : held) {
        auto* frame = dynamic_cast<WorkspaceFrame*>(other->GetFrame());
        if (frame && (!obliteratingOnly || other->ObliterateWhenClosed())) {
            GetWorkspace()->RemoveTab(frame, other.get(), true, true);
        }
    }
}

void WorkspaceFrame::PopulateTabMenu(long index, orvui::utility::OS_Menu& menu) const {
    TabPanel* panel = GetTabPanel(index);
    TopLevelWindow* window = GetTopLevelWindow();
    if (!panel || !window) {
        return;
    }
    auto const& text = [](char const* s) { return orvcore::config::Localizer::Get().Localize(s); };
    bool inMain = window->IsMain();
    bool severalFrames = window->GetFrameCount() > 1;
    menu.AppendItem(
        text("$$$/orvworkspace/workspace/WorkspaceFrame/FrameFlyoutMenuItem/UndockPanel=Undock Panel"),
        CommandNumber(UndockPanel), inMain || GetTabCount() > 1 || severalFrames);
    menu.AppendItem(
        text("$$$/orvworkspace/workspace/WorkspaceFrame/FrameFlyoutMenuItem/UndockFrame=Undock Frame"),
        CommandNumber(UndockFrame), inMain || severalFrames);
    menu.AppendItem(
        text("$$$/orvworkspace/workspace/WorkspaceFrame/FrameFlyoutMenuItem/ClosePanel=Close Panel"),
        CommandNumber(ClosePanel), panel->AllowClose());
    if (panel->IsCloseOtherSimilarPanelsEnabled()) {
        std::u16string label = panel->GetCustomCloseOtherSimilarPanelsDisplayString();
        if (label.empty()) {
            label = text("$$$/orvworkspace/workspace/WorkspaceFrame/FrameFlyoutMenuItem/"
                         "CloseOtherSimilarPanels=Close Other Similar Panels");
        }
        menu.AppendItem(label, CommandNumber(CloseOtherSimilarPanels), AllowCloseOtherSimilar(index));
    }
    menu.AppendItem(
        text("$$$/orvworkspace/workspace/WorkspaceFrame/FrameFlyoutMenuItem/CloseFrame=Close Frame"),
        CommandNumber(CloseFrame), AllowFrameClose());
    if (index == GetFrontTabIndex()) {
        bool maximised = window->GetLayoutManager()->IsTheMaximizedFrame(GetLMFrame());
        menu.AppendItem(maximised
                            ? text("$$$/orvworkspace/workspace/Frame/RestoreFrameSize=Restore Frame Size")
                            : text("$$$/orvworkspace/workspace/Frame/MaximizeFrame=Maximize Frame"),
                        CommandNumber(MaximizeFrame), WorkspaceUtils::CanHaveMaximizedFrame(window));
        panel->PopulateFlyoutMenu(menu);
    }
}

void WorkspaceFrame::DoTabMenu(long index, bool asContextMenu, RectT const* rect) {
    boost::intrusive_ptr<UI_Node> keep(IsReferenced() ? this : nullptr);
    orvui::utility::OS_Menu menu;
    PopulateTabMenu(index, menu);
    if (menu.Items().empty()) {
        return;
    }
    RectT anchor;
    if (rect) {
        anchor = *rect;
    } else if (!GetTabRect(index, anchor)) {
        anchor = RectT(0, 0, 0, 0);
    } else {
        anchor = UI_LocalToGlobal(anchor);
    }
    NativeWindow owner = GetTopLevelWindow() ? GetTopLevelWindow()->GetPlatformWindow() : 0;
    unsigned long command =
        asContextMenu ? orvui::utility::UI_DoContextMenu(menu, PointT(anchor.left, anchor.top), owner)
                      : orvui::utility::UI_DoPopupMenu(menu, anchor, owner);
    DoTabMenuCommand(index, command);
}

void WorkspaceFrame::DoTabMenuCommand(long index, unsigned long command) {
    if (command == 0) {
        return;
    }
    boost::intrusive_ptr<UI_Node> keep(IsReferenced() ? this : nullptr);
    TabPanel* found = GetTabPanel(index);
    boost::intrusive_ptr<TabPanel> panel(found && found->IsReferenced() ? found : nullptr);
    switch (long(command)) {
    case UndockPanel:
        Undock(index, false);
        break;
    case UndockFrame:
        Undock(index, true);
        break;
    case ClosePanel:
        GetWorkspace()->RemoveTab(this, index, true, true);
        return;
    case CloseOtherSimilarPanels:
        RemoveOtherSimilarTabs(index, false);
        return;
    case CloseFrame:
        RemoveAllTabs(false);
        return;
    case MaximizeFrame:
        WorkspaceUtils::ToggleThisFrameMaximizationState(*GetWorkspace(), this);
        break;
    default:
        break;
    }
    if (panel) {
        panel->DoFlyoutMenuCommand(command);
    }
}

void WorkspaceFrame::Undock(long index, bool wholeFrame) {
    TabPanel* found = GetTabPanel(index);
    TopLevelWindow* source = GetTopLevelWindow();
    Workspace* workspace = GetWorkspace();
    if (!found || !source || !workspace) {
        return;
    }
    boost::intrusive_ptr<WorkspaceFrame> self(this);
    boost::intrusive_ptr<TabPanel> panel(found);
    UI_NodeManager::GroupingFocusChanges grouping;
    RectT rect = panel->UI_GetGlobalRect();
    PointT snap;
    GetLMFrame()->GetGreatestSnapSize(snap);
    // 0 means no wish in that direction; it is tested before converting, which would make it negative.
    PointT converted = snap;
    ConvertFrameToTabSize(converted);
    rect.width = snap.x != 0 ? converted.x : rect.width;
    rect.height = snap.y != 0 ? converted.y : rect.height;
    bool fromMain = source->IsMain();
    boost::intrusive_ptr<TopLevelWindow> window = workspace->AddTopLevelWindow(false, nullptr);
    if (wholeFrame) {
        source->RemoveFrame(self, false);
        SetTopLevelWindow(window.get());
        window->ChildPushBack(self);
        window->SetRootFrame(self, true);
    } else {
        workspace->RemoveTab(this, index, false, false);
        window->CreateRootFrame(panel, true);
    }
    window->SetToGlobalTabSize(rect);
    if (!fromMain) {
        RectT outer = window->UI_GetGlobalStructureRect();
        window->UI_Move(PointT(outer.left + 20, outer.top + 20));
    }
    window->UI_Show(true);
    // The undocked panel (or the undocked frame's front panel) is what the user works with next.
    workspace->SetFocusedTabPanel(wholeFrame ? GetFrontTabPanel() : panel.get());
}

// --- Neighbours ---

Frame* WorkspaceFrame::RecurseFindFirstVisibleFrame(Splitter* splitter, bool fromLeftOrTop,
                                                    long& side) const {
    if (!splitter) {
        return nullptr;
    }
    LayoutManagerElement* first = fromLeftOrTop ? splitter->GetLeftOrTop() : splitter->GetRightOrBottom();
    LayoutManagerElement* second = fromLeftOrTop ? splitter->GetRightOrBottom() : splitter->GetLeftOrTop();
    Frame* found = nullptr;
    for (LayoutManagerElement* child : {first, second}) {
        Frame* frame = AsFrame(child);
        if (frame && frame != GetLMFrame() && frame->IsFrameShown()) {
            found = frame;
            break;
        }
    }
    for (LayoutManagerElement* child : {first, second}) {
        if (found) {
            break;
        }
        found = RecurseFindFirstVisibleFrame(AsSplitter(child), fromLeftOrTop, side);
    }
    if (found) {
        bool horizontal = !splitter->IsVertical();
        side = fromLeftOrTop ? (horizontal ? 3 : 4) : (horizontal ? 1 : 2);
    }
    return found;
}

void WorkspaceFrame::RecurseCountVisibleFrames(Splitter* splitter, long& count) const {
    if (!splitter) {
        return;
    }
    for (LayoutManagerElement* child : {splitter->GetLeftOrTop(), splitter->GetRightOrBottom()}) {
        if (Frame* frame = AsFrame(child)) {
            if (frame != GetLMFrame() && frame->IsFrameShown()) {
                ++count;
            }
        } else {
            RecurseCountVisibleFrames(AsSplitter(child), count);
        }
    }
}

WorkspaceFrame* WorkspaceFrame::GetNearestVisibleSibling(long& side) const {
    Splitter* parent = GetLMFrame()->GetParent();
    if (!parent || !GetTopLevelWindow()) {
        return nullptr;
    }
    bool fromLeftOrTop = parent->GetLeftOrTop() == GetLMFrame();
    Frame* found = RecurseFindFirstVisibleFrame(parent, fromLeftOrTop, side);
    if (!found) {
        return nullptr;
    }
    LayoutManagerElement* ownSide =
        (side == 1 || side == 2) ? parent->GetRightOrBottom() : parent->GetLeftOrTop();
    if (Splitter* crowded = AsSplitter(ownSide)) {
        long count = 0;
        RecurseCountVisibleFrames(crowded, count);
        if (count > 1) {
            return nullptr;
        }
    }
    return GetTopLevelWindow()->GetFrameFromLMFrame(found);
}

void WorkspaceFrame::SetTabMargin(float margin) {
    // The margin arrives in the frame's units: through the inverse of the tab well's own transform
    // (scale times margin plus translation) it becomes the tab well's.
    Matrix m = GetTabWell()->UI_GetSelfToParentMatrix();
    if (m.a == 0) {
        orvcore::config::ThrowError(orvcore::config::errors::NonInvertibleMatrix);
    }
    float inverseScale = 1.0f / m.a;
    GetTabWell()->SetTabMargin(inverseScale * margin - m.tx * inverseScale);
}

void WorkspaceFrame::RestoreDefaultMargin() {
    GetTabWell()->RestoreDefaultMargin();
}

void WorkspaceFrame::UI_FocusChanged(int reason) {
    GetTabWell()->SetFocusedLook(UI_HasKeyboardFocus(true));
    GetTabWell()->InvalidateDueToFocusChange();
    WorkspaceFrameBase::UI_FocusChanged(reason);
    // The frame itself has nothing to type into: focus given to it goes on to its front panel.
    if (UI_HasKeyboardFocus(false)) {
        if (TabPanel* front = GetFrontTabPanel()) {
            front->UI_GainKeyboardFocus(reason);
        }
    }
}

bool WorkspaceFrame::UI_DoMouseEvent(UI_Node* target, MouseEvent& event) {
    if (target != this || !GetWorkspace()) {
        return false;
    }
    Workspace* workspace = GetWorkspace();
    // Anything but a move over the frame's own edges ends a drag left running.
    if (!event.IsAction(action::Move) && workspace->GetTracker()) {
        workspace->ReleaseTracker(false);
    }
    // A press on an edge that faces a splitter bar drags the bar.
    if (event.IsAction(action::Press) && event.GetButton() == 0 && GetTopLevelWindow()) {
        PointF local = event.GetLocalPoint();
        PointT global =
            UI_LocalToGlobal(PointT(std::int32_t(std::lround(local.x)), std::int32_t(std::lround(local.y))));
        TopLevelWindow* window = GetTopLevelWindow();
        if (Tracker* tracker = workspace->AcquireSplitterDragger(window, window->UI_GlobalToLocal(global))) {
            bool endAtOnce = false;
            tracker->Begin(global, &endAtOnce);
            if (endAtOnce) {
                workspace->ReleaseTracker(false);
            }
        }
    }
    return workspace->GetTracker() != nullptr;
}

} // namespace orvworkspace::workspace
