// Control bases.
#include "host/ui/controls/ControlView.h"

namespace orvui::controls {

void UI_ControlView::SetEnabled(bool enabled) {
    if (enabled != enabled_) {
        enabled_ = enabled;
        if (!enabled) {
            UI_LoseKeyboardFocus();
        }
        UI_Invalidate();
    }
}

void UI_ControlView::SendChanged(long value) {
    if (changed_) {
        UI_ControlChangedMessage message{this, value};
        boost::intrusive_ptr<ui::UI_Node> keep(IsReferenced() ? this : nullptr);
        changed_(&message);
    }
}

void UI_InteractiveControlView::UI_FocusChanged(int) {
    UI_Invalidate();
}

void UI_InteractiveControlView::TakeFocusOnPress(ui::MouseEvent const& event) {
    if (IsEnabled() && (event.IsAction(ui::action::Press) || event.IsAction(ui::action::DoubleClickPress))) {
        UI_GainKeyboardFocus(ui::FocusByMouse);
    }
}

} // namespace orvui::controls
