// An inner node of the split tree: one bar dividing its rectangle between two children, side by side
// (vertical bar) or one above the other (horizontal bar). The bar is stored as a fraction of the
// splitter's extent along its axis; the pixel arithmetic rounds in single precision by adding 0.5
// and truncating. Splitters are owned by their LayoutManager, which links and deletes them.
#pragma once

#include "layout/LayoutManagerElement.h"

namespace orvworkspace::workspace {

class Splitter : public LayoutManagerElement {
public:
    Splitter(LayoutManager* layoutManager, bool vertical)
        : LayoutManagerElement(layoutManager, ElementKind::Splitter)
        , vertical_(vertical) {}

    // Whether this splitter belongs to a what-if copy of a tree, whose splitters are freed with the
    // copy rather than when a removal collapses them.
    bool IsPreviewCopy() const { return previewCopy_; }

    bool AllowSnapping(bool inHeight, Frame* dragged) const override;

    LayoutManagerElement* GetLeftOrTop() const { return leftOrTop_; }
    LayoutManagerElement* GetRightOrBottom() const { return rightOrBottom_; }
    // Plain child links; the child's parent is not touched.
    void SetLeftOrTop(LayoutManagerElement* e) { leftOrTop_ = e; }
    void SetRightOrBottom(LayoutManagerElement* e) { rightOrBottom_ = e; }
    // Replaces the child `old` (first child checked first); nothing when `old` is no child.
    void ReplaceElement(LayoutManagerElement* old, LayoutManagerElement* replacement);
    // True for a non-splitter, else whether both bars run the same way.
    bool SameOrientation(LayoutManagerElement* e) const;

    bool IsVertical() const { return vertical_; }
    void SetVertical(bool vertical) { vertical_ = vertical; }
    RectT GetLocation() const { return location_; }
    void SetLocation(RectT const& location) { location_ = location; }
    bool GetConstrained() const { return constrained_; }
    void SetConstrained(bool constrained) { constrained_ = constrained; }

    void SetLeftOrTopVisible(bool visible) { leftOrTopVisible_ = visible; }
    void SetRightOrBottomVisible(bool visible) { rightOrBottomVisible_ = visible; }
    // The branch flag, and only when the child exists.
    bool IsLeftOrTopSubtreeVisible() const { return leftOrTopVisible_ && leftOrTop_; }
    bool IsRightOrBottomSubtreeVisible() const { return rightOrBottomVisible_ && rightOrBottom_; }
    bool IsVisible() const { return IsLeftOrTopSubtreeVisible() && IsRightOrBottomSubtreeVisible(); }
    // The raw branch flags, whatever the children.
    bool GetLeftOrTopVisibleFlag() const { return leftOrTopVisible_; }
    bool GetRightOrBottomVisibleFlag() const { return rightOrBottomVisible_; }

    // The stored fraction corrected for the children's minimum sizes (0.5 when both cannot fit);
    // the correction is returned, not stored.
    float GetPlacement() const;
    // Stores the fraction clamped to [0, 1]; a NaN (say from a damaged document) becomes 0.5.
    void SetPlacement(float f);
    void SetPlacementNormalize(float f) { SetPlacement(f); }
    // The raw stored fraction, uncorrected.
    float GetStoredPlacement() const { return placement_; }
    // The bar's absolute coordinate along the axis.
    long GetPixelPlacement() const;
    // Moves the bar to an absolute coordinate (clamped to the splitter); nothing on a zero extent.
    void SetPixelPlacement(long pixel);
    // round(extent(r) × f + origin(r)) along this splitter's axis.
    long CalcPixelPlacement(float f, RectT const& r) const;
    // The unclamped fraction of an absolute coordinate; false (f untouched) on a zero extent.
    bool CalcPlacement(long pixel, float& f) const;
    // The extents of the two sides at the stored fraction.
    void GetPlacementSizes(long& a, long& b) const;

    // Remembers the corrected fraction and the location, the reference of the next distribution
    // and of keeping bar positions.
    void SavePlacementState();
    float GetPrevPlacement() const { return prevPlacement_; }
    RectT GetPrevLocation() const { return prevLocation_; }
    long GetPrevPixelPlacement() const;
    void GetPrevPlacementSizes(long& a, long& b) const;

    // The bar's rectangle: zero thick at the bar, widened by the layout's half width on both sides.
    RectT GetDrawRect() const;
    bool ContainsPoint(long x, long y) const;

    // Along this splitter's axis: the origin and extent of a rectangle.
    long Origin(RectT const& r) const { return vertical_ ? r.left : r.top; }
    long Extent(RectT const& r) const { return vertical_ ? r.width : r.height; }
    // The component of a point along this splitter's axis.
    long Along(PointT const& p) const { return vertical_ ? p.x : p.y; }
    long Across(PointT const& p) const { return vertical_ ? p.y : p.x; }

protected:
    Splitter(LayoutManager* layoutManager, bool vertical, bool previewCopy)
        : LayoutManagerElement(layoutManager, ElementKind::Splitter)
        , vertical_(vertical)
        , previewCopy_(previewCopy) {}

    PointT DoGetMinimumSize() const override;
    void DoGetSnapSizes(std::vector<PointT>& sizes) const override;
    void DoGetConstraintSize(PointT& size) const override;
    bool DoGetIsStretchy(bool inHeight) const override;

private:
    // The two children's sizes combined: summed along the axis, the larger across it.
    PointT Combine(PointT a, PointT b) const;
    LayoutManagerElement* CountedFirst() const { return IsLeftOrTopSubtreeVisible() ? leftOrTop_ : nullptr; }
    LayoutManagerElement* CountedSecond() const {
        return IsRightOrBottomSubtreeVisible() ? rightOrBottom_ : nullptr;
    }

    // The subtree's reports remembered for the layout's current report pass (see LayoutManager).
    bool CachedReport(unsigned long& stamp, bool fitOnly) const;
    mutable unsigned long minimumStamp_ = 0;
    mutable unsigned long constraintStamp_ = 0;
    mutable unsigned long stretchyStamp_[2] = {0, 0};
    mutable PointT cachedMinimum_;
    mutable PointT cachedConstraint_;
    mutable bool cachedStretchy_[2] = {false, false};

    float prevPlacement_ = 0.5f;
    RectT prevLocation_;
    float placement_ = 0.5f;
    RectT location_;
    bool vertical_;
    bool constrained_ = false;
    bool leftOrTopVisible_ = true;
    bool rightOrBottomVisible_ = true;
    bool previewCopy_ = false;
    LayoutManagerElement* leftOrTop_ = nullptr;
    LayoutManagerElement* rightOrBottom_ = nullptr;
};

// The element as a splitter, or null when it is none.
inline Splitter* AsSplitter(LayoutManagerElement* e) {
    return e && e->GetElementKind() == LayoutManagerElement::ElementKind::Splitter ? static_cast<Splitter*>(e)
                                                                                   : nullptr;
}

// round(extent × fraction + origin): single precision, add 0.5, truncate toward zero.
inline long RoundPlacement(long extent, float fraction, long origin) {
    return static_cast<long>(static_cast<float>(extent) * fraction + static_cast<float>(origin) + 0.5f);
}

} // namespace orvworkspace::workspace
