// The workspace's platform half.
#include "platform/OS_Workspace.h"

#include "host/ui/Desktop.h"
#include "platform/OS_TopLevelWindow.h"

namespace orvworkspace::workspace {

using namespace orvui::ui;

void OS_Workspace::AttachToClientApp(void* instance, void* resourceInstance, NativeWindow appWindow,
                                     OSEventFunction callback, bool initialise) {
    instance_ = instance;
    resourceInstance_ = resourceInstance;
    appWindow_ = appWindow;
    if (initialise) {
        OS_Window::UI_Initialize(instance);
    }
    CreateMainTopLevelWindow(callback);
}

OS_TopLevelWindow* OS_Workspace::GetTopLevelWindowFromPos(PointT const& global) const {
    Desktop& desktop = Desktop::Get();
    NativeWindow w = desktop.WindowFromPoint(global);
    while (w && (desktop.GetStyle(w) & style::Child)) {
        w = desktop.GetParent(w);
    }
    if (!w || desktop.GetWindowThreadId(w) != Desktop::CurrentThreadId()) {
        return nullptr;
    }
    auto* object = static_cast<OS_Window*>(desktop.GetProperty(w, OS_Window::PropertyName));
    return dynamic_cast<OS_TopLevelWindow*>(object);
}

} // namespace orvworkspace::workspace
