// The platform halves of frames and panels: child native windows titled as the platform shows them,
// and the node manager this library makes concrete.
#pragma once

#include "host/ui/NodeManager.h"
#include "host/ui/OS_Window.h"

namespace orvworkspace::workspace {

// A frame's child window: "Fernhold - Frame Window", shown.
class OS_WorkspaceFrame : public orvui::ui::OS_Window {
public:
    OS_WorkspaceFrame() { UI_SetNodeID("OS_WorkspaceFrame"); }
    void ConstructOSWindow(orvui::ui::NativeWindow parent, orvui::ui::RectT const& rect) {
        UI_CreateWindow(u"Fernhold - Frame Window", parent, rect, 0x50000000, 0);
    }
};

// A panel's child window of its frame: "Fernhold - TabPanel Window", hidden at first.
class OS_TabPanel : public orvui::ui::OS_Window {
public:
    OS_TabPanel() { UI_SetNodeID("OS_TabPanel"); }
    void ConstructOSWindow(orvui::ui::NativeWindow parent, orvui::ui::RectT const& rect) {
        UI_CreateWindow(u"Fernhold - TabPanel Window", parent, rect, 0x40000000, 0);
    }
};

// The library's node manager: the toolkit's platform manager with a public constructor.
class WorkspaceUIManager : public orvui::ui::OS_NodeManager {
public:
    WorkspaceUIManager() = default;
    ~WorkspaceUIManager() override = default;
};

} // namespace orvworkspace::workspace
