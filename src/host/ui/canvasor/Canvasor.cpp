// Drawing through cairo.
#include "host/ui/canvasor/Canvasor.h"

#include <cairo.h>
#include <unordered_map>

namespace canvasor {

Canvasor::Canvasor(Image& target)
    : cr_(cairo_create(target.Surface())) {}

Canvasor::~Canvasor() {
    cairo_surface_flush(cairo_get_target(cr_));
    cairo_destroy(cr_);
}

void Canvasor::SetColor(ColorRGBA const& c) {
    cairo_set_source_rgba(cr_, c.r, c.g, c.b, c.a);
}

void Canvasor::SetGradient(LinearGradient const& g) {
    cairo_pattern_t* pattern = cairo_pattern_create_linear(g.from.x, g.from.y, g.to.x, g.to.y);
    cairo_pattern_add_color_stop_rgba(pattern, 0, g.fromColor.r, g.fromColor.g, g.fromColor.b, g.fromColor.a);
    cairo_pattern_add_color_stop_rgba(pattern, 1, g.toColor.r, g.toColor.g, g.toColor.b, g.toColor.a);
    cairo_set_source(cr_, pattern);
    cairo_pattern_destroy(pattern);
}

void Canvasor::FillRect(RectF const& r, ColorRGBA const& color) {
    cairo_new_path(cr_);
    cairo_rectangle(cr_, r.left, r.top, r.width, r.height);
    Fill(color);
}

void Canvasor::FillRect(RectF const& r, LinearGradient const& gradient) {
    cairo_new_path(cr_);
    cairo_rectangle(cr_, r.left, r.top, r.width, r.height);
    Fill(gradient);
}

void Canvasor::StrokeRect(RectF const& r, Pen const& pen) {
    cairo_new_path(cr_);
    // Inside the rectangle, on the pixel grid.
    float h = pen.width / 2;
    cairo_rectangle(cr_, r.left + h, r.top + h, r.width - pen.width, r.height - pen.width);
    Stroke(pen);
}

void Canvasor::NewPath() {
    cairo_new_path(cr_);
}
void Canvasor::MoveTo(PointF p) {
    cairo_move_to(cr_, p.x, p.y);
}
void Canvasor::LineTo(PointF p) {
    cairo_line_to(cr_, p.x, p.y);
}
void Canvasor::ClosePath() {
    cairo_close_path(cr_);
}

void Canvasor::Stroke(Pen const& pen) {
    SetColor(pen.color);
    cairo_set_line_width(cr_, pen.width);
    cairo_stroke(cr_);
}

void Canvasor::Fill(ColorRGBA const& color) {
    SetColor(color);
    cairo_fill(cr_);
}

void Canvasor::Fill(LinearGradient const& gradient) {
    SetGradient(gradient);
    cairo_fill(cr_);
}

namespace {
void SelectFont(cairo_t* cr, Font const& font) {
    cairo_select_font_face(cr, font.family.c_str(), CAIRO_FONT_SLANT_NORMAL,
                           font.bold ? CAIRO_FONT_WEIGHT_BOLD : CAIRO_FONT_WEIGHT_NORMAL);
    cairo_set_font_size(cr, font.size);
}
} // namespace

void Canvasor::DrawText(std::string const& utf8, PointF p, Font const& font, ColorRGBA const& color) {
    SelectFont(cr_, font);
    cairo_font_extents_t extents;
    cairo_font_extents(cr_, &extents);
    SetColor(color);
    cairo_move_to(cr_, p.x, p.y + extents.ascent);
    cairo_show_text(cr_, utf8.c_str());
    cairo_new_path(cr_);
}

TextMetrics Canvasor::MeasureText(std::string const& utf8, Font const& font) {
    SelectFont(cr_, font);
    cairo_text_extents_t text;
    cairo_text_extents(cr_, utf8.c_str(), &text);
    cairo_font_extents_t extents;
    cairo_font_extents(cr_, &extents);
    return TextMetrics{float(text.x_advance), float(extents.height), float(extents.ascent)};
}

TextMetrics Canvasor::Measure(std::string const& utf8, Font const& font) {
    // Layout measures the same few labels (panel names) over and over, each time a frame is made;
    // a measurement costs a context and a font selection, so results are kept. The cache is
    // emptied when full rather than grown without bound by, say, names with counters in them.
    static std::unordered_map<std::string, TextMetrics> measured;
    constexpr std::size_t MaxMeasured = 4096;
    static std::string key; // reused, so that a look-up allocates nothing (UI thread only)
    key.clear();
    key += font.family;
    key += '\0';
    key.append(reinterpret_cast<char const*>(&font.size), sizeof font.size); // exact, and no formatting
    key += font.bold ? 'b' : 'r';
    key += utf8;
    if (auto found = measured.find(key); found != measured.end()) {
        return found->second;
    }
    static Image scratch(1, 1);
    Canvasor c(scratch);
    TextMetrics metrics = c.MeasureText(utf8, font);
    if (measured.size() >= MaxMeasured) {
        measured.clear();
    }
    measured.emplace(key, metrics);
    return metrics;
}

void Canvasor::DrawImage(Image const& image, RectF const& r, float opacity) {
    if (image.IsEmpty() || image.Width() == 0 || image.Height() == 0) {
        return;
    }
    cairo_save(cr_);
    cairo_translate(cr_, r.left, r.top);
    cairo_scale(cr_, r.width / image.Width(), r.height / image.Height());
    cairo_set_source_surface(cr_, image.Surface(), 0, 0);
    cairo_paint_with_alpha(cr_, opacity);
    cairo_restore(cr_);
}

void Canvasor::Save() {
    cairo_save(cr_);
}
void Canvasor::Restore() {
    cairo_restore(cr_);
}
void Canvasor::Translate(float dx, float dy) {
    cairo_translate(cr_, dx, dy);
}

void Canvasor::Rotate(float radians) {
    cairo_rotate(cr_, radians);
}

void Canvasor::ClipRect(RectF const& r) {
    cairo_new_path(cr_);
    cairo_rectangle(cr_, r.left, r.top, r.width, r.height);
    cairo_clip(cr_);
}

void Canvasor::PushOpacity() {
    cairo_push_group(cr_);
}

void Canvasor::PopOpacity(float opacity) {
    cairo_pop_group_to_source(cr_);
    cairo_paint_with_alpha(cr_, opacity);
}

} // namespace canvasor
