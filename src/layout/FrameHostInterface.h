// What a layout needs from the widget behind one of its frames: placement, showing, sizes and the
// description of its tabs. Implemented by the frame widgets and by the preview stand-ins.
#pragma once

#include "layout/FrameZones.h"
#include "layout/LayoutTypes.h"

#include <vector>

namespace orvworkspace::workspace {

class FrameHostInterface {
public:
    virtual ~FrameHostInterface() = default;
    // Places the widget: zone 5 is its whole rectangle, zone 4 its content, zones 0 to 3 its edges.
    virtual void SetSizeAndPos(FrameZones const& zones) = 0;
    virtual void ShowFrame(bool show) = 0;
    // A branch of the tree is visible only if it holds at least one shown frame.
    virtual bool IsFrameShown() const = 0;
    // The smallest size the frame can take, its edge thickness included.
    virtual PointT GetMinimumSize() const = 0;
    // Appends preferred sizes; a component 0 means no preference on that axis.
    virtual void GetSnapSizes(std::vector<PointT>& sizes) const = 0;
    virtual RectT FrameRectToTabPanelRect(RectT const& frameRect) const = 0;
    virtual RectT FrameRectToTabWellRect(RectT const& frameRect) const = 0;
    virtual RectT GetTabPanelFrameGlobalRect() const = 0;
    // The frame's current rectangle in the window's layout coordinates.
    virtual RectT GetFrameLocalRect() const = 0;
    virtual RectT GetTabWellGlobalRect() const = 0;
    // The widget behind the frame; null for a stand-in.
    virtual void* GetHostData() = 0;
    // Fills three lists describing the frame's tabs.
    virtual void DoGetTabData(TabDataList& first, TabDataList& second, TabDataList& third) const = 0;
};

} // namespace orvworkspace::workspace
