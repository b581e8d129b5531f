// Focus, captures and the routing of input to nodes.
#include "host/ui/NodeManager.h"

#include "host/ui/Desktop.h"
#include "host/ui/OS_Window.h"
#include "host/ui/ResourceManager.h"
#include "host/ui/canvasor/SupplierInterface.h"

#include <algorithm>

namespace orvui::ui {

namespace {

UI_NodeManager* current = nullptr;

class DefaultNodeManager : public OS_NodeManager {};

// The node and its ancestors, nearest first, kept alive while events and notifications run through
// them (a handler may remove a node from the tree). Nodes no intrusive pointer owns are left as they
// are: taking a reference would free them when it ends.
class Chain {
public:
    explicit Chain(UI_Node* node, bool stopAtTopLevel = false) {
        for (UI_Node* n = node; n; n = n->UI_GetParentNode()) {
            nodes_.push_back(n);
            if (n->IsReferenced()) {
                keep_.emplace_back(n);
            }
            if (stopAtTopLevel) {
                if (OS_Window* w = n->UI_GetOSWindow(); w && w->IsTopLevel()) {
                    break;
                }
            }
        }
    }
    std::vector<UI_Node*>::const_iterator begin() const { return nodes_.begin(); }
    std::vector<UI_Node*>::const_iterator end() const { return nodes_.end(); }
    bool Contains(UI_Node* n) const { return std::find(nodes_.begin(), nodes_.end(), n) != nodes_.end(); }

private:
    std::vector<UI_Node*> nodes_;
    std::vector<boost::intrusive_ptr<UI_Node>> keep_;
};

} // namespace

UI_NodeManager* UI_NodeManager::Get() {
    if (!current) {
        static DefaultNodeManager fallback;
        return &fallback;
    }
    return current;
}

UI_NodeManager::UI_NodeManager()
    : previous_(current) {
    static canvasor::CairoSupplier supplier;
    drawSupplier_ = &supplier;
    current = this;
}

utility::ResourceManager* UI_NodeManager::GetResourceManager() {
    if (!resources_) {
        resources_ = std::make_unique<utility::ResourceManager>();
    }
    return resources_.get();
}

canvasor::FileImageP UI_NodeManager::GetImage(std::string const& name) {
    auto it = images_.find(name);
    if (it != images_.end()) {
        return it->second;
    }
    canvasor::FileImageP image;
    if (drawSupplier_) {
        image = drawSupplier_->MakeFileImage(GetResourceManager()->GetResource("png", name));
    }
    images_[name] = image;
    return image;
}

UI_NodeManager::~UI_NodeManager() {
    if (current == this) {
        current = previous_;
    }
}

void UI_NodeManager::NotifyUserResize(bool begin, UI_Node* node, bool resize) {
    if (userResize_) {
        userResize_(begin, node, resize);
    }
}

UI_NodeManager::SuspendMouseOverUpdates::SuspendMouseOverUpdates() {
    ++Get()->mouseOverSuspended_;
}
UI_NodeManager::SuspendMouseOverUpdates::~SuspendMouseOverUpdates() {
    --Get()->mouseOverSuspended_;
}

UI_NodeManager::NotifyUserResizing::NotifyUserResizing(UI_Node* node, bool resize)
    : node_(node)
    , resize_(resize) {
    Get()->NotifyUserResize(true, node_, resize_);
}
UI_NodeManager::NotifyUserResizing::~NotifyUserResizing() {
    Get()->NotifyUserResize(false, node_, resize_);
}

UI_NodeManager::GroupingFocusChanges::GroupingFocusChanges() {
    UI_NodeManager* m = Get();
    if (m->grouping_++ == 0) {
        m->focusAtGroupStart_ = m->focus_;
        m->groupReason_ = FocusUnknown;
    }
}

UI_NodeManager::GroupingFocusChanges::~GroupingFocusChanges() {
    UI_NodeManager* m = Get();
    if (--m->grouping_ == 0) {
        m->Notify(m->focusAtGroupStart_, m->focus_, m->groupReason_);
        m->focusAtGroupStart_ = nullptr;
    }
}

void UI_NodeManager::BeginInputCapture(std::shared_ptr<InputCapture> capture) {
    std::shared_ptr<InputCapture> previous = std::move(inputCapture_);
    inputCapture_ = std::move(capture);
    if (previous) {
        previous->CaptureEnded();
    }
}

void UI_NodeManager::EndInputCapture(InputCapture const* capture) {
    if (inputCapture_ && inputCapture_.get() == capture) {
        std::shared_ptr<InputCapture> ended = std::move(inputCapture_);
        ended->CaptureEnded();
    }
}

void UI_NodeManager::SetFocusLeaf(UI_Node* node, int reason) {
    if (node == focus_) {
        return;
    }
    UI_Node* previous = focus_;
    focus_ = node;
    if (grouping_ > 0) {
        groupReason_ = reason;
        return;
    }
    Notify(previous, node, reason);
}

void UI_NodeManager::Notify(UI_Node* from, UI_Node* to, int reason) {
    if (from == to) {
        return;
    }
    Chain lost(from);
    Chain gained(to);
    ++updatingFocus_;
    for (UI_Node* n : lost) {
        if (!gained.Contains(n)) {
            n->UI_FocusChanged(reason);
        }
    }
    for (UI_Node* n : gained) {
        if (!lost.Contains(n)) {
            n->UI_FocusChanged(reason);
        }
    }
    --updatingFocus_;
}

UI_Node* UI_NodeManager::HitTest(UI_Node* root, PointT global) {
    if (!root || !root->UI_IsShown()) {
        return nullptr;
    }
    PointF local = root->UI_GlobalToLocalF(PointF(float(global.x), float(global.y)));
    if (!root->UI_HitTest(local)) {
        return nullptr;
    }
    for (std::size_t i = root->ChildSize(); i-- > 0;) {
        UI_Node* child = root->ChildGet(i);
        // A top-level window below another node is a separate window, found through the desktop.
        if (OS_Window* w = child->UI_GetOSWindow(); w && w->IsTopLevel()) {
            continue;
        }
        if (UI_Node* hit = HitTest(child, global)) {
            return hit;
        }
    }
    return root;
}

void UI_NodeManager::DispatchMouse(OS_Window& window, OS_Event const& event) {
    PointT clientOrigin = window.UI_GetGlobalClientRect().TopLeft();
    PointT global(clientOrigin.x + PointParamX(event.lParam), clientOrigin.y + PointParamY(event.lParam));
    Desktop& desktop = Desktop::Get();
    int act = action::Move, button = 0, clicks = 0, wheel = 0;
    switch (event.message) {
    case message::LeftButtonDown:
        act = action::Press;
        clicks = 1;
        break;
    case message::LeftButtonDoubleClick:
        act = action::DoubleClickPress;
        clicks = 2;
        break;
    case message::RightButtonDown:
        act = action::SecondaryPress;
        button = 1;
        clicks = 1;
        break;
    case message::LeftButtonUp:
        act = action::Release;
        break;
    case message::RightButtonUp:
        act = action::Release;
        button = 1;
        break;
    case message::MiddleButtonDown:
        act = action::SecondaryPress;
        button = 2;
        clicks = 1;
        break;
    case message::MiddleButtonUp:
        act = action::Release;
        button = 2;
        break;
    case message::MouseWheel:
        act = action::Wheel;
        wheel = static_cast<int>(static_cast<std::int16_t>(event.wParam >> 16));
        break;
    default:
        break;
    }
    MouseEvent mouse(act, PointF(float(global.x), float(global.y)), global, desktop.GetModifiers(), button,
                     clicks, wheel);
    if (std::shared_ptr<InputCapture> capture = inputCapture_) {
        if (capture->HandleMouseEvent(mouse)) {
            return;
        }
    }
    UI_Node* target = pointerCapture_ ? pointerCapture_ : HitTest(&window, global);
    if (!target) {
        return;
    }
    Chain chain(target);
    // While the mouse is captured (a drag) the capturer owns the cursor.
    if (act == action::Move && !desktop.GetCapture()) {
        bool set = false;
        for (UI_Node* n : chain) {
            if (n->UI_DoCursor(n->UI_GlobalToLocalF(PointF(float(global.x), float(global.y))))) {
                set = true;
                break;
            }
        }
        if (!set) {
            desktop.SetCursor(cursor::Arrow);
        }
    }
    if (act == action::Press || act == action::SecondaryPress || act == action::DoubleClickPress) {
        for (UI_Node* n : chain) {
            if (n->UI_DoMouseActivate()) {
                break;
            }
        }
    }
    for (UI_Node* n : chain) {
        mouse.SetLocalPoint(n->UI_GlobalToLocalF(PointF(float(global.x), float(global.y))));
        if (n->UI_DoMouseEvent(target, mouse)) {
            break;
        }
    }
}

void UI_NodeManager::DispatchKey(KeyboardEvent& event) {
    if (std::shared_ptr<InputCapture> capture = inputCapture_) {
        if (capture->HandleKeyboardEvent(event)) {
            return;
        }
    }
    UI_Node* start = focus_;
    if (!start) {
        start = Desktop::Get().GetObject(Desktop::Get().GetActiveWindow());
    }
    // Keys bubble up to the top-level window and no further.
    for (UI_Node* n : Chain(start, true)) {
        if (n->UI_DoKeyboardEvent(event)) {
            break;
        }
    }
}

void UI_NodeManager::ResetState() {
    focus_ = nullptr;
    focusAtGroupStart_ = nullptr;
    grouping_ = 0;
    pointerCapture_ = nullptr;
    modal_ = nullptr;
    inputCapture_.reset();
    userResize_ = nullptr;
    mouseOverSuspended_ = 0;
}

void UI_NodeManager::ForgetNode(UI_Node* node) {
    if (focus_ == node) {
        focus_ = nullptr;
    }
    if (focusAtGroupStart_ == node) {
        focusAtGroupStart_ = nullptr;
    }
    if (pointerCapture_ == node) {
        pointerCapture_ = nullptr;
    }
    if (modal_ && static_cast<UI_Node*>(modal_) == node) {
        modal_ = nullptr;
    }
}

PointerCapture::PointerCapture(UI_Node* node)
    : previous_(UI_NodeManager::Get()->GetPointerCaptureNode()) {
    UI_NodeManager::Get()->SetPointerCaptureNode(node);
    // The node's top-level window takes the mouse, so a release anywhere still reaches the node.
    OS_Window* w = node ? node->UI_GetContainingWindow() : nullptr;
    while (w && !w->IsTopLevel() && w->UI_GetParentNode()) {
        w = w->UI_GetParentNode()->UI_GetContainingWindow();
    }
    if (w && w->GetPlatformWindow()) {
        window_ = w->GetPlatformWindow();
        previousCapture_ = Desktop::Get().GetCapture();
        Desktop::Get().SetCapture(window_);
    }
}

PointerCapture::~PointerCapture() {
    UI_NodeManager::Get()->SetPointerCaptureNode(previous_);
    Desktop& desktop = Desktop::Get();
    if (window_ && desktop.GetCapture() == window_) {
        if (previousCapture_ && desktop.IsWindow(previousCapture_)) {
            desktop.SetCapture(previousCapture_);
        } else {
            desktop.ReleaseCapture();
        }
    }
}

PointT GetGlobalMousePosition() {
    return Desktop::Get().GetMousePosition();
}

unsigned GetCurrentModKeys() {
    return Desktop::Get().GetModifiers();
}

} // namespace orvui::ui
