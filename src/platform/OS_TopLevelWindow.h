// The platform half of a top-level window: its native window (the host's main window, or a floating
// tool window owned by another), redraw suspension, the saved and applied window placement, and the
// messages that keep the application's windows acting as one: shared caption activation, tool
// windows following the main window's enablement, and the active tracker fed by mouse moves.
#pragma once

#include "host/ui/Desktop.h"
#include "host/ui/OS_Window.h"
#include "layout/LayoutManagerHostInterface.h"

namespace orvcore::proplist {
class PropList;
}

namespace orvworkspace::workspace {

class OS_Workspace;

class OS_TopLevelWindow : public LayoutManagerHostInterface, public orvui::ui::OS_Window {
public:
    // The style and extended style of a floating window: popup, caption, sizing frame; tool window.
    static constexpr std::uint32_t FloatingStyle = 0x80CC0000;
    static constexpr std::uint32_t FloatingExStyle = 0x80;

    OS_TopLevelWindow(OS_Workspace* workspace, bool flag);

    // A floating window owned by owner at a global structure rectangle (not yet shown).
    void ConstructOSWindow(orvui::ui::NativeWindow owner, orvui::ui::RectT const& rect);
    // The main window: binds to the host's application window.
    void ConstructOSWindow();
    OS_Workspace* GetOSWorkspace() const { return workspace_; }

    void SuspendRedraws(bool suspend) override;
    void UpdateNow() override;
    int GetRedrawSuspension() const { return redrawSuspension_; }

    // Writes "ShowCmd", "MinPos", "MaxPos" and "NormalPos" (left, top, right, bottom).
    void SaveWindowStateData(orvcore::proplist::PropList& list) const;
    // Applies a saved placement; false (and nothing applied) for a tool window or malformed lists.
    bool RestoreWindowStateData(orvcore::proplist::PropList const& list);
    void ApplyWindowStateData(orvui::ui::WindowPlacement placement);
    // Maximised on the primary monitor, restoring to it less 10 pixels each side.
    void ApplyDefaultWindowState();
    void SetDelayWindowVisibility(bool delay) { delayVisibility_ = delay; }
    bool GetDelayWindowVisibility() const { return delayVisibility_; }
    void SetDelayedShowMaximized(bool later) { showMaximizedLater_ = later; }
    bool GetDelayedShowMaximized() const { return showMaximizedLater_; }

    void UI_HandleOSEvent(orvui::ui::OS_Event& event) override;

private:
    bool HandleCaptionActivation(orvui::ui::OS_Event& event);
    void HandleEnable(orvui::ui::OS_Event const& event);

    OS_Workspace* workspace_;
    int redrawSuspension_ = 0;
    bool delayVisibility_ = false;
    bool showMaximizedLater_ = false;
};

} // namespace orvworkspace::workspace
