// What of a window needs painting again: a few rectangles rather than one bounding rectangle, so
// that two small changes far apart (the borders of the frame losing focus and of the one gaining
// it) repaint two small areas and not everything between them.
#pragma once

#include "host/ui/UITypes.h"

#include <cstddef>
#include <vector>

namespace orvui::ui {

class DirtyRegion {
public:
    // More rectangles than this are merged pairwise, those whose union wastes least first, so that
    // painting never has to visit a long list.
    static constexpr std::size_t MaxRects = 8;

    // Adds an area (empty areas add nothing). Areas that overlap or touch so that their union is no
    // larger than the two together are merged at once.
    void Add(RectT const& area);
    void Clear() { rects_.clear(); }
    bool IsEmpty() const { return rects_.empty(); }
    std::vector<RectT> const& Rects() const { return rects_; }
    // The smallest rectangle holding every marked area.
    RectT Bounds() const;

private:
    std::vector<RectT> rects_;
};

} // namespace orvui::ui
