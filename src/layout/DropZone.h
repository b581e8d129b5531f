// One target region of a frame while a tab is dragged over it: a band along a side, the centre or
// the tab row, as a polygon in layout coordinates.
#pragma once

#include "layout/LayoutTypes.h"

#include <vector>

namespace orvworkspace::workspace {

class Frame;
class LayoutManager;

class DropZone {
public:
    // The side types are LayoutManager::InsertionType plus one, in the same order.
    enum DropType { None = 0, Top = 1, Left = 2, Bottom = 3, Right = 4, Center = 5, TabWell = 6 };

    DropZone() = default;
    DropZone(LayoutManager* layoutManager, std::vector<PointT> const& area, DropType type, Frame* frame)
        : layoutManager_(layoutManager)
        , area_(area)
        , frame_(frame)
        , type_(type) {}

    // The polygon's corners in drawing order.
    std::vector<PointT> GetArea() const { return area_; }
    DropType GetType() const { return type_; }
    Frame* GetFrame() const { return frame_; }
    LayoutManager* GetLayoutManager() const { return layoutManager_; }
    // Always the empty rectangle: where a dropped frame would go is a preview's question.
    RectT GetPositionOfFrameIfDropped(Frame const*) const { return RectT(); }

private:
    LayoutManager* layoutManager_ = nullptr;
    std::vector<PointT> area_;
    Frame* frame_ = nullptr;
    DropType type_ = None;
};

} // namespace orvworkspace::workspace
