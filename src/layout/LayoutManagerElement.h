// The base of every node of a layout's split tree: splitters, frames and placeholders of closed
// frames. A node knows its layout and its parent splitter, and reports its sizes.
#pragma once

#include "layout/LayoutTypes.h"

#include <vector>

namespace orvworkspace::workspace {

class Frame;
class LayoutManager;
class Splitter;

class LayoutManagerElement {
public:
    // What a node is; fixed at construction, so the tree code can tell nodes apart without RTTI.
    enum class ElementKind { Frame, Splitter, Placeholder };

    LayoutManagerElement(LayoutManager* layoutManager, ElementKind kind)
        : layoutManager_(layoutManager)
        , kind_(kind) {}
    virtual ~LayoutManagerElement() = default;
    LayoutManagerElement(LayoutManagerElement const&) = delete;
    LayoutManagerElement& operator=(LayoutManagerElement const&) = delete;

    // Whether this subtree may serve as a snap partner for a bar moving across heights (true) or
    // widths (false) while `dragged` is being dragged.
    virtual bool AllowSnapping(bool inHeight, Frame* dragged) const;

    PointT GetMinimumSize() const { return DoGetMinimumSize(); }
    // Appends the subtree's preferred sizes.
    void GetSnapSizes(std::vector<PointT>& sizes) const { DoGetSnapSizes(sizes); }
    // The size the subtree wants to keep; (0, 0) on an axis without a wish.
    void GetConstraintSize(PointT& size) const {
        size = PointT();
        DoGetConstraintSize(size);
    }
    // Whether the subtree may absorb size changes across heights (true) or widths (false).
    bool IsStretchy(bool inHeight) const { return DoGetIsStretchy(inHeight); }

    LayoutManager* GetLayoutManager() const { return layoutManager_; }
    void SetLayoutManager(LayoutManager* layoutManager) { layoutManager_ = layoutManager; }
    // The parent splitter; null for the root splitter and for nodes not linked yet.
    Splitter* GetParent() const { return parent_; }
    void SetParent(Splitter* parent) { parent_ = parent; }

    ElementKind GetElementKind() const { return kind_; }

protected:
    virtual PointT DoGetMinimumSize() const = 0;
    virtual void DoGetSnapSizes(std::vector<PointT>& sizes) const = 0;
    virtual void DoGetConstraintSize(PointT& size) const = 0;
    virtual bool DoGetIsStretchy(bool inHeight) const = 0;

private:
    LayoutManager* layoutManager_;
    Splitter* parent_ = nullptr;
    ElementKind kind_;
};

} // namespace orvworkspace::workspace
