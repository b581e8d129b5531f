// Placeholders of closed frames.
#include "layout/FrameDataProxy.h"

#include "layout/Frame.h"

namespace orvworkspace::workspace {

FrameDataProxy::FrameDataProxy(LayoutManager* layoutManager, TabDataList tabData)
    : LayoutManagerElement(layoutManager, ElementKind::Placeholder)
    , hasFrame_(false)
    , tabData_(std::move(tabData))
    , frame_(nullptr) {}

FrameDataProxy::FrameDataProxy(LayoutManager* layoutManager, Frame const* frame)
    : FrameDataProxy(layoutManager, frame, TabDataList()) {}

FrameDataProxy::FrameDataProxy(LayoutManager* layoutManager, Frame const* frame, TabDataList tabData)
    : LayoutManagerElement(layoutManager, ElementKind::Placeholder)
    , hasFrame_(true)
    , tabData_(std::move(tabData))
    , frame_(frame) {}

bool FrameDataProxy::AllowSnapping(bool, Frame*) const {
    return true;
}

bool FrameDataProxy::HasTabType(std::string const& t) const {
    for (auto const& entry : tabData_) {
        if (entry.first == t) {
            return true;
        }
    }
    return false;
}

TabDataList FrameDataProxy::GetTabData() const {
    TabDataList result = tabData_;
    if (hasFrame_ && frame_) {
        TabDataList first, second, third;
        frame_->GetTabData(first, second, third);
        result.insert(result.end(), third.begin(), third.end());
    }
    return result;
}

} // namespace orvworkspace::workspace
