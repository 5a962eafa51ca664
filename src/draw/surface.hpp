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

// How a pixel lies in its 32 bits: as the machine shows it, so that showing a picture turns nothing over. It
// is 0x00RRGGBB, and for a page in a browser 0xFFBBGGRR.
namespace pixel_layout {
#ifdef __wasm__
constexpr int red = 0, green = 8, blue = 16;
constexpr std::uint32_t opaque = 0xFF000000;
#else
constexpr int red = 16, green = 8, blue = 0;
constexpr std::uint32_t opaque = 0;
#endif
}  // namespace pixel_layout

constexpr std::uint32_t pixelOf(Colour colour) {
    return std::uint32_t{colour.red} << pixel_layout::red |
           std::uint32_t{colour.green} << pixel_layout::green |
           std::uint32_t{colour.blue} << pixel_layout::blue | pixel_layout::opaque;
}

constexpr Colour colourOf(std::uint32_t pixel) {
    return {static_cast<std::uint8_t>(pixel >> pixel_layout::red),
            static_cast<std::uint8_t>(pixel >> pixel_layout::green),
            static_cast<std::uint8_t>(pixel >> pixel_layout::blue)};
}

// A picture in memory, 32 bits a pixel, row by row from the top. Every operation is clipped to
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

}  // namespace quabble
