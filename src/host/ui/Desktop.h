// The screen as the toolkit models it: monitors, a table of native windows (styles, owners, parents,
// z-order, chrome, placements, properties, owning threads), mouse capture, activation, a beep
// counter, message delivery, global input and time. There is one desktop per process. Headless runs
// drive it directly (tests inject input and advance virtual time); a display backend feeds it the
// same way. Nothing here sleeps or starts threads.
//
// Decisions of this implementation:
// - Top-level z-order runs from bottom to top; bringing a window forward also lifts the windows it
//   owns above it, and a new window starts on top.
// - A window with a caption has a 22-pixel title bar and 3-pixel borders; one created with a menu
//   also has a 20-pixel menu bar. Popups and child windows have no chrome.
// - A top-level window that is mouse-transparent, or layered with opacity below 1.0, is skipped when
//   looking for the window under a point, and so is a hidden or mouse-transparent child window.
// - Handles are never reused in a process, even across Reset, so an object that outlives a desktop
//   cannot destroy a window of the next one.
// - Queued calls posted while queued calls run wait for the next turn, so a call that posts itself
//   cannot hang the loop; timers repeat at most once a millisecond.
// - A press in a caption moves the window until the release; a press in a border resizes it; the
//   node manager's user-resize function hears the beginning and the end of either.
// - Timers and delayed calls run in due-time order (install order among equals) as time advances.
#pragma once

#include "host/ui/DirtyRegion.h"
#include "host/ui/Events.h"
#include "host/ui/canvasor/Image.h"

#include <atomic>
#include <cstdint>
#include <functional>
#include <list>
#include <map>
#include <memory>
#include <mutex>
#include <string>
#include <unordered_map>
#include <vector>

namespace orvui::ui {

class OS_Window;
class UI_Node;

enum class ShowState { Normal = 1, Minimized = 2, Maximized = 3 };

// A window's placement: the show command (1 normal, 2 or 6 minimised, 3 maximised), flags (2 restore
// to maximised), minimised and maximised positions and the restored rectangle (left, top, width,
// height, global).
struct WindowPlacement {
    unsigned showCmd = 1;
    unsigned flags = 0;
    PointT minPosition;
    PointT maxPosition;
    RectT normal;
};

struct NativeWindowRecord {
    NativeWindow handle = 0;
    std::u16string title;
    std::uint32_t style = 0;
    std::uint32_t exStyle = 0;
    NativeWindow owner = 0;
    NativeWindow parent = 0;
    // The global structure rectangle of a top-level window; for a child window without a toolkit
    // object, its rectangle relative to the parent's client area.
    RectT rect;
    bool shown = false;
    bool enabled = true;
    float opacity = 1.0f;
    bool hasMenu = false;
    // The titles of the menu bar, left to right (windows made with a menu).
    std::vector<std::u16string> menuTitles;
    bool captionActive = false;
    // The whole window needs painting; otherwise dirtyRegion (window coordinates) is what does.
    bool dirty = true;
    DirtyRegion dirtyRegion;
    ShowState showState = ShowState::Normal;
    // Placement flags: 2 restores a minimised window to maximised.
    unsigned placementFlags = 0;
    RectT normalRect;
    PointT minPosition;
    PointT maxPosition;
    std::map<std::string, void*> properties;
    unsigned long threadId = 0;
    OS_Window* object = nullptr;
    // Bottom to top. A list, with each child knowing its place in it, so that a parent with many
    // child windows (a frame each) loses any one of them in constant time.
    std::list<NativeWindow> children;
    std::list<NativeWindow>::iterator placeAmongSiblings;
    // The window's last painted image, chrome included (top-level windows only).
    canvasor::Image image;
};

class Desktop {
public:
    // The process's desktop.
    static Desktop& Get();
    // Starts over with a fresh desktop (one monitor of 1920 × 1080, time 0, no windows); for tests.
    static void Reset();
    // Tells the nodes still holding windows that the windows are gone.
    ~Desktop();

    // --- Monitors ---
    void SetMonitors(std::vector<RectT> monitors);
    std::vector<RectT> const& GetMonitors() const { return monitors_; }

