// The SDL2 backend of the toolkit: the desktop on a real display. Every shown top-level native
// window that is not a mouse-transparent overlay becomes one borderless SDL window at its structure
// rectangle, showing the desktop's composited image of that rectangle, so overlays are blended into
// the windows beneath them by the toolkit and translucency needs no compositing window manager. SDL
// input becomes the desktop's global input, the desktop's monitors are SDL's displays, and its
// clock follows the steady clock. The toolkit's cursor shows as the nearest system cursor (splitter
// bars as resize arrows, dragged tabs as a hand, dragged frames as a move cross). SDL turns SIGINT
// and SIGTERM into a quit request, so a host that saves on the way out also saves when it is asked
// to stop.
#pragma once

#include "host/ui/UITypes.h"

#include <chrono>
#include <cstdint>
#include <functional>
#include <map>
#include <memory>
#include <string>

struct SDL_Window;
struct SDL_Cursor;
union SDL_Event;

namespace orvui::sdl {

class SdlBackend {
public:
    // Opens the display; null (with the reason in error) when there is none.
    static std::unique_ptr<SdlBackend> Open(std::string& error);
    ~SdlBackend();
    SdlBackend(SdlBackend const&) = delete;
    SdlBackend& operator=(SdlBackend const&) = delete;

    // One turn: waits up to waitMs for input, feeds what came to the desktop, advances its clock,
    // runs its pending work and presents. False once a quit was asked for.
    bool Turn(int waitMs = 16);
    bool QuitRequested() const { return quit_; }
    // Runs turns until a quit is asked for; modal loops meanwhile keep turning too.
    void Run();
    // Shows the desktop's windows as they are now.
    void Present();
    // A host's shortcut keys: called with each typed character before the desktop sees it; true
    // keeps it from the desktop.
    void SetShortcutHook(std::function<bool(char32_t)> hook) { shortcut_ = std::move(hook); }

private:
    SdlBackend() = default;
    void Feed(SDL_Event const& event);
    ui::PointT Global(unsigned windowId, int x, int y) const;
    // Shows the desktop's current cursor as the nearest system cursor.
    void ShowCursor();

    std::map<ui::NativeWindow, SDL_Window*> windows_;
    std::chrono::steady_clock::time_point last_ = std::chrono::steady_clock::now();
    // The desktop's stacking count at the last picture; a change means the picture is out of date.
    std::uint64_t presentedStacking_ = ~std::uint64_t(0);
    bool quit_ = false;
    std::function<bool(char32_t)> shortcut_;
    // System cursors by their SDL kind, made on first use; the toolkit's cursor number shown last.
    std::map<int, SDL_Cursor*> cursors_;
    int shownCursor_ = -1;
};

} // namespace orvui::sdl
