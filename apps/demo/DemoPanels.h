// The demo host's panels: ten kinds of a media editor, each drawing something recognisable in code
// (no image files), and their creators. Some ask for snap sizes, some can be locked, the monitors
// have tab colours, the effects list hides when closed, the history is obliterated when closed and
// keeps its state, and the project remembers which bin was open.
#pragma once

#include "workspace/TabCreator.h"

#include <string>
#include <vector>

namespace orvdemo {

// The panel kinds' tab types, in the order of the Window menu.
std::vector<std::string> const& PanelTypes();
// The name a panel kind shows on its tab and in the menu.
std::u16string PanelName(std::string const& type);
// Registers a creator for every kind with the workspace.
void RegisterPanelCreators(orvworkspace::workspace::Workspace& workspace);

} // namespace orvdemo
