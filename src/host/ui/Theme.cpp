// The theme's defaults and change notification.
#include "host/ui/Theme.h"

#include <memory>

namespace orvui::ui {

namespace {

std::unique_ptr<Theme> current;
std::function<void()> changed;

} // namespace

Theme::Theme() {
    using canvasor::ColorRGBA;
    colors_ = {
        {color::PanelBackground, ColorRGBA::FromBytes(50, 50, 50)},
        {color::ToolTriangle, ColorRGBA::FromBytes(200, 200, 200)},
        {color::ToolTriangleDisabled, ColorRGBA::FromBytes(110, 110, 110)},
        {color::FrameBorder, ColorRGBA::FromBytes(30, 30, 30)},
        {color::FocusedFrameBorder, ColorRGBA::FromBytes(64, 140, 240)},
        {color::WindowBackground, ColorRGBA::FromBytes(24, 24, 24)},
        {color::GripperTop, ColorRGBA::FromBytes(90, 90, 90)},
        {color::GripperBottom, ColorRGBA::FromBytes(60, 60, 60)},
        {color::TitleBarActive, ColorRGBA::FromBytes(40, 70, 120)},
        {color::TitleBarInactive, ColorRGBA::FromBytes(70, 70, 70)},
        {color::TitleText, ColorRGBA::FromBytes(235, 235, 235)},
        {color::WindowBorder, ColorRGBA::FromBytes(15, 15, 15)},
        {color::MenuBar, ColorRGBA::FromBytes(60, 60, 60)},
        {color::TabBackground, ColorRGBA::FromBytes(60, 60, 60)},
        {color::TabFront, ColorRGBA::FromBytes(85, 85, 85)},
        {color::TabText, ColorRGBA::FromBytes(220, 220, 220)},
        {color::TabWellBackground, ColorRGBA::FromBytes(40, 40, 40)},
        {color::ControlBackground, ColorRGBA::FromBytes(70, 70, 70)},
        {color::ControlText, ColorRGBA::FromBytes(230, 230, 230)},
        {color::ControlHighlight, ColorRGBA::FromBytes(64, 140, 240)},
        {color::DropZone, ColorRGBA(0.25f, 0.55f, 0.95f, 0.35f)},
        {color::DropZoneHighlight, ColorRGBA(0.25f, 0.55f, 0.95f, 0.7f)},
    };
    fonts_ = {{FontKind::Normal, "DejaVu Sans"},
              {FontKind::Small, "DejaVu Sans"},
              {FontKind::Bold, "DejaVu Sans Bold"},
              {FontKind::Title, "DejaVu Sans"}};
}

Theme& Theme::Current() {
    if (!current) {
        current = std::make_unique<Theme>();
    }
    return *current;
}

void Theme::Terminate() {
    current.reset();
}

void Theme::SetName(std::string name, bool notify) {
    name_ = std::move(name);
    if (notify) {
        NotifyChanged();
    }
}

canvasor::ColorRGBA Theme::GetColor(int number) const {
    auto it = colors_.find(number);
    return it == colors_.end() ? canvasor::ColorRGBA(1, 0, 1, 1) : it->second;
}

void Theme::SetColor(int number, canvasor::ColorRGBA c, bool notify) {
    colors_[number] = c;
    if (notify) {
        NotifyChanged();
    }
}

void Theme::SetBrightness(float brightness, bool notify) {
    brightness_ = brightness;
    if (notify) {
        NotifyChanged();
    }
}

std::string Theme::GetFontName(FontKind kind) const {
    auto it = fonts_.find(kind);
    return it == fonts_.end() ? std::string("DejaVu Sans") : it->second;
}

void Theme::SetFontName(FontKind kind, std::string name) {
    fonts_[kind] = std::move(name);
}

void Theme::SetTrackColor(std::string const& key, float brightness, canvasor::ColorRGBA c) {
    tracks_[key][brightness] = c;
}

std::map<float, canvasor::ColorRGBA> Theme::GetTrack(std::string const& key) const {
    auto it = tracks_.find(key);
    return it == tracks_.end() ? std::map<float, canvasor::ColorRGBA>() : it->second;
}

void Theme::NotifyChanged() const {
    if (changed) {
        changed();
    }
}

void InstallThemeChangedFunction(std::function<void()> function) {
    changed = std::move(function);
}

canvasor::ColorRGBA GetColor(int number) {
    return Theme::Current().GetColor(number);
}

} // namespace orvui::ui
