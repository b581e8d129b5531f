// The look of the interface: numbered colours, a brightness, font names per kind, and the colour
// tracks of the keyframe theme. One theme is current per process; installing a theme-changed
// function lets the workspace repaint its windows when it changes. Every colour number the library
// uses has a default, so an unconfigured theme draws sensibly.
#pragma once

#include "host/ui/canvasor/Color.h"

#include <functional>
#include <map>
#include <string>

namespace orvui::ui {

// Colour numbers the library uses.
namespace color {
inline constexpr int PanelBackground = 277;
inline constexpr int ToolTriangle = 282;
inline constexpr int ToolTriangleDisabled = 283;
inline constexpr int FrameBorder = 284;
inline constexpr int FocusedFrameBorder = 290;
inline constexpr int WindowBackground = 293;
inline constexpr int GripperTop = 297;
inline constexpr int GripperBottom = 298;
// The toolkit's own.
inline constexpr int TitleBarActive = 1;
inline constexpr int TitleBarInactive = 2;
inline constexpr int TitleText = 3;
inline constexpr int WindowBorder = 4;
inline constexpr int MenuBar = 5;
inline constexpr int TabBackground = 10;
inline constexpr int TabFront = 11;
inline constexpr int TabText = 12;
inline constexpr int TabWellBackground = 13;
inline constexpr int ControlBackground = 20;
inline constexpr int ControlText = 21;
inline constexpr int ControlHighlight = 22;
inline constexpr int DropZone = 30;
inline constexpr int DropZoneHighlight = 31;
} // namespace color

enum class FontKind { Normal, Small, Bold, Title };

class Theme {
public:
    Theme();

    // The process's current theme.
    static Theme& Current();
    // Back to the defaults (the workspace does this as it goes).
    static void Terminate();

    std::string const& GetName() const { return name_; }
    // Renames the theme; with notify, the theme-changed function runs.
    void SetName(std::string name, bool notify);
    // A colour by number; opaque magenta for a number nobody defined, so a missing one shows.
    canvasor::ColorRGBA GetColor(int number) const;
    void SetColor(int number, canvasor::ColorRGBA color, bool notify = true);
    float GetBrightness() const { return brightness_; }
    void SetBrightness(float brightness, bool notify = true);
    std::string GetFontName(FontKind kind) const;
    void SetFontName(FontKind kind, std::string name);
    // The keyframe theme's colour tracks: per colour key, the colour at each brightness.
    void SetTrackColor(std::string const& key, float brightness, canvasor::ColorRGBA color);
    std::map<float, canvasor::ColorRGBA> GetTrack(std::string const& key) const;
    std::map<std::string, std::map<float, canvasor::ColorRGBA>> const& GetTracks() const { return tracks_; }

    void NotifyChanged() const;

private:
    std::string name_ = "Default";
    std::map<int, canvasor::ColorRGBA> colors_;
    float brightness_ = 0.5f;
    std::map<FontKind, std::string> fonts_;
    std::map<std::string, std::map<float, canvasor::ColorRGBA>> tracks_;
};

// Installs the function run whenever the current theme changes (one at a time; empty removes it).
void InstallThemeChangedFunction(std::function<void()> function);
// The current theme's colour.
canvasor::ColorRGBA GetColor(int number);

// A node that owns a theme for itself and the nodes below it (the workspace).
class ThemeOwner {
public:
    virtual ~ThemeOwner() = default;
    virtual void SetThemeName(std::string const& name, bool notify) {
        Theme::Current().SetName(name, notify);
    }
    virtual Theme& GetTheme() const { return Theme::Current(); }
};

// A node that draws with the theme of its owner.
class ThemeClient {
public:
    virtual ~ThemeClient() = default;
    Theme& GetTheme() const { return Theme::Current(); }
    canvasor::ColorRGBA GetColor(int number) const { return GetTheme().GetColor(number); }
};

} // namespace orvui::ui
