// A frame's size wishes: constraint, snap sizes and whether it may be a snap partner.
#include "layout/Frame.h"

#include <algorithm>
#include <cstdlib>

namespace orvworkspace::workspace {

void Frame::SetConstraintSize(bool nearest) {
    ClearConstraintSize();
    if (!IsFrameShown()) {
        return;
    }
    PointT minimum = GetMinimumSize();
    if (nearest) {
        GetNearestSnapSize(constraintSize_);
    } else {
        GetGreatestSnapSize(constraintSize_);
    }
    if (constraintSize_.x == 0) {
        constraintSize_.x = minimum.x;
    }
    if (constraintSize_.y == 0) {
        constraintSize_.y = minimum.y;
    }
    stretchyWidth_ = constraintSize_.x == minimum.x;
    stretchyHeight_ = constraintSize_.y == minimum.y;
}

void Frame::ClearConstraintSize() {
    constraintSize_ = PointT();
    stretchyWidth_ = true;
    stretchyHeight_ = true;
}

void Frame::GetGreatestSnapSize(PointT& out) const {
    out = PointT();
    std::vector<PointT> sizes;
    GetSnapSizes(sizes);
    for (PointT const& s : sizes) {
        out.x = std::max(out.x, s.x);
        out.y = std::max(out.y, s.y);
    }
}

void Frame::GetNearestSnapSize(PointT& out) const {
    out = PointT();
    std::vector<PointT> sizes;
    GetSnapSizes(sizes);
    if (sizes.empty()) {
        return;
    }
    RectT current = GetFrameLocalRect();
    auto closer = [](std::int32_t chosen, std::int32_t candidate, std::int32_t extent) {
        return chosen == 0 || std::labs(long(chosen) - extent) > std::labs(long(candidate) - extent);
    };
    for (PointT const& s : sizes) {
        if (s.x != 0 && closer(out.x, s.x, current.width)) {
            out.x = s.x;
        }
        if (s.y != 0 && closer(out.y, s.y, current.height)) {
            out.y = s.y;
        }
    }
}

bool Frame::AllowSnapping(bool inHeight, Frame* dragged) const {
    if (dragged == this) {
        return true;
    }
    if (IsStretchy(inHeight)) {
        return false;
    }
    PointT minimum = GetMinimumSize();
    RectT current = GetFrameLocalRect();
    std::int32_t extent = inHeight ? current.height : current.width;
    if (extent == (inHeight ? minimum.y : minimum.x)) {
        return true;
    }
    return extent == (inHeight ? constraintSize_.y : constraintSize_.x);
}

} // namespace orvworkspace::workspace
