// The platform half of the workspace: the root container of the application's top-level windows,
// which keeps the host's instance handles and main window, finds the workspace window under a screen
// point, and owns the switch that makes all the application's windows show active captions together.
#pragma once

#include "host/ui/Theme.h"
#include "host/ui/UI_Container.h"

namespace orvworkspace::workspace {

class OS_TopLevelWindow;
class OS_Tracker;

class OS_Workspace : public orvui::ui::UI_Container, public orvui::ui::ThemeOwner {
public:
    using OSEventFunction = void (*)(orvui::ui::OS_Event*);

    // Keeps the host's handles and window and makes the main top-level window over it.
    void AttachToClientApp(void* instance, void* resourceInstance, orvui::ui::NativeWindow appWindow,
                           OSEventFunction callback, bool initialise);
    orvui::ui::NativeWindow GetAppWindow() const { return appWindow_; }
    void* GetInstance() const { return instance_; }
    void* GetResourceInstance() const { return resourceInstance_; }

    // The workspace window under a global point (climbing from frames and panels), null over
    // nothing, over another thread's window or over a window that is not a workspace window.
    OS_TopLevelWindow* GetTopLevelWindowFromPos(orvui::ui::PointT const& global) const;

    static void SetIsSyncWindowActivationEnabled(bool enabled) { syncWindowActivation = enabled; }
    static bool IsSyncWindowActivationEnabled() { return syncWindowActivation; }

    virtual void CreateMainTopLevelWindow(OSEventFunction osEventFunc) = 0;
    // The active mouse tracker, if any, and its release (the platform windows feed it).
    virtual OS_Tracker* GetTracker() const = 0;
    virtual void ReleaseTracker(bool cancel) = 0;

private:
    static inline bool syncWindowActivation = false;
    void* instance_ = nullptr;
    void* resourceInstance_ = nullptr;
    orvui::ui::NativeWindow appWindow_ = 0;
};

} // namespace orvworkspace::workspace