    // --- Native windows ---
    // Creates a window owned by the current thread; for the child style, ownerOrParent is the
    // parent. The window starts hidden unless the style has Visible.
    NativeWindow CreateNativeWindow(std::u16string const& title, std::uint32_t style, std::uint32_t exStyle,
                                    NativeWindow ownerOrParent, RectT const& rect,
                                    OS_Window* object = nullptr, bool hasMenu = false);
    // A shown top-level window of another thread, for tests of foreign windows.
    NativeWindow CreateForeignWindow(RectT const& rect, unsigned long threadId);
    void DestroyNativeWindow(NativeWindow w);
    bool IsWindow(NativeWindow w) const { return records_.count(w) != 0; }
    NativeWindowRecord const* Record(NativeWindow w) const;
    void SetObject(NativeWindow w, OS_Window* object);
    OS_Window* GetObject(NativeWindow w) const;
    NativeWindow GetParent(NativeWindow w) const;
    // Moves a child window under another parent window (its node moved in the tree).
    void SetParent(NativeWindow child, NativeWindow parent);
    NativeWindow GetOwner(NativeWindow w) const;
    std::uint32_t GetStyle(NativeWindow w) const;
    std::uint32_t GetExStyle(NativeWindow w) const;
    void SetExStyle(NativeWindow w, std::uint32_t exStyle);
    std::u16string GetTitle(NativeWindow w) const;
    unsigned long GetWindowThreadId(NativeWindow w) const;
    static unsigned long CurrentThreadId() { return 1; }
    void SetProperty(NativeWindow w, std::string const& name, void* value);
    void* GetProperty(NativeWindow w, std::string const& name) const;

    // The global structure rectangle (chrome included).
    RectT GetWindowRect(NativeWindow w) const;
    // The global client rectangle (chrome excluded).
    RectT GetClientRect(NativeWindow w) const;
    // A point in a window's client coordinates, in global ones.
    PointT ClientToGlobal(NativeWindow w, PointT client) const {
        RectT r = GetClientRect(w);
        return PointT(r.left + client.x, r.top + client.y);
    }
    // Moves and resizes a top-level window (its structure rectangle); its object hears of it.
    void SetWindowRect(NativeWindow w, RectT const& rect);
    void ShowWindow(NativeWindow w, bool show);
    bool IsVisible(NativeWindow w) const;
    void SetOpacity(NativeWindow w, float opacity);
    // Enables or disables; the window is sent the enable message when its state changes. Returns
    // whether it was disabled before.
    bool EnableWindow(NativeWindow w, bool enable);
    bool IsEnabled(NativeWindow w) const;
    // Marks a window's whole top-level window for painting.
    void Invalidate(NativeWindow w);
    // Marks part of w's top-level window for painting, given relative to its client area (rounded
    // outwards); the marks of a window add up.
    void InvalidateClientArea(NativeWindow w, RectF const& local);
    bool IsDirty(NativeWindow w) const;
    // Whether the whole of the window's top-level window is already marked, so that marking a part
    // of it adds nothing.
    bool IsWhollyDirty(NativeWindow w) const;
    void ClearDirty(NativeWindow w);
    // Paints a top-level window's image now (its chrome, then its nodes) and clears its mark.
    void PaintWindow(NativeWindow w);
    // Paints what is marked of a top-level window: only the marked area when no more is marked
    // (the window's nodes that meet it, over the background), else the whole window.
    void PaintDirty(NativeWindow w);
    // How many pixels the desktop has painted into window images since it was made: the cost of
    // repainting, for benchmarks and for tests that an edit repaints only what it changed.
    std::uint64_t PaintedPixels() const { return paintedPixels_; }
    // Counts changes to which top-level windows cover which (one raised, lowered or destroyed),
    // which mark no window for painting and yet change the screen: a display compares it between
    // pictures.
    std::uint64_t StackingChanges() const { return stackingChanges_; }
    // The window's image, painted first when it is marked.
    canvasor::Image WindowImage(NativeWindow w);
    // The shown windows composited bottom to top, with their opacity, over the area of all the
    // monitors (whose top-left corner is the image's origin).
    canvasor::Image Snapshot();

    // --- Z-order and activation ---
    void BringToFront(NativeWindow w);
    // Top-level windows, topmost first.
    std::vector<NativeWindow> EnumerateWindows() const;
    NativeWindow WindowFromPoint(PointT global) const;
    // Brings the window forward and makes it the active one, sending the caption activation message
    // to the windows that lose and gain it (and application activation when the application was not
    // active).
    void Activate(NativeWindow w);
    NativeWindow GetActiveWindow() const { return active_; }
    bool IsApplicationActive() const { return applicationActive_; }
    // Another application comes to the front (false) or this one returns (true).
    void SetApplicationActive(bool active);
    bool IsCaptionActive(NativeWindow w) const;
    // The default handling of the caption activation message draws the caption this way.
    void SetCaptionActive(NativeWindow w, bool active);

    // --- Capture ---
    void SetCapture(NativeWindow w);
    void ReleaseCapture();
    NativeWindow GetCapture() const { return capture_; }

    // --- Placement ---
    WindowPlacement GetPlacement(NativeWindow w) const;
    void SetPlacement(NativeWindow w, WindowPlacement const& placement);
    bool IsZoomed(NativeWindow w) const;
    bool IsIconic(NativeWindow w) const;

