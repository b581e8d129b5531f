// The stand-in window of a what-if layout: layout and snapping always on, no redraws, no tab
// minimum sizes.
#pragma once

#include "layout/LayoutManagerHostInterface.h"

namespace orvworkspace::workspace {

class ProxyMgrHostInterface : public LayoutManagerHostInterface {
public:
    void SuspendRedraws(bool) override {}
    void UpdateNow() override {}
    bool GetSplitterSnappingEnabled() override { return true; }
    bool GetLayoutEnabled() override { return true; }
    long GetTabMinHeight() override { return 0; }
    long GetTabMinWidth() override { return 0; }
};

} // namespace orvworkspace::workspace
