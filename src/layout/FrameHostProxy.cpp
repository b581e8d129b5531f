// The stand-in widget of a previewed frame.
#include "layout/FrameHostProxy.h"

namespace orvworkspace::workspace {

FrameHostProxy::FrameHostProxy(FrameHostInterface* realHost)
    : realHost_(realHost)
    , shown_(realHost->IsFrameShown())
    , tabPanelFrameGlobalRect_(realHost->GetTabPanelFrameGlobalRect())
    , frameLocalRect_(realHost->GetFrameLocalRect())
    , tabWellGlobalRect_(realHost->GetTabWellGlobalRect()) {}

void FrameHostProxy::SetSizeAndPos(FrameZones const& zones) {
    RectT next = zones[FrameZones::Whole];
    std::int32_t dx = next.left - rect_.left;
    std::int32_t dy = next.top - rect_.top;
    rect_ = next;
    tabPanelFrameGlobalRect_ = tabPanelFrameGlobalRect_.Offset(dx, dy);
    frameLocalRect_ = frameLocalRect_.Offset(dx, dy);
    tabWellGlobalRect_ = tabWellGlobalRect_.Offset(dx, dy);
}

} // namespace orvworkspace::workspace