    // --- Messages ---
    std::intptr_t SendMessage(NativeWindow w, unsigned message, std::uintptr_t wParam = 0,
                              std::intptr_t lParam = 0);
    void Beep(unsigned type = 0);
    int GetBeepCount() const { return beeps_; }
    int GetMenuBarMetric() const { return MenuBarHeight; }
    // The titles of a window's menu bar (a window made with a menu); a press on one sends the
    // window MenuBarPressed with its index.
    void SetMenuBar(NativeWindow w, std::vector<std::u16string> titles);
    // The titles' global rectangles in the bar, left to right.
    std::vector<RectT> GetMenuBarItemRects(NativeWindow w) const;
    // A title's global rectangle in the bar; empty when there is no such title.
    RectT GetMenuBarItemRect(NativeWindow w, std::size_t index) const;

    // --- Input, in global coordinates ---
    void MouseMove(PointT global);
    void MouseDown(PointT global, int button = 0, int clickCount = 1);
    void MouseUp(PointT global, int button = 0);
    void MouseWheel(PointT global, int delta);
    void KeyDown(unsigned keyCode, char32_t character = 0);
    void KeyUp(unsigned keyCode);
    void SetModifiers(unsigned modifiers) { modifiers_ = modifiers; }
    unsigned GetModifiers() const { return modifiers_; }
    PointT GetMousePosition() const { return mouse_; }
    bool IsMouseButtonDown() const { return buttonDown_; }
    void SetCursor(int cursor) { cursor_ = cursor; }
    int GetCursor() const { return cursor_; }

    // --- Time, timers and queued calls ---
    double Now() const { return now_.load(); }
    // Moves time forward, firing due timers and delayed calls in time order.
    void AdvanceTime(double seconds);
    // Runs the queued calls that are due now (those queued meanwhile included).
    void ProcessPendingWork();
    // Queues a call for the main thread, after a delay; callable from any thread.
    void PostToMainThread(std::function<void()> call, double delaySeconds = 0);
    void InstallTimer(UI_Node* node, unsigned long id, double seconds, bool repeat);
    void RemoveTimer(UI_Node* node, unsigned long id);
    void RemoveTimers(UI_Node* node);
    bool HasTimer(UI_Node const* node, unsigned long id) const;

    // Forgets a node that is going away (capture of events aimed at it and its timers).
    void ForgetNode(UI_Node* node);

private:
    Desktop();
    struct Timer {
        double due;
        unsigned long sequence;
        UI_Node* node;
        unsigned long id;
        double interval;
        bool repeat;
    };
    struct QueuedCall {
        double due;
        unsigned long sequence;
        std::function<void()> call;
    };
    enum class Drag { None, Move, Resize };

    NativeWindowRecord* Find(NativeWindow w);
    // Puts a child window on top of its parent's children, or takes it from them.
    void LinkChild(NativeWindowRecord& child, NativeWindow parent);
    void UnlinkChild(NativeWindowRecord& child);
    NativeWindowRecord const* Find(NativeWindow w) const;
    NativeWindow TopLevelOf(NativeWindow w) const;
    NativeWindow DeepestChildAt(NativeWindow w, PointT global) const;
    void LiftOwned(NativeWindow owner);
    void SendCaptionActivation(NativeWindow w, bool active, NativeWindow other);
    void SendToOwnWindows(unsigned message, std::uintptr_t wParam);
    unsigned long NewestCall();
    // Mouse messages to the capturing window or the one under the pointer.
    void SendMouse(unsigned message, PointT global, std::uintptr_t wParam, std::intptr_t extra = 0);
    bool StartChromeDrag(NativeWindow w, PointT global);
    void ContinueChromeDrag(PointT global);
    void EndChromeDrag();
    bool RunNextDue(double until, unsigned long newestCall);

    std::vector<RectT> monitors_;
    std::uint64_t paintedPixels_ = 0;
    std::uint64_t stackingChanges_ = 0;
    std::unordered_map<NativeWindow, NativeWindowRecord> records_;
    std::vector<NativeWindow> zOrder_; // top-level windows, bottom to top
    static inline NativeWindow nextHandle_ = 0x100;
    NativeWindow active_ = 0;
    // The window to activate again when the application returns to the front.
    NativeWindow lastActive_ = 0;
    NativeWindow capture_ = 0;
    bool applicationActive_ = false;
    int beeps_ = 0;
    PointT mouse_;
    unsigned modifiers_ = 0;
    bool buttonDown_ = false;
    int cursor_ = 0;
    std::atomic<double> now_{0};
    unsigned long sequence_ = 0;
    unsigned long callSequence_ = 0;
    std::vector<Timer> timers_;
    std::mutex queueMutex_;
    std::vector<QueuedCall> queue_;
    Drag drag_ = Drag::None;
    NativeWindow dragWindow_ = 0;
    PointT dragStart_;
    RectT dragStartRect_;
    int dragEdges_ = 0; // bits: 1 left, 2 top, 4 right, 8 bottom

    static std::unique_ptr<Desktop> instance;
};

} // namespace orvui::ui
