#include "host/ui_sdl/SdlBackend.h"

#include "host/core/TextConversion.h"
#include "host/ui/Desktop.h"
#include "host/ui/Modal.h"
#include "host/ui/canvasor/Image.h"

#include <SDL.h>
#include <cairo.h>
#include <set>
#include <vector>

namespace orvui::sdl {

using ui::Desktop;
using ui::NativeWindow;
using ui::PointT;
using ui::RectT;

std::unique_ptr<SdlBackend> SdlBackend::Open(std::string& error) {
    if (SDL_Init(SDL_INIT_VIDEO) != 0) {
        error = SDL_GetError();
        return nullptr;
    }
    std::vector<RectT> monitors;
    for (int i = 0; i < SDL_GetNumVideoDisplays(); ++i) {
        SDL_Rect r;
        if (SDL_GetDisplayBounds(i, &r) == 0) {
            monitors.emplace_back(r.x, r.y, r.w, r.h);
        }
    }
    if (monitors.empty()) {
        error = "the display has no monitors";
        SDL_Quit();
        return nullptr;
    }
    Desktop::Get().SetMonitors(monitors);
    SDL_StartTextInput();
    return std::unique_ptr<SdlBackend>(new SdlBackend);
}

SdlBackend::~SdlBackend() {
    for (auto& entry : windows_) {
        SDL_DestroyWindow(entry.second);
    }
    for (auto& entry : cursors_) {
        SDL_FreeCursor(entry.second);
    }
    SDL_Quit();
}

void SdlBackend::ShowCursor() {
    int cursor = Desktop::Get().GetCursor();
    if (cursor == shownCursor_) {
        return;
    }
    shownCursor_ = cursor;
    SDL_SystemCursor system = SDL_SYSTEM_CURSOR_ARROW;
    switch (cursor) {
    case 10: // a vertical bar, dragged sideways
        system = SDL_SYSTEM_CURSOR_SIZEWE;
        break;
    case 11: // a horizontal bar, dragged up and down
        system = SDL_SYSTEM_CURSOR_SIZENS;
        break;
    case 12: // where bars cross
    case 20: // a whole frame being dragged
        system = SDL_SYSTEM_CURSOR_SIZEALL;
        break;
    case 19: // one tab being dragged
        system = SDL_SYSTEM_CURSOR_HAND;
        break;
    default:
        break;
    }
    SDL_Cursor*& made = cursors_[int(system)];
    if (!made) {
        made = SDL_CreateSystemCursor(system);
    }
    if (made) {
        SDL_SetCursor(made);
    }
}

PointT SdlBackend::Global(unsigned windowId, int x, int y) const {
    SDL_Window* window = SDL_GetWindowFromID(windowId);
    int wx = 0, wy = 0;
    if (window) {
        SDL_GetWindowPosition(window, &wx, &wy);
    }
    return PointT(wx + x, wy + y);
}

namespace {

unsigned KeyCode(SDL_Keycode key) {
    switch (key) {
    case SDLK_TAB:
        return ui::key::Tab;
    case SDLK_RETURN:
    case SDLK_KP_ENTER:
        return ui::key::Enter;
    case SDLK_ESCAPE:
        return ui::key::Escape;
    case SDLK_LEFT:
        return ui::key::Left;
    case SDLK_RIGHT:
        return ui::key::Right;
    case SDLK_UP:
        return ui::key::Up;
    case SDLK_DOWN:
        return ui::key::Down;
    default:
        break;
    }
    if (key >= SDLK_a && key <= SDLK_z) {
        return unsigned('A' + (key - SDLK_a));
    }
    return key < 128 ? unsigned(key) : 0;
}

unsigned Modifiers() {
    SDL_Keymod mod = SDL_GetModState();
    return ((mod & KMOD_SHIFT) ? ui::modifier::Shift : 0) | ((mod & KMOD_CTRL) ? ui::modifier::Control : 0) |
           ((mod & KMOD_ALT) ? ui::modifier::Alt : 0);
}

int Button(Uint8 button) {
    return button == SDL_BUTTON_RIGHT ? 1 : button == SDL_BUTTON_MIDDLE ? 2 : 0;
}

} // namespace

void SdlBackend::Feed(SDL_Event const& event) {
    Desktop& desktop = Desktop::Get();
    switch (event.type) {
    case SDL_QUIT:
        quit_ = true;
        break;
    case SDL_MOUSEMOTION:
        desktop.MouseMove(Global(event.motion.windowID, event.motion.x, event.motion.y));
        break;
    case SDL_MOUSEBUTTONDOWN:
        desktop.SetModifiers(Modifiers());
        desktop.MouseDown(Global(event.button.windowID, event.button.x, event.button.y),
                          Button(event.button.button), event.button.clicks);
        break;
    case SDL_MOUSEBUTTONUP:
        desktop.SetModifiers(Modifiers());
        desktop.MouseUp(Global(event.button.windowID, event.button.x, event.button.y),
                        Button(event.button.button));
        break;
    case SDL_MOUSEWHEEL: {
        int x = 0, y = 0;
        SDL_GetGlobalMouseState(&x, &y);
        desktop.MouseWheel(PointT(x, y), event.wheel.y * 120);
        break;
    }
    case SDL_KEYDOWN:
    case SDL_KEYUP: {
        desktop.SetModifiers(Modifiers());
        unsigned code = KeyCode(event.key.keysym.sym);
        // Printable keys arrive with their character as text input; the rest come from here.
        bool printable = event.key.keysym.sym >= 32 && event.key.keysym.sym < 127 &&
                         !(Modifiers() & (ui::modifier::Control | ui::modifier::Alt));
        if (code && event.type == SDL_KEYUP) {
            desktop.KeyUp(code);
        } else if (code && !printable) {
            desktop.KeyDown(code);
        }
        break;
    }
    case SDL_TEXTINPUT: {
        std::u16string text = orvcore::utility::UTF8to16(event.text.text);
        for (char16_t ch : text) {
            if (shortcut_ && shortcut_(ch)) {
                continue;
            }
            unsigned code = (ch >= u'a' && ch <= u'z') ? unsigned(ch - u'a' + u'A') : unsigned(ch);
            desktop.KeyDown(code, ch);
        }
        break;
    }
    default:
        break;
    }
}

bool SdlBackend::Turn(int waitMs) {
    SDL_Event event;
    bool fed = false;
    if (SDL_WaitEventTimeout(&event, waitMs)) {
        Feed(event);
        while (SDL_PollEvent(&event)) {
            Feed(event);
        }
        fed = true;
    }
    auto now = std::chrono::steady_clock::now();
    Desktop& desktop = Desktop::Get();
    desktop.AdvanceTime(std::chrono::duration<double>(now - last_).count());
    last_ = now;
    desktop.ProcessPendingWork();
    ShowCursor();
    // An idle display is not composited again: only input, a window marked for painting (a
    // timer's work, say) or a change in which window covers which brings a new picture.
    bool dirty = fed || desktop.StackingChanges() != presentedStacking_;
    for (NativeWindow w : desktop.EnumerateWindows()) {
        dirty = dirty || desktop.IsDirty(w);
    }
    if (dirty) {
        Present();
    }
    return !quit_;
}

void SdlBackend::Run() {
    // A modal window (a menu, a dialog) runs its own loop; it keeps the display alive by turning,
    // for as long as the person takes, and a quit asked for meanwhile cancels it.
    ui::ScopedModalDriver driver(
        [this](ui::UI_ModalWindow& modal) {
            if (!Turn()) {
                modal.CancelModal();
            }
        },
        false);
    while (Turn()) {
    }
}

void SdlBackend::Present() {
    Desktop& desktop = Desktop::Get();
    presentedStacking_ = desktop.StackingChanges();
    canvasor::Image screen = desktop.Snapshot();
    cairo_surface_t* surface = screen.Surface();
    cairo_surface_flush(surface);
    unsigned char const* pixels = cairo_image_surface_get_data(surface);
    int stride = cairo_image_surface_get_stride(surface);
    RectT area = desktop.GetMonitors().front();
    for (RectT const& m : desktop.GetMonitors()) {
        area = area.Union(m);
    }
    std::set<NativeWindow> shown;
    for (NativeWindow w : desktop.EnumerateWindows()) {
        ui::NativeWindowRecord const* record = desktop.Record(w);
        if (!record || !record->shown || record->parent || (record->exStyle & ui::style::MouseTransparent) ||
            record->showState == ui::ShowState::Minimized) {
            continue;
        }
        RectT r = record->rect.Intersection(area);
        if (r.IsEmpty()) {
            continue;
        }
        shown.insert(w);
        SDL_Window*& window = windows_[w];
        if (!window) {
            window = SDL_CreateWindow(orvcore::utility::UTF16to8(record->title).c_str(), r.left, r.top,
                                      r.width, r.height, SDL_WINDOW_BORDERLESS | SDL_WINDOW_SHOWN);
            if (!window) {
                windows_.erase(w);
                continue;
            }
        }
        int x = 0, y = 0, width = 0, height = 0;
        SDL_GetWindowPosition(window, &x, &y);
        SDL_GetWindowSize(window, &width, &height);
        if (x != r.left || y != r.top) {
            SDL_SetWindowPosition(window, r.left, r.top);
        }
        if (width != r.width || height != r.height) {
            SDL_SetWindowSize(window, r.width, r.height);
        }
        if (SDL_Surface* target = SDL_GetWindowSurface(window)) {
            unsigned char const* from = pixels + (r.top - area.top) * stride + (r.left - area.left) * 4;
            SDL_ConvertPixels(std::min(r.width, target->w), std::min(r.height, target->h),
                              SDL_PIXELFORMAT_ARGB8888, from, stride, target->format->format, target->pixels,
                              target->pitch);
            SDL_UpdateWindowSurface(window);
        }
    }
    for (auto it = windows_.begin(); it != windows_.end();) {
        if (!shown.count(it->first)) {
            SDL_DestroyWindow(it->second);
            it = windows_.erase(it);
        } else {
            ++it;
        }
    }
}

} // namespace orvui::sdl
