// The stand-in widget of a copied frame in a what-if layout: it records where the copy was placed
// and answers with the real frame's rectangles, moved along, but never touches the real widget.
#pragma once

#include "layout/FrameHostInterface.h"

namespace orvworkspace::workspace {

class FrameHostProxy : public FrameHostInterface {
public:
    explicit FrameHostProxy(FrameHostInterface* realHost);

    void SetSizeAndPos(FrameZones const& zones) override;
    void ShowFrame(bool show) override { shown_ = show; }
    bool IsFrameShown() const override { return shown_; }
    // A copy has no minimum size and no snap sizes: the preview places by fractions alone.
    PointT GetMinimumSize() const override { return PointT(); }
    void GetSnapSizes(std::vector<PointT>&) const override {}
    RectT FrameRectToTabPanelRect(RectT const& r) const override {
        return realHost_->FrameRectToTabPanelRect(r);
    }
    RectT FrameRectToTabWellRect(RectT const& r) const override {
        return realHost_->FrameRectToTabWellRect(r);
    }
    RectT GetTabPanelFrameGlobalRect() const override { return tabPanelFrameGlobalRect_; }
    RectT GetFrameLocalRect() const override { return frameLocalRect_; }
    RectT GetTabWellGlobalRect() const override { return tabWellGlobalRect_; }
    void* GetHostData() override { return nullptr; }
    void DoGetTabData(TabDataList&, TabDataList&, TabDataList&) const override {}

    FrameHostInterface* GetRealHost() const { return realHost_; }
    // The frame rectangle the preview last gave the copy.
    RectT GetRect() const { return rect_; }

private:
    FrameHostInterface* realHost_;
    bool shown_;
    RectT rect_;
    RectT tabPanelFrameGlobalRect_;
    RectT frameLocalRect_;
    RectT tabWellGlobalRect_;
};

} // namespace orvworkspace::workspace
