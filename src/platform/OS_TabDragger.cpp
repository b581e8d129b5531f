// Parking native windows for the length of a drag.
#include "platform/OS_TabDragger.h"

#include "host/ui/Desktop.h"
#include "platform/OS_TopLevelWindow.h"

namespace orvworkspace::workspace {

using namespace orvui::ui;

OS_TabDragger::~OS_TabDragger() {
    for (auto it = kept_.rbegin(); it != kept_.rend(); ++it) {
        Desktop::Get().DestroyNativeWindow(*it);
    }
}

void OS_TabDragger::Park(OS_Window* node) {
    if (!node) {
        return;
    }
    node->UI_Show(false);
    if (NativeWindow handle = node->UI_DetachOSWindow()) {
        kept_.push_back(handle);
    }
}

void OS_TabDragger::DetachFrameWindow(OS_TopLevelWindow*, OS_Window* node) {
    Park(node);
}

void OS_TabDragger::DetachTopLevelWindow(OS_TopLevelWindow* window) {
    Park(window);
}

void OS_TabDragger::KeepNativeWindow(NativeWindow handle) {
    if (handle) {
        kept_.push_back(handle);
    }
}

} // namespace orvworkspace::workspace
