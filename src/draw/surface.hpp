#pragma once

#include <cstddef>
#include <cstdint>
#include <span>
#include <vector>

#include "base/cleared_memory.hpp"
#include "draw/geometry.hpp"

namespace quabble {

struct Colour {
    std::uint8_t red = 0;
    std::uint8_t green = 0;
    std::uint8_t blue = 0;
    friend bool operator==(const Colour&, const Colour&) = default;
};

// A picture in memory, 32 bits a pixel as 0x00RRGGBB, row by row from the top. Every operation is clipped to
// the surface, and copies to the source as well, so no rectangle is ever wrong.
class Surface {
 public:
    Surface() = default;
    Surface(std::int32_t width, std::int32_t height);  // black

    std::int32_t width() const { return width_; }
    std::int32_t height() const { return height_; }
    Rect bounds() const { return {0, 0, width_, height_}; }
    bool isEmpty() const { return pixels_.empty(); }

    // The pixel must lie within the surface.
    Colour at(std::int32_t x, std::int32_t y) const;
    std::span<const std::uint32_t> row(std::int32_t y) const;
    std::span<std::uint32_t> row(std::int32_t y);

    void fill(const Rect& area, Colour colour);

    // Copies the source's pixels from `from` on into the area; `andCopy` combines them with what is there by
    // a bitwise AND. A line must not be copied over itself.
    void copy(const Rect& area, const Surface& source, Point from);
    void andCopy(const Rect& area, const Surface& source, Point from);

    friend bool operator==(const Surface&, const Surface&) = default;

 private:
    std::size_t index(std::int32_t x, std::int32_t y) const {
        return static_cast<std::size_t>(y) * static_cast<std::size_t>(width_) + static_cast<std::size_t>(x);
    }
    template <typename CombineLine>
    void combine(const Rect& area, const Surface& source, Point origin, CombineLine combineLine);

    std::int32_t width_ = 0;
    std::int32_t height_ = 0;
    std::vector<std::uint32_t, ClearedMemory<std::uint32_t>> pixels_;
};

constexpr std::uint32_t pixelOf(Colour colour) {
    return (std::uint32_t{colour.red} << 16) | (std::uint32_t{colour.green} << 8) | colour.blue;
}

constexpr Colour colourOf(std::uint32_t pixel) {
    return {static_cast<std::uint8_t>(pixel >> 16), static_cast<std::uint8_t>(pixel >> 8),
            static_cast<std::uint8_t>(pixel)};
}

}  // namespace quabble
