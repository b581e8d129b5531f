// Captures of input: an InputCapture sees mouse and key events before any node (a pop-up that closes
// when clicked outside, a delayed press); a PointerCapture sends every mouse event to one node for
// its lifetime (a control being dragged), its window holding the mouse capture meanwhile.
#pragma once

#include "host/ui/UI_Node.h"

namespace orvui::ui {

class InputCapture {
public:
    virtual ~InputCapture() = default;
    // True consumes the event.
    virtual bool HandleMouseEvent(MouseEvent&) { return false; }
    virtual bool HandleKeyboardEvent(KeyboardEvent&) { return false; }
    // The capture was ended (by EndInputCapture or by another capture).
    virtual void CaptureEnded() {}
};

class PointerCapture {
public:
    explicit PointerCapture(UI_Node* node);
    ~PointerCapture();
    PointerCapture(PointerCapture const&) = delete;
    PointerCapture& operator=(PointerCapture const&) = delete;

private:
    UI_Node* previous_;
    NativeWindow window_ = 0;
    NativeWindow previousCapture_ = 0;
};

// The pointer's global position and the modifier flags held (see orvui::ui::modifier).
PointT GetGlobalMousePosition();
unsigned GetCurrentModKeys();

} // namespace orvui::ui
