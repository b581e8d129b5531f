// The placeholder a closed frame leaves in its slot of the split tree. It takes no space and
// remembers either the frame itself or the tab data of the panels that were in it, so the frame, or
// a new frame for one of those panels, can be put back exactly where it was. Owned by its layout.
#pragma once

#include "layout/LayoutManagerElement.h"

#include <string>

namespace orvworkspace::workspace {

class FrameDataProxy : public LayoutManagerElement {
public:
    // A placeholder for the panels described by tabData, remembering no frame.
    FrameDataProxy(LayoutManager* layoutManager, TabDataList tabData);
    // A placeholder remembering a frame (as an identity only), with no tab data yet.
    FrameDataProxy(LayoutManager* layoutManager, Frame const* frame);
    FrameDataProxy(LayoutManager* layoutManager, Frame const* frame, TabDataList tabData);

    bool AllowSnapping(bool inHeight, Frame* dragged) const override;

    // Whether some entry's tab type equals t, byte for byte.
    bool HasTabType(std::string const& t) const;
    // Whether this placeholder remembers the frame f.
    bool IsFrame(Frame const* f) const { return frame_ == f; }
    bool HasFrame() const { return hasFrame_; }
    Frame const* GetFrame() const { return frame_; }
    void SetTabData(TabDataList const& tabData) { tabData_ = tabData; }
    // The kept tab data, followed, when a frame is remembered, by that frame's third tab list.
    TabDataList GetTabData() const;

protected:
    PointT DoGetMinimumSize() const override { return PointT(); }
    void DoGetSnapSizes(std::vector<PointT>&) const override {}
    void DoGetConstraintSize(PointT&) const override {}
    bool DoGetIsStretchy(bool) const override { return true; }

private:
    bool hasFrame_;
    TabDataList tabData_;
    Frame const* frame_;
};

// The element as a placeholder, or null when it is none.
inline FrameDataProxy* AsPlaceholder(LayoutManagerElement* e) {
    return e && e->GetElementKind() == LayoutManagerElement::ElementKind::Placeholder
               ? static_cast<FrameDataProxy*>(e)
               : nullptr;
}

} // namespace orvworkspace::workspace
