// The toolkit's node: a reference-counted element of the user interface with a parent, ordered
// children, an identifier, a rectangle in its parent's coordinates, shown state and opacity, and the
// virtual operations through which it draws and reacts to input, focus, activation and timers.
// Children are owned by their parent through intrusive pointers; the parent link is plain. Nodes are
// meant to live in intrusive pointers; one held otherwise (on the stack, by value) is never kept
// alive or freed by the toolkit.
#pragma once

#include "host/ui/Events.h"

#include <atomic>
#include <boost/intrusive_ptr.hpp>
#include <functional>
#include <string>
#include <vector>

namespace canvasor {
class Canvasor;
class SupplierInterface;
} // namespace canvasor

namespace orvui::ui {

class OS_Window;
class UI_Node;

void intrusive_ptr_add_ref(UI_Node* node);
void intrusive_ptr_release(UI_Node* node);

// A 2-D affine transform: x' = a x + c y + tx, y' = b x + d y + ty.
struct Matrix {
    float a = 1, b = 0, c = 0, d = 1, tx = 0, ty = 0;
    PointF Apply(PointF p) const { return PointF(a * p.x + c * p.y + tx, b * p.x + d * p.y + ty); }
};

class UI_Node {
public:
    UI_Node();
    virtual ~UI_Node();
    UI_Node(UI_Node const&) = delete;
    UI_Node& operator=(UI_Node const&) = delete;

    // --- Tree ---
    UI_Node* UI_GetParentNode() const { return parent_; }
    // The ancestors, nearest first.
    std::vector<UI_Node*> UI_GetNodeParents() const;
    // Moves this node under another parent (appended), or out of any tree with null.
    void UI_SetParent(UI_Node* parent);
    virtual void ChildPushBack(boost::intrusive_ptr<UI_Node> child);
    void ChildInsert(std::size_t index, boost::intrusive_ptr<UI_Node> child);
    // Takes the child out; false when it is none of ours.
    bool ChildRemove(UI_Node* child);
    // Takes out every child the predicate picks in one pass (removing many children one by one
    // would shift the rest each time); returns how many went.
    std::size_t ChildRemoveIf(std::function<bool(UI_Node*)> const& pick);
    // Moves a child to another position among its siblings.
    void ChildMove(UI_Node* child, std::size_t index);
    UI_Node* ChildGet(std::size_t index) const {
        return index < children_.size() ? children_[index].get() : nullptr;
    }
    std::size_t ChildSize() const { return children_.size(); }
    std::size_t ChildIndex(UI_Node const* child) const;
    // The first node below (or this one) with the identifier, depth first.
    UI_Node* UI_FindNodeByID(std::string const& id);
    // This node was attached to a parent or taken out of one.
    virtual void UI_ParentChanged() {}
    // Whether an intrusive pointer owns this node (the toolkit only keeps such nodes alive itself).
    bool IsReferenced() const { return refs_ > 0; }
    // Whether node is this one or below it.
    bool IsAncestorOf(UI_Node const* node) const;
    virtual void ChildAdded(UI_Node*) {}
    virtual void ChildRemoved(UI_Node*) {}
    virtual void ChildOrderChanged() {}
    virtual bool IsANode() const { return true; }

    void UI_SetNodeID(std::string id) { nodeID_ = std::move(id); }
    std::string const& UI_GetNodeID() const { return nodeID_; }

    // --- Geometry ---
    // The rectangle in the parent's coordinates.
    RectF UI_GetRect() const { return rect_; }
    virtual void UI_SetRect(RectF const& rect);
    // (0, 0, width, height).
    RectF UI_GetLocalBounds() const { return RectF(0, 0, rect_.width, rect_.height); }
    virtual Matrix UI_GetSelfToParentMatrix() const;
    PointF UI_LocalToGlobalF(PointF p) const;
    PointF UI_GlobalToLocalF(PointF p) const;
    PointT UI_LocalToGlobal(PointT p) const;
    PointT UI_GlobalToLocal(PointT p) const;
    RectT UI_LocalToGlobal(RectT const& r) const;
    // This node's rectangle in global (screen) coordinates.
    RectT UI_GetGlobalRect() const;
    // Whether a local point is on this node (by default: inside its bounds).
    virtual bool UI_HitTest(PointF local) const;

