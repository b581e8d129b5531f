// What a layout needs from the window it divides: redraw control, the snapping and layout switches,
// and the tab well's minimum sizes. Implemented by the top-level window; tests use doubles.
#pragma once

namespace orvworkspace::workspace {

class LayoutManagerHostInterface {
public:
    virtual ~LayoutManagerHostInterface() = default;
    // True suspends repainting, false resumes it; calls nest.
    virtual void SuspendRedraws(bool suspend) = 0;
    // Repaints what changed, now.
    virtual void UpdateNow() = 0;
    virtual bool GetSplitterSnappingEnabled() = 0;
    // While false, every layout step does nothing (tree edits are still made).
    virtual bool GetLayoutEnabled() = 0;
    virtual long GetTabMinHeight() = 0;
    virtual long GetTabMinWidth() = 0;
};

} // namespace orvworkspace::workspace
