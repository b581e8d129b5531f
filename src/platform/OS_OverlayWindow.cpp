// Overlay windows: checked creation of the layered popup.
#include "platform/OS_OverlayWindow.h"

#include "host/core/Error.h"
#include "host/core/ErrorTable.h"
#include "host/ui/Desktop.h"

namespace orvworkspace::workspace {

using namespace orvui::ui;

OS_OverlayWindow::OS_OverlayWindow(NativeWindow owner, NativeWindow, OS_Window*, RectT const& rect,
                                   bool plainView)
    : osWindowBacked_(!plainView) {
    UI_SetNodeID("OS_OverlayWindow");
    if (!osWindowBacked_) {
        return;
    }
    if (rect.width <= 0 || rect.height <= 0) {
        orvcore::config::ThrowError(orvcore::config::errors::CannotCreateEmptyOverlayWindow);
    }
    // The desktop cannot own a window by a handle that names none; such a window is never made.
    if (owner && !Desktop::Get().IsWindow(owner)) {
        orvcore::config::ThrowError(orvcore::config::errors::CannotCreateOverlayWindow);
    }
    if (!UI_CreateWindow(u"Fernhold - Overlay Window", owner, rect, OverlayStyle, OverlayExStyle)) {
        orvcore::config::ThrowError(orvcore::config::errors::CannotCreateOverlayWindow);
    }
    UI_Invalidate();
}

} // namespace orvworkspace::workspace
