// How the gripper strip of a tear-off panel is painted. The default face fills the strip with the
// theme's gripper colour; panels with a look of their own supply their own face.
#pragma once

#include "host/ui/UITypes.h"

namespace canvasor {
class Canvasor;
}

namespace orvworkspace::workspace {

struct DrawGripperFace {
    DrawGripperFace() = default;
    DrawGripperFace(DrawGripperFace const&) = default;
    DrawGripperFace& operator=(DrawGripperFace const&) = default;
    virtual ~DrawGripperFace() = default;
    virtual void Draw(canvasor::Canvasor& c, orvui::ui::RectF const& area) = 0;
};

struct DefaultDrawGripperFace : DrawGripperFace {
    void Draw(canvasor::Canvasor& c, orvui::ui::RectF const& area) override;
};

} // namespace orvworkspace::workspace
