#pragma once

#include <algorithm>
#include <cstdint>

namespace quabble {

struct Point {
    std::int32_t x = 0;
    std::int32_t y = 0;
    friend bool operator==(const Point&, const Point&) = default;
};

struct Size {
    std::int32_t width = 0;
    std::int32_t height = 0;
    friend bool operator==(const Size&, const Size&) = default;
};

// A rectangle of pixels: it holds its left and top edges, not its right and bottom ones. One whose right edge
// is not right of its left one, or whose bottom is not below its top, is empty.
struct Rect {
    std::int32_t left = 0;
    std::int32_t top = 0;
    std::int32_t right = 0;
    std::int32_t bottom = 0;

    static constexpr Rect ofSize(std::int32_t left, std::int32_t top, std::int32_t width,
                                 std::int32_t height) {
        return {left, top, left + width, top + height};
    }

    constexpr std::int32_t width() const { return right - left; }
    constexpr std::int32_t height() const { return bottom - top; }
    constexpr bool isEmpty() const { return right <= left || bottom <= top; }
    constexpr bool contains(std::int32_t x, std::int32_t y) const {
        return x >= left && x < right && y >= top && y < bottom;
    }
    constexpr Rect intersection(const Rect& other) const {
        return {std::max(left, other.left), std::max(top, other.top), std::min(right, other.right),
                std::min(bottom, other.bottom)};
    }
    constexpr bool intersects(const Rect& other) const { return !intersection(other).isEmpty(); }
    constexpr Rect shrunkBy(std::int32_t margin) const {
        return {left + margin, top + margin, right - margin, bottom - margin};
    }
    friend bool operator==(const Rect&, const Rect&) = default;
};

}  // namespace quabble
