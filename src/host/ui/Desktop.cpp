// The desktop's window table, z-order, activation, capture, chrome drags, input and time.
#include "host/ui/Desktop.h"

#include "host/core/TextConversion.h"
#include "host/ui/NodeManager.h"
#include "host/ui/OS_Window.h"
#include "host/ui/canvasor/Canvasor.h"

#include <algorithm>
#include <cmath>

namespace orvui::ui {

std::unique_ptr<Desktop> Desktop::instance;

Desktop& Desktop::Get() {
    if (!instance) {
        instance.reset(new Desktop());
    }
    return *instance;
}

void Desktop::Reset() {
    instance.reset(new Desktop());
}

Desktop::Desktop()
    : monitors_{RectT(0, 0, 1920, 1080)} {}

Desktop::~Desktop() {
    // Nodes that outlive their desktop (a reset between tests) must not keep its windows.
    for (auto& entry : records_) {
        if (entry.second.object) {
            entry.second.object->NativeDestroyed();
        }
    }
}

void Desktop::SetMonitors(std::vector<RectT> monitors) {
    if (!monitors.empty()) {
        monitors_ = std::move(monitors);
    }
}

NativeWindowRecord* Desktop::Find(NativeWindow w) {
    auto it = records_.find(w);
    return it == records_.end() ? nullptr : &it->second;
}

NativeWindowRecord const* Desktop::Find(NativeWindow w) const {
    auto it = records_.find(w);
    return it == records_.end() ? nullptr : &it->second;
}

NativeWindowRecord const* Desktop::Record(NativeWindow w) const {
    return Find(w);
}

// --- Native windows ---

NativeWindow Desktop::CreateNativeWindow(std::u16string const& title, std::uint32_t style,
                                         std::uint32_t exStyle, NativeWindow ownerOrParent, RectT const& rect,
                                         OS_Window* object, bool hasMenu) {
    NativeWindowRecord record;
    record.handle = nextHandle_++;
    record.title = title;
    record.style = style;
    record.exStyle = exStyle;
    record.rect = rect;
    record.normalRect = rect;
    record.shown = (style & style::Visible) != 0;
    record.hasMenu = hasMenu;
    record.threadId = CurrentThreadId();
    record.object = object;
    if (object) {
        record.properties[OS_Window::PropertyName] = object;
    }
    bool child = (style & style::Child) != 0;
    if (child) {
        // A child window may start without a parent (a panel made before its frame takes it).
        if (Find(ownerOrParent)) {
            LinkChild(record, ownerOrParent);
        }
    } else {
        // As on the platform, a window is owned by the top-level window of the one named, never by
        // a child window (so only top-level windows ever own others).
        record.owner = Find(ownerOrParent) ? TopLevelOf(ownerOrParent) : 0;
        zOrder_.push_back(record.handle);
    }
    NativeWindow handle = record.handle;
    records_.emplace(handle, std::move(record));
    return handle;
}

NativeWindow Desktop::CreateForeignWindow(RectT const& rect, unsigned long threadId) {
    NativeWindow w = CreateNativeWindow(u"", style::Popup | style::Visible, 0, 0, rect);
    Find(w)->threadId = threadId;
    return w;
}

void Desktop::DestroyNativeWindow(NativeWindow w) {
    NativeWindowRecord* record = Find(w);
    if (!record) {
        return;
    }
    for (NativeWindow child : std::vector<NativeWindow>(record->children.begin(), record->children.end())) {
        DestroyNativeWindow(child);
    }
    record = Find(w);
    UnlinkChild(*record);
    if (!(record->style & style::Child)) {
        zOrder_.erase(std::remove(zOrder_.begin(), zOrder_.end(), w), zOrder_.end());
        ++stackingChanges_; // what was beneath it shows now
    }
    // Windows it owned lose their owner, as the platform would leave them. Child windows own none,
    // and skipping the walk for them keeps tearing down a frame tree linear.
    if (!(record->style & style::Child)) {
        for (auto& entry : records_) {
            if (entry.second.owner == w) {
                entry.second.owner = 0;
            }
        }
    }
    if (capture_ == w) {
        capture_ = 0;
    }
    if (active_ == w) {
        active_ = 0;
    }
    if (dragWindow_ == w) {
        drag_ = Drag::None;
        dragWindow_ = 0;
    }
    if (lastActive_ == w) {
        lastActive_ = 0;
    }
    OS_Window* object = record->object;
    records_.erase(w);
    if (object) {
        object->NativeDestroyed();
    }
}

void Desktop::SetObject(NativeWindow w, OS_Window* object) {
    if (NativeWindowRecord* record = Find(w)) {
        // A window has one object: the one it leaves must forget it, or it would go on using (and
        // at its end destroy) a window that is no longer its own.
        if (OS_Window* previous = record->object; previous && previous != object) {
            previous->NativeDestroyed();
        }
        record->object = object;
        record->properties[OS_Window::PropertyName] = object;
    }
}

OS_Window* Desktop::GetObject(NativeWindow w) const {
    NativeWindowRecord const* record = Find(w);
    return record ? record->object : nullptr;
}

NativeWindow Desktop::GetParent(NativeWindow w) const {
    NativeWindowRecord const* record = Find(w);
    return record ? (record->parent ? record->parent : record->owner) : 0;
}

void Desktop::SetParent(NativeWindow child, NativeWindow parent) {
    NativeWindowRecord* record = Find(child);
    if (!record || !(record->style & style::Child) || record->parent == parent || child == parent ||
        (parent && !Find(parent))) {
        return;
    }
    UnlinkChild(*record);
    if (parent) {
        LinkChild(*record, parent);
    }
}

void Desktop::LinkChild(NativeWindowRecord& child, NativeWindow parent) {
    std::list<NativeWindow>& siblings = Find(parent)->children;
    child.parent = parent;
    child.placeAmongSiblings = siblings.insert(siblings.end(), child.handle);
}

void Desktop::UnlinkChild(NativeWindowRecord& child) {
    if (NativeWindowRecord* parent = Find(child.parent)) {
        parent->children.erase(child.placeAmongSiblings);
    }
    child.parent = 0;
}

NativeWindow Desktop::GetOwner(NativeWindow w) const {
    NativeWindowRecord const* record = Find(w);
    return record ? record->owner : 0;
}

std::uint32_t Desktop::GetStyle(NativeWindow w) const {
    NativeWindowRecord const* record = Find(w);
    return record ? record->style : 0;
}

std::uint32_t Desktop::GetExStyle(NativeWindow w) const {
    NativeWindowRecord const* record = Find(w);
    return record ? record->exStyle : 0;
}

void Desktop::SetExStyle(NativeWindow w, std::uint32_t exStyle) {
    if (NativeWindowRecord* record = Find(w)) {
        record->exStyle = exStyle;
    }
}

std::u16string Desktop::GetTitle(NativeWindow w) const {
    NativeWindowRecord const* record = Find(w);
    return record ? record->title : std::u16string();
}

unsigned long Desktop::GetWindowThreadId(NativeWindow w) const {
    NativeWindowRecord const* record = Find(w);
    return record ? record->threadId : 0;
}

void Desktop::SetProperty(NativeWindow w, std::string const& name, void* value) {
    if (NativeWindowRecord* record = Find(w)) {
        record->properties[name] = value;
    }
}

void* Desktop::GetProperty(NativeWindow w, std::string const& name) const {
    NativeWindowRecord const* record = Find(w);
    if (!record) {
        return nullptr;
    }
    auto it = record->properties.find(name);
    return it == record->properties.end() ? nullptr : it->second;
}

RectT Desktop::GetWindowRect(NativeWindow w) const {
    NativeWindowRecord const* record = Find(w);
    if (!record) {
        return RectT();
    }
    if (!record->parent && !(record->style & style::Child)) {
        return record->rect;
    }
    // A child window follows its node, or, without one, sits at its rectangle in the parent's client.
    if (record->object) {
        return record->object->UI_GetGlobalRect();
    }
    if (!record->parent) {
        return record->rect;
    }
    RectT parentClient = GetClientRect(record->parent);
    return record->rect.Offset(parentClient.left, parentClient.top);
}

namespace {

// Where a window's client area starts within the window, and how much the chrome takes.
struct Chrome {
    int left = 0, top = 0, right = 0, bottom = 0;
};

Chrome ChromeOf(NativeWindowRecord const& record) {
    if ((record.style & style::Child) || (record.style & style::Caption) != style::Caption) {
        return Chrome();
    }
    return Chrome{BorderWidth, BorderWidth + TitleBarHeight + (record.hasMenu ? MenuBarHeight : 0),
                  BorderWidth, BorderWidth};
}

} // namespace

RectT Desktop::GetClientRect(NativeWindow w) const {
    NativeWindowRecord const* record = Find(w);
    if (!record) {
        return RectT();
    }
    RectT r = GetWindowRect(w);
    Chrome chrome = ChromeOf(*record);
    return RectT(r.left + chrome.left, r.top + chrome.top, std::max(0, r.width - chrome.left - chrome.right),
                 std::max(0, r.height - chrome.top - chrome.bottom));
}

void Desktop::SetWindowRect(NativeWindow w, RectT const& rect) {
    NativeWindowRecord* record = Find(w);
    if (!record || record->parent || record->rect == rect) {
        return;
    }
    record->rect = rect;
    if (record->showState == ShowState::Normal) {
        record->normalRect = rect;
    }
    record->dirty = true;
    if (record->object) {
        record->object->NativeRectChanged();
    }
}

void Desktop::ShowWindow(NativeWindow w, bool show) {
    if (NativeWindowRecord* record = Find(w); record && record->shown != show) {
        record->shown = show;
        record->dirty = true;
    }
}

bool Desktop::IsVisible(NativeWindow w) const {
    NativeWindowRecord const* record = Find(w);
    return record && record->shown;
}

void Desktop::SetOpacity(NativeWindow w, float opacity) {
    if (NativeWindowRecord* record = Find(w)) {
        record->opacity = opacity;
        if (opacity < 1.0f) {
            record->exStyle |= style::Layered;
        }
        record->dirty = true;
    }
}

bool Desktop::EnableWindow(NativeWindow w, bool enable) {
    NativeWindowRecord* record = Find(w);
    if (!record) {
        return false;
    }
    bool wasDisabled = !record->enabled;
    if (record->enabled != enable) {
        record->enabled = enable;
        SendMessage(w, message::Enable, enable ? 1 : 0, 0);
    }
    return wasDisabled;
}

bool Desktop::IsEnabled(NativeWindow w) const {
    NativeWindowRecord const* record = Find(w);
    return record && record->enabled;
}

void Desktop::Invalidate(NativeWindow w) {
    if (NativeWindowRecord* record = Find(TopLevelOf(w))) {
        record->dirty = true;
    }
}

void Desktop::InvalidateClientArea(NativeWindow w, RectF const& local) {
    NativeWindowRecord* record = Find(w);
    if (record && record->parent) {
        record = Find(TopLevelOf(w));
    }
    if (!record || record->dirty) {
        return;
    }
    Chrome chrome = ChromeOf(*record);
    // Rounded outwards, with a pixel to spare for antialiased edges.
    std::int32_t left = std::int32_t(std::floor(local.left)) - 1 + chrome.left;
    std::int32_t top = std::int32_t(std::floor(local.top)) - 1 + chrome.top;
    std::int32_t right = std::int32_t(std::ceil(local.left + local.width)) + 1 + chrome.left;
    std::int32_t bottom = std::int32_t(std::ceil(local.top + local.height)) + 1 + chrome.top;
    RectT area = RectT(left, top, right - left, bottom - top)
                     .Intersection(RectT(0, 0, record->rect.width, record->rect.height));
    if (!area.IsEmpty()) {
        record->dirtyRegion.Add(area);
    }
}

bool Desktop::IsDirty(NativeWindow w) const {
    NativeWindowRecord const* record = Find(TopLevelOf(w));
    return record && (record->dirty || !record->dirtyRegion.IsEmpty());
}

bool Desktop::IsWhollyDirty(NativeWindow w) const {
    NativeWindowRecord const* record = Find(TopLevelOf(w));
    return record && record->dirty;
}

void Desktop::ClearDirty(NativeWindow w) {
    if (NativeWindowRecord* record = Find(TopLevelOf(w))) {
        record->dirty = false;
        record->dirtyRegion.Clear();
    }
}

NativeWindow Desktop::TopLevelOf(NativeWindow w) const {
    NativeWindowRecord const* record = Find(w);
    while (record && record->parent) {
        w = record->parent;
        record = Find(w);
    }
    return record ? w : 0;
}

// --- Z-order and activation ---

void Desktop::LiftOwned(NativeWindow owner) {
    std::vector<NativeWindow> owned;
    for (NativeWindow w : zOrder_) {
        if (Find(w)->owner == owner) {
            owned.push_back(w);
        }
    }
    for (NativeWindow w : owned) {
        ++stackingChanges_;
        zOrder_.erase(std::remove(zOrder_.begin(), zOrder_.end(), w), zOrder_.end());
        zOrder_.push_back(w);
        LiftOwned(w);
    }
}

void Desktop::BringToFront(NativeWindow w) {
    w = TopLevelOf(w);
    if (!w) {
        return;
    }
    if (zOrder_.empty() || zOrder_.back() != w) {
        ++stackingChanges_;
    }
    zOrder_.erase(std::remove(zOrder_.begin(), zOrder_.end(), w), zOrder_.end());
    zOrder_.push_back(w);
    LiftOwned(w);
}

std::vector<NativeWindow> Desktop::EnumerateWindows() const {
    return std::vector<NativeWindow>(zOrder_.rbegin(), zOrder_.rend());
}

NativeWindow Desktop::DeepestChildAt(NativeWindow w, PointT global) const {
    NativeWindowRecord const* record = Find(w);
    for (auto it = record->children.rbegin(); it != record->children.rend(); ++it) {
        NativeWindowRecord const* child = Find(*it);
        if (child->shown && !(child->exStyle & style::MouseTransparent) &&
            (!child->object || child->object->UI_AreAllParentsVisible()) &&
            GetWindowRect(*it).Contains(global)) {
            return DeepestChildAt(*it, global);
        }
    }
    return w;
}

NativeWindow Desktop::WindowFromPoint(PointT global) const {
    for (auto it = zOrder_.rbegin(); it != zOrder_.rend(); ++it) {
        NativeWindowRecord const* record = Find(*it);
        bool passThrough = (record->exStyle & style::MouseTransparent) || record->opacity < 1.0f;
        if (!record->shown || passThrough || record->showState == ShowState::Minimized ||
            !record->rect.Contains(global)) {
            continue;
        }
        return DeepestChildAt(*it, global);
    }
    return 0;
}

void Desktop::SendCaptionActivation(NativeWindow w, bool active, NativeWindow other) {
    SendMessage(w, message::CaptionActivate, active ? 1 : 0, static_cast<std::intptr_t>(other));
    if (OS_Window* object = GetObject(w)) {
        boost::intrusive_ptr<UI_Node> keep(object->IsReferenced() ? object : nullptr);
        object->UI_ActivationChanged(active);
    }
}

void Desktop::Activate(NativeWindow w) {
    w = TopLevelOf(w);
    if (!w) {
        return;
    }
    BringToFront(w);
    if (!applicationActive_) {
        applicationActive_ = true;
        SendToOwnWindows(message::ActivateApp, 1);
    }
    if (w == active_ || !IsWindow(w)) {
        return;
    }
    NativeWindow previous = active_;
    active_ = w;
    lastActive_ = w;
    if (previous) {
        SendCaptionActivation(previous, false, w);
    }
    if (IsWindow(w)) {
        SendCaptionActivation(w, true, previous);
    }
}

void Desktop::SendToOwnWindows(unsigned msg, std::uintptr_t wParam) {
    // Handlers may destroy windows: every window is looked up again before it is sent to.
    for (NativeWindow top : EnumerateWindows()) {
        NativeWindowRecord const* record = Find(top);
        if (record && record->threadId == CurrentThreadId()) {
            SendMessage(top, msg, wParam, 0);
        }
    }
}

void Desktop::SetApplicationActive(bool active) {
    if (active == applicationActive_) {
        return;
    }
    if (!active) {
        applicationActive_ = false;
        SendToOwnWindows(message::ActivateApp, 0);
        NativeWindow w = active_;
        active_ = 0;
        if (w && IsWindow(w)) {
            SendCaptionActivation(w, false, 0);
        }
        return;
    }
    // Coming back: the window that was active is active again.
    if (lastActive_ && IsWindow(lastActive_)) {
        Activate(lastActive_);
    } else {
        applicationActive_ = true;
        SendToOwnWindows(message::ActivateApp, 1);
    }
}

bool Desktop::IsCaptionActive(NativeWindow w) const {
    NativeWindowRecord const* record = Find(w);
    return record && record->captionActive;
}

void Desktop::SetCaptionActive(NativeWindow w, bool active) {
    // Only a change repaints: a window activated again while it is already active (as each newly
    // focused panel does) must not cost a whole repaint.
    if (NativeWindowRecord* record = Find(w); record && record->captionActive != active) {
        record->captionActive = active;
        record->dirty = true;
    }
}

// --- Capture ---

void Desktop::SetCapture(NativeWindow w) {
    if (w == capture_ || !IsWindow(w)) {
        return;
    }
    NativeWindow previous = capture_;
    capture_ = w;
    if (previous) {
        SendMessage(previous, message::CaptureLost, 0, static_cast<std::intptr_t>(w));
    }
}

void Desktop::ReleaseCapture() {
    NativeWindow previous = capture_;
    capture_ = 0;
    if (previous) {
        SendMessage(previous, message::CaptureLost, 0, 0);
    }
}

// --- Placement ---

WindowPlacement Desktop::GetPlacement(NativeWindow w) const {
    WindowPlacement placement;
    NativeWindowRecord const* record = Find(w);
    if (!record) {
        return placement;
    }
    placement.showCmd = static_cast<unsigned>(record->showState);
    placement.flags = record->showState == ShowState::Maximized ? 2 : record->placementFlags;
    placement.minPosition = record->minPosition;
    placement.maxPosition = record->maxPosition;
    placement.normal = record->normalRect;
    return placement;
}

void Desktop::SetPlacement(NativeWindow w, WindowPlacement const& placement) {
    NativeWindowRecord* record = Find(w);
    if (!record) {
        return;
    }
    record->normalRect = placement.normal;
    record->placementFlags = placement.flags;
    record->minPosition = placement.minPosition;
    record->maxPosition = placement.maxPosition;
    RectT target = placement.normal;
    switch (placement.showCmd) {
    case 0:
        record->shown = false;
        record->showState = ShowState::Normal;
        break;
    case 2:
    case 6:
        record->shown = true;
        record->showState = ShowState::Minimized;
        break;
    case 3: {
        // Maximised on the monitor that holds the middle of the restored rectangle.
        PointT middle(placement.normal.left + placement.normal.width / 2,
                      placement.normal.top + placement.normal.height / 2);
        target = monitors_.front();
        for (RectT const& m : monitors_) {
            if (m.Contains(middle)) {
                target = m;
            }
        }
        record->shown = true;
        record->showState = ShowState::Maximized;
        break;
    }
    default:
        record->shown = true;
        record->showState = ShowState::Normal;
        break;
    }
    record->dirty = true;
    if (record->rect != target) {
        record->rect = target;
        if (record->object) {
            record->object->NativeRectChanged();
        }
    }
    if (record->object && record->object->UI_IsShown() != record->shown) {
        record->object->UI_Node::UI_Show(record->shown);
    }
}

bool Desktop::IsZoomed(NativeWindow w) const {
    NativeWindowRecord const* record = Find(w);
    return record && record->showState == ShowState::Maximized;
}

bool Desktop::IsIconic(NativeWindow w) const {
    NativeWindowRecord const* record = Find(w);
    return record && record->showState == ShowState::Minimized;
}

// --- Messages ---

std::intptr_t Desktop::SendMessage(NativeWindow w, unsigned msg, std::uintptr_t wParam,
                                   std::intptr_t lParam) {
    OS_Window* object = GetObject(w);
    if (!object) {
        return 0;
    }
    boost::intrusive_ptr<UI_Node> keep(object->IsReferenced() ? object : nullptr);
    OS_Event event;
    event.window = w;
    event.message = msg;
    event.wParam = wParam;
    event.lParam = lParam;
    if (OS_Window::EventFunction hook = object->UI_GetEventFunction()) {
        hook(&event);
    }
    object->UI_HandleOSEvent(event);
    return event.result;
}

void Desktop::Beep(unsigned) {
    ++beeps_;
}

// --- Input ---

void Desktop::SendMouse(unsigned msg, PointT global, std::uintptr_t wParam, std::intptr_t) {
    NativeWindow target = capture_ ? capture_ : WindowFromPoint(global);
    if (!target) {
        cursor_ = cursor::Arrow;
        return;
    }
    if (!capture_ && !IsEnabled(TopLevelOf(target))) {
        return;
    }
    RectT client = GetClientRect(target);
    SendMessage(target, msg, wParam | modifiers_,
                MakePointParam(global.x - client.left, global.y - client.top));
}

bool Desktop::StartChromeDrag(NativeWindow w, PointT global) {
    NativeWindowRecord const* record = Find(w);
    if (!record || record->parent || (record->style & style::Caption) != style::Caption ||
        record->showState != ShowState::Normal) {
        return false;
    }
    RectT r = record->rect;
    RectT client = GetClientRect(w);
    if (client.Contains(global)) {
        return false;
    }
    int edges = 0;
    if (record->style & style::SizingFrame) {
        edges |= global.x < r.left + BorderWidth ? 1 : 0;
        edges |= global.y < r.top + BorderWidth ? 2 : 0;
        edges |= global.x >= r.Right() - BorderWidth ? 4 : 0;
        edges |= global.y >= r.Bottom() - BorderWidth ? 8 : 0;
    }
    bool inTitle = global.y < r.top + BorderWidth + TitleBarHeight;
    if (!edges && !inTitle) {
        return false; // the menu bar
    }
    drag_ = edges ? Drag::Resize : Drag::Move;
    dragEdges_ = edges;
    dragWindow_ = w;
    dragStart_ = global;
    dragStartRect_ = r;
    if (OS_Window* object = record->object) {
        UI_NodeManager::Get()->NotifyUserResize(true, object, drag_ == Drag::Resize);
    }
    return true;
}

void Desktop::ContinueChromeDrag(PointT global) {
    int dx = global.x - dragStart_.x, dy = global.y - dragStart_.y;
    RectT r = dragStartRect_;
    if (drag_ == Drag::Move) {
        SetWindowRect(dragWindow_, r.Offset(dx, dy));
        return;
    }
    // Resizing never shrinks a window below its chrome.
    int minimum = 2 * BorderWidth + TitleBarHeight;
    int left = r.left, top = r.top, right = r.Right(), bottom = r.Bottom();
    if (dragEdges_ & 1) {
        left = std::min(left + dx, right - minimum);
    }
    if (dragEdges_ & 2) {
        top = std::min(top + dy, bottom - minimum);
    }
    if (dragEdges_ & 4) {
        right = std::max(right + dx, left + minimum);
    }
    if (dragEdges_ & 8) {
        bottom = std::max(bottom + dy, top + minimum);
    }
    SetWindowRect(dragWindow_, RectT::FromEdges(left, top, right, bottom));
}

void Desktop::EndChromeDrag() {
    NativeWindow w = dragWindow_;
    bool resize = drag_ == Drag::Resize;
    drag_ = Drag::None;
    dragWindow_ = 0;
    if (OS_Window* object = GetObject(w)) {
        UI_NodeManager::Get()->NotifyUserResize(false, object, resize);
    }
}

void Desktop::MouseMove(PointT global) {
    mouse_ = global;
    if (drag_ != Drag::None) {
        ContinueChromeDrag(global);
        return;
    }
    SendMouse(message::MouseMove, global, buttonDown_ ? 1 : 0);
}

void Desktop::SetMenuBar(NativeWindow w, std::vector<std::u16string> titles) {
    if (NativeWindowRecord* record = Find(w); record && record->hasMenu) {
        record->menuTitles = std::move(titles);
        record->dirty = true;
    }
}

std::vector<RectT> Desktop::GetMenuBarItemRects(NativeWindow w) const {
    std::vector<RectT> rects;
    NativeWindowRecord const* record = Find(w);
    if (!record || !record->hasMenu) {
        return rects;
    }
    int x = record->rect.left + BorderWidth;
    for (std::u16string const& title : record->menuTitles) {
        int width =
            int(canvasor::Canvasor::Measure(orvcore::utility::UTF16to8(title), canvasor::Font()).width) + 16;
        rects.emplace_back(x, record->rect.top + BorderWidth + TitleBarHeight, width, MenuBarHeight);
        x += width;
    }
    return rects;
}

RectT Desktop::GetMenuBarItemRect(NativeWindow w, std::size_t index) const {
    std::vector<RectT> rects = GetMenuBarItemRects(w);
    return index < rects.size() ? rects[index] : RectT();
}

void Desktop::MouseDown(PointT global, int button, int clickCount) {
    mouse_ = global;
    buttonDown_ = true;
    NativeWindow target = capture_ ? capture_ : WindowFromPoint(global);
    NativeWindow top = TopLevelOf(target);
    if (top && !capture_) {
        if (!IsEnabled(top)) {
            Beep(0);
            return;
        }
        Activate(top);
        if (button == 0 && StartChromeDrag(top, global)) {
            return;
        }
        if (button == 0) {
            std::vector<RectT> titles = GetMenuBarItemRects(top);
            for (std::size_t i = 0; i < titles.size(); ++i) {
                if (titles[i].Contains(global)) {
                    buttonDown_ = false; // the menu takes the press
                    SendMessage(top, message::MenuBarPressed, i, 0);
                    return;
                }
            }
        }
    }
    unsigned msg = button == 0 ? (clickCount >= 2 ? message::LeftButtonDoubleClick : message::LeftButtonDown)
                   : button == 2 ? message::MiddleButtonDown
                                 : message::RightButtonDown;
    SendMouse(msg, global, button == 0 ? 1 : button == 2 ? 0x10 : 2);
}

void Desktop::MouseUp(PointT global, int button) {
    mouse_ = global;
    buttonDown_ = false;
    if (drag_ != Drag::None) {
        EndChromeDrag();
        return;
    }
    SendMouse(button == 0   ? message::LeftButtonUp
              : button == 2 ? message::MiddleButtonUp
                            : message::RightButtonUp,
              global, 0);
}

void Desktop::MouseWheel(PointT global, int delta) {
    mouse_ = global;
    SendMouse(message::MouseWheel, global,
              static_cast<std::uintptr_t>(static_cast<std::uint16_t>(delta)) << 16);
}

void Desktop::KeyDown(unsigned keyCode, char32_t character) {
    KeyboardEvent event(keyCode, true, modifiers_, character);
    UI_NodeManager::Get()->DispatchKey(event);
}

void Desktop::KeyUp(unsigned keyCode) {
    KeyboardEvent event(keyCode, false, modifiers_);
    UI_NodeManager::Get()->DispatchKey(event);
}

// --- Time ---

void Desktop::InstallTimer(UI_Node* node, unsigned long id, double seconds, bool repeat) {
    RemoveTimer(node, id);
    double interval = std::max(seconds, 0.0);
    timers_.push_back(Timer{now_.load() + interval, ++sequence_, node, id, interval, repeat});
}

void Desktop::RemoveTimer(UI_Node* node, unsigned long id) {
    timers_.erase(std::remove_if(timers_.begin(), timers_.end(),
                                 [&](Timer const& t) { return t.node == node && t.id == id; }),
                  timers_.end());
}

void Desktop::RemoveTimers(UI_Node* node) {
    timers_.erase(
        std::remove_if(timers_.begin(), timers_.end(), [&](Timer const& t) { return t.node == node; }),
        timers_.end());
}

bool Desktop::HasTimer(UI_Node const* node, unsigned long id) const {
    return std::any_of(timers_.begin(), timers_.end(),
                       [&](Timer const& t) { return t.node == node && t.id == id; });
}

void Desktop::PostToMainThread(std::function<void()> call, double delaySeconds) {
    std::lock_guard<std::mutex> lock(queueMutex_);
    queue_.push_back(QueuedCall{now_.load() + std::max(delaySeconds, 0.0), ++callSequence_, std::move(call)});
}

bool Desktop::RunNextDue(double until, unsigned long newestCall) {
    // The earliest due timer or call (by due time, then by when it was made).
    auto timer = std::min_element(timers_.begin(), timers_.end(), [](Timer const& a, Timer const& b) {
        return a.due < b.due || (a.due == b.due && a.sequence < b.sequence);
    });
    std::function<void()> call;
    double callDue = 0;
    {
        std::lock_guard<std::mutex> lock(queueMutex_);
        // Only calls queued before this turn began are eligible; later ones wait for the next turn.
        auto next = queue_.end();
        for (auto it = queue_.begin(); it != queue_.end(); ++it) {
            if (it->sequence <= newestCall && (next == queue_.end() || it->due < next->due ||
                                               (it->due == next->due && it->sequence < next->sequence))) {
                next = it;
            }
        }
        bool callFirst =
            next != queue_.end() && next->due <= until && (timer == timers_.end() || next->due <= timer->due);
        if (callFirst) {
            callDue = next->due;
            call = std::move(next->call);
            queue_.erase(next);
        }
    }
    if (call) {
        now_ = std::max(now_.load(), callDue);
        call();
        return true;
    }
    if (timer == timers_.end() || timer->due > until) {
        return false;
    }
    now_ = std::max(now_.load(), timer->due);
    UI_Node* node = timer->node;
    unsigned long id = timer->id;
    if (timer->repeat) {
        // A repeating timer fires at most once a millisecond, so a zero interval cannot spin.
        timer->due = now_ + std::max(timer->interval, 0.001);
        timer->sequence = ++sequence_;
    } else {
        timers_.erase(timer);
    }
    boost::intrusive_ptr<UI_Node> keep(node->IsReferenced() ? node : nullptr);
    node->UI_DoTimerNotify(id);
    return true;
}

unsigned long Desktop::NewestCall() {
    std::lock_guard<std::mutex> lock(queueMutex_);
    return callSequence_;
}

void Desktop::AdvanceTime(double seconds) {
    double until = now_.load() + std::max(seconds, 0.0);
    unsigned long newest = NewestCall();
    while (RunNextDue(until, newest)) {
    }
    now_ = until;
}

void Desktop::ProcessPendingWork() {
    unsigned long newest = NewestCall();
    while (RunNextDue(now_.load(), newest)) {
    }
}

void Desktop::ForgetNode(UI_Node* node) {
    RemoveTimers(node);
}

} // namespace orvui::ui
