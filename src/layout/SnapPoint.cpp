// Snapping a bar to a candidate position.
#include "layout/SnapPoint.h"

#include "layout/Frame.h"
#include "layout/Splitter.h"

#include <cstdlib>

namespace orvworkspace::workspace {

bool SnapPoint::Snap(PointT& target) const {
    bool alongX;
    long position;
    if (other && offset != 0) {
        RectT r = other->GetLocation();
        alongX = !other->IsVertical();
        long nearEdge = alongX ? r.left : r.top;
        long farEdge = alongX ? r.Right() : r.Bottom();
        position = fromFirst ? nearEdge + offset : farEdge - offset;
    } else if (other) {
        alongX = other->IsVertical();
        position = other->GetPixelPlacement();
    } else {
        if (!owner || !frame) {
            return false;
        }
        LayoutManagerElement* side = fromFirst ? owner->GetLeftOrTop() : owner->GetRightOrBottom();
        if (!side || !side->AllowSnapping(!owner->IsVertical(), frame)) {
            return false;
        }
        RectT r = frame->GetFrameLocalRect();
        alongX = owner->IsVertical();
        long nearEdge = alongX ? r.left : r.top;
        long farEdge = alongX ? r.Right() : r.Bottom();
        position = fromFirst ? nearEdge + offset : farEdge - offset;
    }
    std::int32_t& coordinate = alongX ? target.x : target.y;
    if (std::labs(position - coordinate) >= SnapDistance) {
        return false;
    }
    coordinate = static_cast<std::int32_t>(position);
    return true;
}

} // namespace orvworkspace::workspace
