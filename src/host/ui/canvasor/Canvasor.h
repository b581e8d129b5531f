// Drawing on an image: rectangles, paths stroked with a pen or filled with a colour or a linear
// gradient, text in a font, and images. Coordinates are floats in the canvas's current space, which
// Translate, clipping and opacity layers change until the matching Restore or PopOpacity.
#pragma once

#include "host/ui/UITypes.h"
#include "host/ui/canvasor/Color.h"
#include "host/ui/canvasor/Image.h"

#include <string>

typedef struct _cairo cairo_t;

namespace canvasor {

using orvui::ui::PointF;
using orvui::ui::RectF;

struct Pen {
    float width = 1.0f;
    ColorRGBA color;
};

// A linear gradient from one colour at `from` to another at `to`.
struct LinearGradient {
    PointF from;
    PointF to;
    ColorRGBA fromColor;
    ColorRGBA toColor;
};

struct Font {
    std::string family = "DejaVu Sans";
    float size = 11.0f;
    bool bold = false;
};

// The extent of a text in a font: advance width, and the height of the font's line.
struct TextMetrics {
    float width = 0;
    float height = 0;
    float ascent = 0;
};

class Canvasor {
public:
    // Draws on the image for the canvas's lifetime.
    explicit Canvasor(Image& target);
    ~Canvasor();
    Canvasor(Canvasor const&) = delete;
    Canvasor& operator=(Canvasor const&) = delete;

    void FillRect(RectF const& rect, ColorRGBA const& color);
    void FillRect(RectF const& rect, LinearGradient const& gradient);
    void StrokeRect(RectF const& rect, Pen const& pen);

    // The current path.
    void NewPath();
    void MoveTo(PointF p);
    void LineTo(PointF p);
    void ClosePath();
    void Stroke(Pen const& pen);
    void Fill(ColorRGBA const& color);
    void Fill(LinearGradient const& gradient);

    // Text with its top-left corner at p (UTF-8).
    void DrawText(std::string const& utf8, PointF p, Font const& font, ColorRGBA const& color);
    TextMetrics MeasureText(std::string const& utf8, Font const& font);
    // Measures without a canvas at hand (layout code).
    static TextMetrics Measure(std::string const& utf8, Font const& font);

    // An image scaled into a rectangle, at an opacity.
    void DrawImage(Image const& image, RectF const& rect, float opacity = 1.0f);

    // The drawing state: Save and Restore pair up, as do PushOpacity and PopOpacity.
    void Save();
    void Restore();
    void Translate(float dx, float dy);
    // Turns the drawing space by an angle in radians (positive turns clockwise on screen).
    void Rotate(float radians);
    void ClipRect(RectF const& rect);
    // Drawing up to the matching PopOpacity is blended in at this opacity.
    void PushOpacity();
    void PopOpacity(float opacity);

    cairo_t* Context() const { return cr_; }

private:
    void SetColor(ColorRGBA const& color);
    void SetGradient(LinearGradient const& gradient);

    cairo_t* cr_;
};

} // namespace canvasor