    // --- Showing and painting ---
    virtual void UI_Show(bool show);
    bool UI_IsShown() const { return shown_; }
    // Whether every ancestor is shown.
    virtual bool UI_AreAllParentsVisible() const;
    void UI_SetOpacity(float opacity);
    float UI_GetOpacity() const { return opacity_; }
    // Marks the node's window for repainting.
    void UI_Invalidate(RectF const* area = nullptr, unsigned flags = 0);
    // Repaints now whatever is marked.
    void UI_UpdateNow(unsigned flags = 0);
    // Tells the node (and its ancestors) that something about it changed; the number is the caller's.
    void UI_DispatchNodeChange(int change);
    virtual void UI_NodeChanged(UI_Node*, int) {}
    virtual void UI_Draw(canvasor::Canvasor&) {}
    // Whether the node draws with the toolkit's canvas (all of ours do).
    virtual bool UI_SupportsCanvasor() const { return true; }
    // The parts of the node it paints itself, in local coordinates; by default all of it.
    virtual void UI_GetDrawSegments(std::vector<RectF>& segments) const {
        segments.push_back(UI_GetLocalBounds());
    }
    // The supplier of fonts and images for this node's drawing: its parent's, finally the node
    // manager's.
    virtual canvasor::SupplierInterface* UI_GetDrawSupplier() const;
    // Whether a window's root view covers it completely, so nothing behind needs painting.
    virtual bool UI_IsRootViewOpaque() const { return false; }

    // --- Input, focus, activation, timers (overridden by subclasses) ---
    // A mouse event at target, bubbling up through target's ancestors; true stops the bubbling.
    virtual bool UI_DoMouseEvent(UI_Node* target, MouseEvent& event);
    virtual bool UI_DoKeyboardEvent(KeyboardEvent& event);
    // Sets the cursor for a local point and answers true, or false to let the parent decide.
    virtual bool UI_DoCursor(PointF local);
    // A press is about to reach this node (or one below it); true when the node took it to activate
    // itself.
    virtual bool UI_DoMouseActivate() { return false; }
    // Moves keyboard focus on Tab (back with Shift) to the next node of the same top-level window
    // that wants it, in tree order, wrapping round; true when focus moved.
    virtual bool UI_DoAdvanceKeyboardFocus(KeyboardEvent& event);
    virtual void UI_SizeChanged() {}
    virtual void UI_FocusChanged(int reason);
    virtual void UI_ActivationChanged(bool active);
    virtual bool UI_WantsKeyboardFocus() const { return false; }
    virtual void UI_DoTimerNotify(unsigned long) {}

    void UI_GainKeyboardFocus(int reason);
    void UI_LoseKeyboardFocus(int reason = FocusByProgram);
    // This node holds the focus (or, when deep, this node or one below it).
    bool UI_HasKeyboardFocus(bool deep) const;
    static UI_Node* UI_GetKeyboardFocusLeafNode();

    // A timer of this node; fires UI_DoTimerNotify(id) every `seconds` (once unless repeat).
    void InstallTimer(unsigned long id, double seconds, bool repeat = true);
    void RemoveTimer(unsigned long id);

    // The native window this node owns, if any.
    virtual OS_Window* UI_GetOSWindow() { return nullptr; }
    // The nearest native window at or above this node.
    OS_Window* UI_GetContainingWindow();

private:
    friend void intrusive_ptr_add_ref(UI_Node* node);
    friend void intrusive_ptr_release(UI_Node* node);
    void Attach(UI_Node* child, std::size_t index);

    std::atomic<int> refs_{0};
    UI_Node* parent_ = nullptr;
    std::vector<boost::intrusive_ptr<UI_Node>> children_;
    std::string nodeID_;
    RectF rect_;
    bool shown_ = true;
    float opacity_ = 1.0f;
};

using UI_NodeP = boost::intrusive_ptr<UI_Node>;

} // namespace orvui::ui
