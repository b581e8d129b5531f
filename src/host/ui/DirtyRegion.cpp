#include "host/ui/DirtyRegion.h"

#include <cstdint>
#include <limits>

namespace orvui::ui {

namespace {

std::int64_t Area(RectT const& r) {
    return r.IsEmpty() ? 0 : std::int64_t(r.width) * std::int64_t(r.height);
}

// What painting the union of two areas costs beyond painting each of them.
std::int64_t Waste(RectT const& a, RectT const& b) {
    return Area(a.Union(b)) - Area(a) - Area(b);
}

} // namespace

void DirtyRegion::Add(RectT const& area) {
    if (area.IsEmpty()) {
        return;
    }
    RectT added = area;
    // Absorb every rectangle the new one can take in without painting more than the two would.
    for (bool merged = true; merged;) {
        merged = false;
        for (std::size_t i = 0; i < rects_.size(); ++i) {
            if (rects_[i].Contains(added)) {
                return;
            }
            if (Waste(rects_[i], added) <= 0) {
                added = added.Union(rects_[i]);
                rects_.erase(rects_.begin() + long(i));
                merged = true;
                break;
            }
        }
    }
    rects_.push_back(added);
    while (rects_.size() > MaxRects) {
        std::size_t bestA = 0, bestB = 1;
        std::int64_t best = std::numeric_limits<std::int64_t>::max();
        for (std::size_t a = 0; a < rects_.size(); ++a) {
            for (std::size_t b = a + 1; b < rects_.size(); ++b) {
                if (std::int64_t w = Waste(rects_[a], rects_[b]); w < best) {
                    best = w;
                    bestA = a;
                    bestB = b;
                }
            }
        }
        rects_[bestA] = rects_[bestA].Union(rects_[bestB]);
        rects_.erase(rects_.begin() + long(bestB));
    }
}

RectT DirtyRegion::Bounds() const {
    RectT bounds;
    for (RectT const& r : rects_) {
        bounds = bounds.Union(r);
    }
    return bounds;
}

} // namespace orvui::ui
