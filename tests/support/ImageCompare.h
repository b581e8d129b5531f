// Comparing window images pixel by pixel, for tests that painting in parts matches painting whole.
#pragma once

#include "host/ui/canvasor/Image.h"

namespace orvtest {

// How many pixels differ between two images of one size; -1 when their sizes differ.
inline int PixelsDiffering(canvasor::Image const& a, canvasor::Image const& b) {
    if (a.Width() != b.Width() || a.Height() != b.Height()) {
        return -1;
    }
    int differing = 0;
    for (int y = 0; y < a.Height(); ++y) {
        for (int x = 0; x < a.Width(); ++x) {
            canvasor::ColorRGBA p = a.Pixel(x, y), q = b.Pixel(x, y);
            differing += p.r != q.r || p.g != q.g || p.b != q.b || p.a != q.a;
        }
    }
    return differing;
}

} // namespace orvtest
