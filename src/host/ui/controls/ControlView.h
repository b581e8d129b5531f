// The base of the toolkit's controls: a node with an enabled state and a changed notification
// (UI_ControlView), and the kind the user operates, which takes keyboard focus when pressed
// (UI_InteractiveControlView).
#pragma once

#include "host/ui/UI_Node.h"

#include <functional>

namespace orvui::controls {

using ui::PointF;
using ui::PointT;
using ui::RectF;
using ui::RectT;

// What a control's changed notification carries.
struct UI_ControlChangedMessage {
    ui::UI_Node* control = nullptr;
    long value = 0;
};

class UI_ControlView : public ui::UI_Node {
public:
    using ChangedFunction = std::function<void(UI_ControlChangedMessage*)>;

    void SetEnabled(bool enabled);
    bool IsEnabled() const { return enabled_; }
    // The function told when the user changes the control's value.
    void NotifyWhenChanged(ChangedFunction f) { changed_ = std::move(f); }

protected:
    void SendChanged(long value);

private:
    bool enabled_ = true;
    ChangedFunction changed_;
};

class UI_InteractiveControlView : public UI_ControlView {
public:
    bool UI_WantsKeyboardFocus() const override { return IsEnabled(); }
    void UI_FocusChanged(int reason) override;

protected:
    // Presses give the control the keyboard focus; subclasses call this from their mouse handling.
    void TakeFocusOnPress(ui::MouseEvent const& event);
};

} // namespace orvui::controls
