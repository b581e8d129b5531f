// A leaf of the split tree: the place of one frame widget, reached through its host interface.
// The widget owns its Frame; the layout never deletes one.
#pragma once

#include "layout/FrameHostInterface.h"
#include "layout/LayoutManagerElement.h"

namespace orvworkspace::workspace {

class Frame : public LayoutManagerElement {
public:
    Frame(LayoutManager* layoutManager, FrameHostInterface* host)
        : LayoutManagerElement(layoutManager, ElementKind::Frame)
        , host_(host) {}

    bool AllowSnapping(bool inHeight, Frame* dragged) const override;

    // Recomputes the size the frame wants to keep and its stretchy flags from its snap sizes: the
    // one nearest its current size when `nearest`, else the greatest.
    void SetConstraintSize(bool nearest);
    // Forgets any wish: no constraint, stretchy both ways.
    void ClearConstraintSize();
    PointT GetConstraintSize() const { return constraintSize_; }
    using LayoutManagerElement::GetConstraintSize;
    // Per axis, the snap size nearest the frame's current size (earlier entries win ties).
    void GetNearestSnapSize(PointT& out) const;
    // Per axis, the largest snap size.
    void GetGreatestSnapSize(PointT& out) const;

    void SetSizeAndPos(FrameZones const& zones) { host_->SetSizeAndPos(zones); }
    void ShowFrame(bool show) { host_->ShowFrame(show); }
    bool IsFrameShown() const { return host_->IsFrameShown(); }
    RectT FrameRectToTabPanelRect(RectT const& r) const { return host_->FrameRectToTabPanelRect(r); }
    RectT FrameRectToTabWellRect(RectT const& r) const { return host_->FrameRectToTabWellRect(r); }
    RectT GetTabPanelFrameGlobalRect() const { return host_->GetTabPanelFrameGlobalRect(); }
    RectT GetFrameLocalRect() const { return host_->GetFrameLocalRect(); }
    RectT GetTabWellGlobalRect() const { return host_->GetTabWellGlobalRect(); }
    void* GetHostData() { return host_->GetHostData(); }
    void GetTabData(TabDataList& first, TabDataList& second, TabDataList& third) const {
        host_->DoGetTabData(first, second, third);
    }
    FrameHostInterface* GetHostInterface() const { return host_; }

protected:
    PointT DoGetMinimumSize() const override { return host_->GetMinimumSize(); }
    void DoGetSnapSizes(std::vector<PointT>& sizes) const override { host_->GetSnapSizes(sizes); }
    void DoGetConstraintSize(PointT& size) const override { size = constraintSize_; }
    bool DoGetIsStretchy(bool inHeight) const override { return inHeight ? stretchyHeight_ : stretchyWidth_; }

private:
    // A frame that never had its constraint computed wants nothing and gives way both ways.
    bool stretchyWidth_ = true;
    bool stretchyHeight_ = true;
    PointT constraintSize_;
    FrameHostInterface* host_;
};

// The element as a frame, or null when it is none.
inline Frame* AsFrame(LayoutManagerElement* e) {
    return e && e->GetElementKind() == LayoutManagerElement::ElementKind::Frame ? static_cast<Frame*>(e)
                                                                                : nullptr;
}

} // namespace orvworkspace::workspace
