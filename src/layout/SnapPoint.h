// A candidate position for a dragged bar: an edge of another splitter's rectangle or of a frame at
// a preferred distance, or another bar's own position. A bar within 20 pixels of it jumps to it.
#pragma once

#include "layout/LayoutTypes.h"

namespace orvworkspace::workspace {

class Frame;
class Splitter;

struct SnapPoint {
    // How close (in pixels, exclusive) a bar must come to a candidate to snap to it.
    static constexpr long SnapDistance = 20;

    Splitter* owner = nullptr;
    // A length from an edge; 0 with `other` means the other bar's own position.
    long offset = 0;
    Splitter* other = nullptr;
    Frame* frame = nullptr;
    // Whether the offset runs from the near (left or top) edge; otherwise from the far edge.
    bool fromFirst = true;

    // Moves the matching coordinate of target to this candidate when it is close enough (and, for a
    // frame's candidate, when the owner's child on that side may snap); false otherwise.
    bool Snap(PointT& target) const;
};

// Adds one to a counter for its lifetime.
class ScIncDec {
public:
    explicit ScIncDec(int& counter)
        : counter_(counter) {
        ++counter_;
    }
    ~ScIncDec() { --counter_; }
    ScIncDec(ScIncDec const&) = delete;
    ScIncDec& operator=(ScIncDec const&) = delete;

private:
    int& counter_;
};

} // namespace orvworkspace::workspace
