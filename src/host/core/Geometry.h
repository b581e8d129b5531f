// Points and rectangles over any arithmetic type: signed 32-bit integers for the layout engine and
// the workspace, floats for the toolkit's node coordinates.
#pragma once

#include <algorithm>
#include <cstdint>
#include <limits>
#include <type_traits>

namespace orvcore::geom {

namespace detail {
// Integer sums and differences saturate at the type's limits: rectangles read from a damaged
// document may hold extreme values, and an overflow there must not become undefined behaviour.
template <typename T> constexpr T Clamp(long long v) {
    return v < static_cast<long long>(std::numeric_limits<T>::lowest()) ? std::numeric_limits<T>::lowest()
           : v > static_cast<long long>(std::numeric_limits<T>::max())  ? std::numeric_limits<T>::max()
                                                                        : static_cast<T>(v);
}
template <typename T> constexpr T Add(T a, T b) {
    if constexpr (std::is_integral_v<T>) {
        return Clamp<T>(static_cast<long long>(a) + static_cast<long long>(b));
    } else {
        return a + b;
    }
}
template <typename T> constexpr T Sub(T a, T b) {
    if constexpr (std::is_integral_v<T>) {
        return Clamp<T>(static_cast<long long>(a) - static_cast<long long>(b));
    } else {
        return a - b;
    }
}
} // namespace detail

// A position, or a size when x is read as the width and y as the height.
template <typename T> struct PointT {
    T x{};
    T y{};

    constexpr PointT() = default;
    constexpr PointT(T px, T py)
        : x(px)
        , y(py) {}

    constexpr PointT operator+(PointT const& o) const { return {detail::Add(x, o.x), detail::Add(y, o.y)}; }
    constexpr PointT operator-(PointT const& o) const { return {detail::Sub(x, o.x), detail::Sub(y, o.y)}; }
    constexpr bool operator==(PointT const& o) const { return x == o.x && y == o.y; }
    constexpr bool operator!=(PointT const& o) const { return !(*this == o); }
};

// A rectangle as left, top, width and height; the right edge is left + width and the bottom edge
// top + height, so a rectangle contains the points with left <= x < right and top <= y < bottom.
// Integer arithmetic saturates rather than overflows.
template <typename T> struct RectT {
    T left{};
    T top{};
    T width{};
    T height{};

    constexpr RectT() = default;
    constexpr RectT(T l, T t, T w, T h)
        : left(l)
        , top(t)
        , width(w)
        , height(h) {}

    // Builds a rectangle from its edges; the edges may come in any order.
    static constexpr RectT FromEdges(T l, T t, T r, T b) {
        return RectT(std::min(l, r), std::min(t, b), detail::Sub(std::max(l, r), std::min(l, r)),
                     detail::Sub(std::max(t, b), std::min(t, b)));
    }

    constexpr T Right() const { return detail::Add(left, width); }
    constexpr T Bottom() const { return detail::Add(top, height); }
    constexpr PointT<T> TopLeft() const { return {left, top}; }
    constexpr PointT<T> Size() const { return {width, height}; }
    constexpr bool IsEmpty() const { return width <= T(0) || height <= T(0); }

    constexpr bool Contains(PointT<T> const& p) const {
        return p.x >= left && p.x < Right() && p.y >= top && p.y < Bottom();
    }
    constexpr bool Contains(RectT const& r) const {
        return r.left >= left && r.top >= top && r.Right() <= Right() && r.Bottom() <= Bottom();
    }
    constexpr bool Intersects(RectT const& r) const { return !Intersection(r).IsEmpty(); }

    // The common part of two rectangles; an empty rectangle (all zero) when they do not overlap.
    constexpr RectT Intersection(RectT const& r) const {
        T l = std::max(left, r.left), t = std::max(top, r.top);
        T rr = std::min(Right(), r.Right()), b = std::min(Bottom(), r.Bottom());
        if (rr <= l || b <= t) {
            return RectT();
        }
        return RectT(l, t, detail::Sub(rr, l), detail::Sub(b, t));
    }

    // The smallest rectangle holding both; an empty operand does not count.
    constexpr RectT Union(RectT const& r) const {
        if (r.IsEmpty()) {
            return *this;
        }
        if (IsEmpty()) {
            return r;
        }
        return FromEdges(std::min(left, r.left), std::min(top, r.top), std::max(Right(), r.Right()),
                         std::max(Bottom(), r.Bottom()));
    }

    constexpr RectT Offset(T dx, T dy) const {
        return RectT(detail::Add(left, dx), detail::Add(top, dy), width, height);
    }
    // Moves every edge inwards by the given amounts (outwards when negative).
    constexpr RectT Inset(T dx, T dy) const {
        return RectT(detail::Add(left, dx), detail::Add(top, dy), detail::Sub(detail::Sub(width, dx), dx),
                     detail::Sub(detail::Sub(height, dy), dy));
    }

    constexpr bool operator==(RectT const& o) const {
        return left == o.left && top == o.top && width == o.width && height == o.height;
    }
    constexpr bool operator!=(RectT const& o) const { return !(*this == o); }
};

using Point = PointT<std::int32_t>;
using Rect = RectT<std::int32_t>;
using PointF = PointT<float>;
using RectF = RectT<float>;

} // namespace orvcore::geom
