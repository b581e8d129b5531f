// The toolkit's shared vocabulary: native window handles, style bits, message numbers, modifier
// flags, key codes, mouse actions, cursors and focus-change reasons. The numbers follow the Win32
// values so that the platform layer above reads like the platform it models; every number the
// library depends on is defined here and nowhere else.
#pragma once

#include "host/core/Geometry.h"

#include <cstdint>

namespace orvui::ui {

using orvcore::geom::PointF;
using orvcore::geom::RectF;
using PointT = orvcore::geom::Point;
using RectT = orvcore::geom::Rect;

// A native window of the desktop; 0 is none.
using NativeWindow = std::uintptr_t;

namespace style {
inline constexpr std::uint32_t Child = 0x40000000;
inline constexpr std::uint32_t Visible = 0x10000000;
inline constexpr std::uint32_t Popup = 0x80000000;
inline constexpr std::uint32_t Caption = 0x00C00000;
inline constexpr std::uint32_t SizingFrame = 0x00040000;
// Extended styles.
inline constexpr std::uint32_t ToolWindow = 0x80;
inline constexpr std::uint32_t Layered = 0x80000;
inline constexpr std::uint32_t MouseTransparent = 0x20;
} // namespace style

namespace message {
inline constexpr unsigned Enable = 0x0A;
inline constexpr unsigned ActivateApp = 0x1C;
inline constexpr unsigned CaptionActivate = 0x86;
inline constexpr unsigned KeyDown = 0x100;
inline constexpr unsigned KeyUp = 0x101;
inline constexpr unsigned MouseMove = 0x200;
inline constexpr unsigned LeftButtonDown = 0x201;
inline constexpr unsigned LeftButtonUp = 0x202;
inline constexpr unsigned LeftButtonDoubleClick = 0x203;
inline constexpr unsigned RightButtonDown = 0x204;
inline constexpr unsigned RightButtonUp = 0x205;
inline constexpr unsigned MiddleButtonDown = 0x207;
inline constexpr unsigned MiddleButtonUp = 0x208;
inline constexpr unsigned MouseWheel = 0x20A;
inline constexpr unsigned CaptureLost = 0x215;
// A press on a title of the window's menu bar; wParam is the title's index. The window opens the
// menu under the title's rectangle (Desktop::GetMenuBarItemRect) and acts on the choice.
inline constexpr unsigned MenuBarPressed = 0x0116;
} // namespace message

// Modifier flags of GetCurrentModKeys.
namespace modifier {
inline constexpr unsigned Shift = 1;
inline constexpr unsigned Control = 4;
inline constexpr unsigned Alt = 16;
} // namespace modifier

namespace key {
inline constexpr unsigned Tab = 9;
inline constexpr unsigned Enter = 13;
inline constexpr unsigned Escape = 27;
inline constexpr unsigned Left = 37;
inline constexpr unsigned Up = 38;
inline constexpr unsigned Right = 39;
inline constexpr unsigned Down = 40;
// Letters are their upper-case ASCII codes ('A' is 65).
} // namespace key

// Mouse actions of MouseEvent::IsAction.
namespace action {
inline constexpr int Press = 1;
inline constexpr int Release = 2;
inline constexpr int DoubleClickPress = 3;
inline constexpr int SecondaryPress = 4;
inline constexpr int Move = 5;
inline constexpr int Wheel = 6;
} // namespace action

namespace cursor {
inline constexpr int Arrow = 0;
inline constexpr int VerticalSplitter = 10;
inline constexpr int HorizontalSplitter = 11;
inline constexpr int SplitterCrossing = 12;
inline constexpr int DragTab = 19;
inline constexpr int DragFrame = 20;
} // namespace cursor

// Why keyboard focus moved.
enum FocusChangeReason {
    FocusUnknown = 0,
    FocusByMouse = 1,
    FocusByKeyboard = 2,
    FocusByProgram = 3,
    FocusByActivation = 4
};

// Window chrome drawn by the toolkit around a window with a caption; the application's main window
// also has a menu bar.
inline constexpr int TitleBarHeight = 22;
inline constexpr int BorderWidth = 3;
inline constexpr int MenuBarHeight = 20;

// A rectangle as the platform writes it: edges rather than a size.
struct WinRect {
    std::int32_t left = 0, top = 0, right = 0, bottom = 0;
    bool operator==(WinRect const& o) const {
        return left == o.left && top == o.top && right == o.right && bottom == o.bottom;
    }
};
inline WinRect ORVtoWIN(RectT const& r) {
    return WinRect{r.left, r.top, r.Right(), r.Bottom()};
}
inline RectT WINtoORV(WinRect const& r) {
    return RectT::FromEdges(r.left, r.top, r.right, r.bottom);
}

// The low and high signed 16-bit halves of a message parameter holding a point.
inline std::intptr_t MakePointParam(int x, int y) {
    return static_cast<std::intptr_t>((static_cast<std::uint32_t>(static_cast<std::uint16_t>(y)) << 16) |
                                      static_cast<std::uint16_t>(x));
}
inline int PointParamX(std::intptr_t p) {
    return static_cast<std::int16_t>(p & 0xFFFF);
}
inline int PointParamY(std::intptr_t p) {
    return static_cast<std::int16_t>((p >> 16) & 0xFFFF);
}

} // namespace orvui::ui
