// A mix-in for panels that can sit along a window edge in a tabless frame (a tool bar, say). Such a
// panel may be rippable: a gripper strip then lets the user tear it off into a floating window, where
// it becomes a regular tab. Every operation has a do-nothing default.
#pragma once

#include "frames/DrawGripperFace.h"

#include <memory>

namespace orvworkspace::workspace {

enum BorderElementOrientation { HorizontalElement = 0, VerticalElement = 1 };

class WorkspaceBorderElement {
public:
    WorkspaceBorderElement() = default;
    WorkspaceBorderElement(WorkspaceBorderElement const&) = default;
    WorkspaceBorderElement& operator=(WorkspaceBorderElement const&) = default;
    virtual ~WorkspaceBorderElement() = default;

    // A new face for the gripper, owned by the caller.
    virtual std::unique_ptr<DrawGripperFace> GetGripperFaceDrawer() {
        return std::make_unique<DefaultDrawGripperFace>();
    }
    virtual void ConvertToRegularTab() {}
    virtual void ConvertToBorderElement() {}
    virtual void SetElementOrientation(BorderElementOrientation) {}
    virtual bool IsRippable() { return false; }
};

} // namespace orvworkspace::workspace
