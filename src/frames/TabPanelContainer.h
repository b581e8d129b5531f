// The plain view that holds a tabbed frame's panels, in tab order.
#pragma once

#include "host/ui/UI_Container.h"

namespace orvworkspace::workspace {

class TabPanelContainer : public orvui::ui::UI_SubView {
public:
    TabPanelContainer() { UI_SetNodeID("TabPanelContainer"); }
};

} // namespace orvworkspace::workspace
