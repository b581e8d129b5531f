// Colours as four floats in 0..1.
#pragma once

namespace canvasor {

struct ColorRGBA {
    float r = 0, g = 0, b = 0, a = 0;

    constexpr ColorRGBA() = default;
    constexpr ColorRGBA(float red, float green, float blue, float alpha = 1.0f)
        : r(red)
        , g(green)
        , b(blue)
        , a(alpha) {}
    // From 0..255 components.
    static constexpr ColorRGBA FromBytes(int red, int green, int blue, int alpha = 255) {
        return ColorRGBA(red / 255.0f, green / 255.0f, blue / 255.0f, alpha / 255.0f);
    }
    constexpr bool operator==(ColorRGBA const& o) const {
        return r == o.r && g == o.g && b == o.b && a == o.a;
    }
    constexpr bool operator!=(ColorRGBA const& o) const { return !(*this == o); }
};

} // namespace canvasor
