// Events as the toolkit hands them out: native messages to windows, and mouse and keyboard events to
// nodes.
#pragma once

#include "host/ui/UITypes.h"

namespace orvui::ui {

// A message to a native window, with its two parameters and the handler's answer.
struct OS_Event {
    NativeWindow window = 0;
    unsigned message = 0;
    std::uintptr_t wParam = 0;
    std::intptr_t lParam = 0;
    std::intptr_t result = 0;
};

// What every pointer event carries: where it happened and the modifier keys held.
class PointerEvent {
public:
    PointerEvent(PointF local, PointT global, unsigned modifiers)
        : local_(local)
        , global_(global)
        , modifiers_(modifiers) {}
    // In the coordinates of the node the event is handed to.
    PointF GetLocalPoint() const { return local_; }
    void SetLocalPoint(PointF p) { local_ = p; }
    PointT GetGlobalPoint() const { return global_; }
    unsigned GetModifiers() const { return modifiers_; }

private:
    PointF local_;
    PointT global_;
    unsigned modifiers_;
};

class MouseEvent : public PointerEvent {
public:
    MouseEvent(int action, PointF local, PointT global, unsigned modifiers, int button = 0,
               int clickCount = 0, int wheelDelta = 0)
        : PointerEvent(local, global, modifiers)
        , action_(action)
        , button_(button)
        , clickCount_(clickCount)
        , wheelDelta_(wheelDelta) {}
    // Whether this is the given action (see orvui::ui::action).
    bool IsAction(int action) const { return action_ == action; }
    int GetAction() const { return action_; }
    // 0 left, 1 right, 2 middle.
    int GetButton() const { return button_; }
    int GetClickCount() const { return clickCount_; }
    int GetWheelDelta() const { return wheelDelta_; }

private:
    int action_;
    int button_;
    int clickCount_;
    int wheelDelta_;
};

class KeyboardEvent {
public:
    KeyboardEvent(unsigned keyCode, bool down, unsigned modifiers, char32_t character = 0)
        : keyCode_(keyCode)
        , down_(down)
        , modifiers_(modifiers)
        , character_(character) {}
    unsigned GetKeyCode() const { return keyCode_; }
    bool IsKeyDown() const { return down_; }
    unsigned GetModifiers() const { return modifiers_; }
    // The character typed, 0 for keys that type none.
    char32_t GetCharacter() const { return character_; }

private:
    unsigned keyCode_;
    bool down_;
    unsigned modifiers_;
    char32_t character_;
};

} // namespace orvui::ui
