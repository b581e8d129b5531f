// The six rectangles and four edge thicknesses the layout hands a frame: its four edge strips, its
// interior and its whole rectangle.
#pragma once

#include "layout/LayoutTypes.h"

namespace orvworkspace::workspace {

class FrameZones {
public:
    static constexpr int Left = 0, Top = 1, Right = 2, Bottom = 3, Interior = 4, Whole = 5;

    // Zone k, 0 to 5: left, top, right and bottom strips, interior, whole frame.
    RectT& operator[](int k) { return zones_[k]; }
    RectT const& operator[](int k) const { return zones_[k]; }

    // The thickness of edge k (0 to 3); 0 for the interior and the whole frame.
    long EdgeSize(int k) const { return IsBorder(k) ? edges_[k] : 0; }
    // Stores the thickness of edge k; ignored for k that is no edge.
    void SetEdgeSize(int k, long v) {
        if (IsBorder(k)) {
            edges_[k] = v;
        }
    }
    static bool IsBorder(int k) { return k >= 0 && k < 4; }

    // Compares the six zones only: two frames placed alike are equal whatever their edge sizes.
    bool operator==(FrameZones const& o) const {
        for (int k = 0; k < 6; ++k) {
            if (zones_[k] != o.zones_[k]) {
                return false;
            }
        }
        return true;
    }
    bool operator!=(FrameZones const& o) const { return !(*this == o); }

private:
    RectT zones_[6];
    long edges_[4] = {0, 0, 0, 0};
};

} // namespace orvworkspace::workspace
