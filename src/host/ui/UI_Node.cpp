// Nodes: the tree, coordinates, showing, focus and timers.
#include "host/ui/UI_Node.h"

#include "host/ui/Desktop.h"
#include "host/ui/NodeManager.h"
#include "host/ui/OS_Window.h"
#include "host/ui/UI_Container.h"

#include <algorithm>
#include <cmath>

namespace orvui::ui {

void intrusive_ptr_add_ref(UI_Node* node) {
    ++node->refs_;
}

void intrusive_ptr_release(UI_Node* node) {
    if (--node->refs_ == 0) {
        delete node;
    }
}

UI_Node::UI_Node() = default;

UI_Node::~UI_Node() {
    for (auto const& child : children_) {
        child->parent_ = nullptr;
    }
    Desktop::Get().ForgetNode(this);
    UI_NodeManager::Get()->ForgetNode(this);
}

std::vector<UI_Node*> UI_Node::UI_GetNodeParents() const {
    std::vector<UI_Node*> parents;
    for (UI_Node* p = parent_; p; p = p->parent_) {
        parents.push_back(p);
    }
    return parents;
}

bool UI_Node::IsAncestorOf(UI_Node const* node) const {
    for (UI_Node const* n = node; n; n = n->parent_) {
        if (n == this) {
            return true;
        }
    }
    return false;
}

void UI_Node::Attach(UI_Node* child, std::size_t index) {
    // A node cannot go below itself: that would make the tree a cycle.
    if (child->IsAncestorOf(this)) {
        return;
    }
    // Keep the child alive while it leaves its old parent.
    boost::intrusive_ptr<UI_Node> keep(child);
    if (child->parent_) {
        child->parent_->ChildRemove(child);
    }
    index = std::min(index, children_.size());
    if (children_.capacity() == 0) {
        children_.reserve(4); // most parents have a few children: one allocation, not one per doubling
    }
    children_.insert(children_.begin() + long(index), keep);
    child->parent_ = this;
    child->UI_ParentChanged();
    ChildAdded(child);
    // What changes on screen is what the child covers. Marking the whole parent instead would make
    // building a window of n frames repaint the window n times.
    child->UI_Invalidate();
}

void UI_Node::ChildPushBack(boost::intrusive_ptr<UI_Node> child) {
    if (child) {
        Attach(child.get(), children_.size());
    }
}

void UI_Node::ChildInsert(std::size_t index, boost::intrusive_ptr<UI_Node> child) {
    if (child) {
        Attach(child.get(), index);
    }
}

bool UI_Node::ChildRemove(UI_Node* child) {
    auto it =
        std::find_if(children_.begin(), children_.end(), [&](auto const& c) { return c.get() == child; });
    if (it == children_.end()) {
        return false;
    }
    boost::intrusive_ptr<UI_Node> keep = *it;
    child->UI_Invalidate(); // while it is still placed, so that what it covered is painted again
    children_.erase(it);
    child->parent_ = nullptr;
    child->UI_ParentChanged();
    ChildRemoved(child);
    return true;
}

std::size_t UI_Node::ChildRemoveIf(std::function<bool(UI_Node*)> const& pick) {
    std::vector<boost::intrusive_ptr<UI_Node>> kept, removed;
    kept.reserve(children_.size());
    for (auto& child : children_) {
        (pick(child.get()) ? removed : kept).push_back(std::move(child));
    }
    if (removed.empty()) {
        children_ = std::move(kept);
        return 0;
    }
    for (auto const& child : removed) {
        child->UI_Invalidate(); // while it is still placed
    }
    children_ = std::move(kept);
    for (auto const& child : removed) {
        child->parent_ = nullptr;
        child->UI_ParentChanged();
        ChildRemoved(child.get());
    }
    return removed.size();
}

void UI_Node::ChildMove(UI_Node* child, std::size_t index) {
    std::size_t from = ChildIndex(child);
    if (from == children_.size()) {
        return;
    }
    boost::intrusive_ptr<UI_Node> keep = children_[from];
    children_.erase(children_.begin() + long(from));
    children_.insert(children_.begin() + long(std::min(index, children_.size())), keep);
    ChildOrderChanged();
    keep->UI_Invalidate(); // only where it overlaps its siblings can the new order show
}

std::size_t UI_Node::ChildIndex(UI_Node const* child) const {
    for (std::size_t i = 0; i < children_.size(); ++i) {
        if (children_[i].get() == child) {
            return i;
        }
    }
    return children_.size();
}

void UI_Node::UI_SetParent(UI_Node* parent) {
    if (parent == parent_) {
        return;
    }
    if (parent) {
        parent->ChildPushBack(this);
    } else if (parent_) {
        parent_->ChildRemove(this);
    }
}

UI_Node* UI_Node::UI_FindNodeByID(std::string const& id) {
    if (nodeID_ == id) {
        return this;
    }
    for (auto const& child : children_) {
        if (UI_Node* found = child->UI_FindNodeByID(id)) {
            return found;
        }
    }
    return nullptr;
}

void UI_Node::UI_SetRect(RectF const& rect) {
    // Layout passes set every node's rectangle, most of them unchanged; those must cost no repaint.
    if (rect.left == rect_.left && rect.top == rect_.top && rect.width == rect_.width &&
        rect.height == rect_.height) {
        return;
    }
    bool resized = rect.width != rect_.width || rect.height != rect_.height;
    UI_Invalidate();
    rect_ = rect;
    UI_Invalidate();
    if (resized) {
        UI_SizeChanged();
    }
}

Matrix UI_Node::UI_GetSelfToParentMatrix() const {
    Matrix m;
    m.tx = rect_.left;
    m.ty = rect_.top;
    return m;
}

PointF UI_Node::UI_LocalToGlobalF(PointF p) const {
    for (UI_Node const* n = this; n; n = n->parent_) {
        if (OS_Window const* w = const_cast<UI_Node*>(n)->UI_GetOSWindow(); w && w->IsTopLevel()) {
            RectT client = w->UI_GetGlobalClientRect();
            return PointF(p.x + float(client.left), p.y + float(client.top));
        }
        p = n->UI_GetSelfToParentMatrix().Apply(p);
    }
    return p;
}

PointF UI_Node::UI_GlobalToLocalF(PointF p) const {
    PointF origin = UI_LocalToGlobalF(PointF(0, 0));
    return PointF(p.x - origin.x, p.y - origin.y);
}

PointT UI_Node::UI_LocalToGlobal(PointT p) const {
    PointF g = UI_LocalToGlobalF(PointF(float(p.x), float(p.y)));
    return PointT(std::int32_t(std::floor(g.x + 0.5f)), std::int32_t(std::floor(g.y + 0.5f)));
}

PointT UI_Node::UI_GlobalToLocal(PointT p) const {
    PointF l = UI_GlobalToLocalF(PointF(float(p.x), float(p.y)));
    return PointT(std::int32_t(std::floor(l.x + 0.5f)), std::int32_t(std::floor(l.y + 0.5f)));
}

RectT UI_Node::UI_LocalToGlobal(RectT const& r) const {
    PointT topLeft = UI_LocalToGlobal(PointT(r.left, r.top));
    return RectT(topLeft.x, topLeft.y, r.width, r.height);
}

RectT UI_Node::UI_GetGlobalRect() const {
    PointF origin = UI_LocalToGlobalF(PointF(0, 0));
    return RectT(std::int32_t(std::floor(origin.x + 0.5f)), std::int32_t(std::floor(origin.y + 0.5f)),
                 std::int32_t(rect_.width + 0.5f), std::int32_t(rect_.height + 0.5f));
}

bool UI_Node::UI_HitTest(PointF local) const {
    return local.x >= 0 && local.y >= 0 && local.x < rect_.width && local.y < rect_.height;
}

void UI_Node::UI_Show(bool show) {
    if (shown_ != show) {
        shown_ = show;
        UI_Invalidate();
    }
}

bool UI_Node::UI_AreAllParentsVisible() const {
    for (UI_Node* p = parent_; p; p = p->parent_) {
        if (!p->shown_) {
            return false;
        }
    }
    return true;
}

void UI_Node::UI_SetOpacity(float opacity) {
    opacity_ = std::clamp(opacity, 0.0f, 1.0f);
    if (OS_Window* w = UI_GetOSWindow(); w && w->GetPlatformWindow()) {
        Desktop::Get().SetOpacity(w->GetPlatformWindow(), opacity_);
    }
    UI_Invalidate();
}

void UI_Node::UI_Invalidate(RectF const* area, unsigned) {
    // A top-level window invalidated as a whole is painted whole; any other node marks only its own
    // area (or the given part of it), so that painting it again costs what it covers.
    if (OS_Window* self = UI_GetOSWindow();
        self && self->GetPlatformWindow() && self->IsTopLevel() && !area) {
        Desktop::Get().Invalidate(self->GetPlatformWindow());
        return;
    }
    // Drawing is clipped to every node's bounds on the way down, and nothing under a hidden node is
    // drawn, so only the part of the area that survives every ancestor can change on screen. Marking
    // more would stretch the marked area (often to a parent's corner before it is placed) and repaint
    // what did not change. One walk up finds both that part and the top-level window.
    RectF r = area ? *area : UI_GetLocalBounds();
    for (UI_Node const* n = this;; n = n->parent_) {
        // Only a tree under a top-level window is drawn; a node outside one (a panel made but not yet
        // placed) shows nothing.
        if (!n || (n != this && !n->shown_)) {
            return;
        }
        r = r.Intersection(n->UI_GetLocalBounds());
        if (r.IsEmpty()) {
            return;
        }
        if (OS_Window const* w = const_cast<UI_Node*>(n)->UI_GetOSWindow(); w && w->IsTopLevel()) {
            if (!w->IsMarkedWhole()) { // as while a workspace is rebuilt: nothing to add
                Desktop::Get().InvalidateClientArea(w->GetPlatformWindow(), r);
            }
            return;
        }
        Matrix m = n->UI_GetSelfToParentMatrix();
        PointF a = m.Apply(PointF(r.left, r.top)), b = m.Apply(PointF(r.left + r.width, r.top + r.height));
        r = RectF(std::min(a.x, b.x), std::min(a.y, b.y), std::fabs(b.x - a.x), std::fabs(b.y - a.y));
    }
}

void UI_Node::UI_UpdateNow(unsigned) {
    if (OS_Window* w = UI_GetContainingWindow()) {
        w->UpdateWindowNow();
    }
}

void UI_Node::UI_DispatchNodeChange(int change) {
    for (UI_Node* n = this; n; n = n->parent_) {
        n->UI_NodeChanged(this, change);
    }
}

canvasor::SupplierInterface* UI_Node::UI_GetDrawSupplier() const {
    return parent_ ? parent_->UI_GetDrawSupplier() : UI_NodeManager::Get()->GetOSDrawSupplier();
}

namespace {
void CollectFocusable(UI_Node* node, std::vector<UI_Node*>& out) {
    if (!node->UI_IsShown()) {
        return;
    }
    if (node->UI_WantsKeyboardFocus()) {
        out.push_back(node);
    }
    for (std::size_t i = 0; i < node->ChildSize(); ++i) {
        UI_Node* child = node->ChildGet(i);
        if (OS_Window* w = child->UI_GetOSWindow(); w && w->IsTopLevel()) {
            continue;
        }
        CollectFocusable(child, out);
    }
}
} // namespace

bool UI_Node::UI_DoAdvanceKeyboardFocus(KeyboardEvent& event) {
    if (event.GetKeyCode() != key::Tab || !event.IsKeyDown()) {
        return false;
    }
    // Focus moves within the top-level window, or within the nearest container around the focus
    // that keeps it among its children.
    UI_Node* root = this;
    for (UI_Node* n = this; n; n = n->parent_) {
        root = n;
        if (OS_Window* w = n->UI_GetOSWindow(); w && w->IsTopLevel()) {
            break;
        }
    }
    if (UI_Node* leaf = UI_GetKeyboardFocusLeafNode(); leaf && root->IsAncestorOf(leaf)) {
        for (UI_Node* n = leaf->parent_; n && n != root; n = n->parent_) {
            auto* container = dynamic_cast<UI_Container*>(n);
            if (container && !container->AllowFocusToAdvanceFromChildren()) {
                root = n;
                break;
            }
        }
    }
    std::vector<UI_Node*> focusable;
    CollectFocusable(root, focusable);
    if (focusable.empty()) {
        return false;
    }
    UI_Node* leaf = UI_GetKeyboardFocusLeafNode();
    auto at = std::find(focusable.begin(), focusable.end(), leaf);
    bool back = (event.GetModifiers() & modifier::Shift) != 0;
    std::size_t count = focusable.size();
    std::size_t index;
    if (at == focusable.end()) {
        index = back ? count - 1 : 0;
    } else {
        std::size_t current = std::size_t(at - focusable.begin());
        index = back ? (current + count - 1) % count : (current + 1) % count;
    }
    if (focusable[index] == leaf) {
        return false;
    }
    focusable[index]->UI_GainKeyboardFocus(FocusByKeyboard);
    return true;
}

bool UI_Node::UI_DoMouseEvent(UI_Node*, MouseEvent&) {
    return false;
}
bool UI_Node::UI_DoKeyboardEvent(KeyboardEvent&) {
    return false;
}
bool UI_Node::UI_DoCursor(PointF) {
    return false;
}
void UI_Node::UI_FocusChanged(int) {}
void UI_Node::UI_ActivationChanged(bool) {}

void UI_Node::UI_GainKeyboardFocus(int reason) {
    UI_NodeManager::Get()->SetFocusLeaf(this, reason);
}

void UI_Node::UI_LoseKeyboardFocus(int reason) {
    if (UI_HasKeyboardFocus(true)) {
        UI_NodeManager::Get()->SetFocusLeaf(nullptr, reason);
    }
}

bool UI_Node::UI_HasKeyboardFocus(bool deep) const {
    UI_Node const* leaf = UI_NodeManager::Get()->GetFocusLeaf();
    if (!deep) {
        return leaf == this;
    }
    for (UI_Node const* n = leaf; n; n = n->parent_) {
        if (n == this) {
            return true;
        }
    }
    return false;
}

UI_Node* UI_Node::UI_GetKeyboardFocusLeafNode() {
    return UI_NodeManager::Get()->GetFocusLeaf();
}

void UI_Node::InstallTimer(unsigned long id, double seconds, bool repeat) {
    Desktop::Get().InstallTimer(this, id, seconds, repeat);
}

void UI_Node::RemoveTimer(unsigned long id) {
    Desktop::Get().RemoveTimer(this, id);
}

OS_Window* UI_Node::UI_GetContainingWindow() {
    for (UI_Node* n = this; n; n = n->parent_) {
        if (OS_Window* w = n->UI_GetOSWindow()) {
            return w;
        }
    }
    return nullptr;
}

} // namespace orvui::ui
