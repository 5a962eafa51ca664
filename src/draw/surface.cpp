#include "draw/surface.hpp"

#include <algorithm>
#include <cassert>
#include <cstring>
#include <functional>

namespace quabble {
namespace {

// Most lines are a tile wide, and calling a library function costs as much as copying one: a length that the
// compiler knows is copied in registers.
void copyLine(const std::uint32_t* from, std::size_t width, std::uint32_t* to) {
    constexpr std::size_t piece = 28;
    for (; width >= piece; width -= piece, from += piece, to += piece)
        std::memcpy(to, from, piece * sizeof *to);
    if (width > 0)
        std::memcpy(to, from, width * sizeof *to);
}

}  // namespace

Surface::Surface(std::int32_t width, std::int32_t height)
    : width_(width),
      height_(height),
      pixels_(static_cast<std::size_t>(width) * static_cast<std::size_t>(height)) {
    if constexpr (pixelOf({}) != 0)
        std::ranges::fill(pixels_, pixelOf({}));
}

Colour Surface::at(std::int32_t x, std::int32_t y) const {
    assert(bounds().contains(x, y));
    return colourOf(row(y)[static_cast<std::size_t>(x)]);
}

std::span<const std::uint32_t> Surface::row(std::int32_t y) const {
    assert(y >= 0 && y < height_);
    const auto width = static_cast<std::size_t>(width_);
    return std::span(pixels_).subspan(static_cast<std::size_t>(y) * width, width);
}

std::span<std::uint32_t> Surface::row(std::int32_t y) {
    assert(y >= 0 && y < height_);
    const auto width = static_cast<std::size_t>(width_);
    return std::span(pixels_).subspan(static_cast<std::size_t>(y) * width, width);
}

void Surface::fill(const Rect& area, Colour colour) {
    const Rect clipped = area.intersection(bounds());
    if (clipped.isEmpty())
        return;
    for (std::int32_t y = clipped.top; y < clipped.bottom; ++y) {
        const auto line = row(y);
        std::fill(line.begin() + clipped.left, line.begin() + clipped.right, pixelOf(colour));
    }
}

void Surface::copy(const Rect& area, const Surface& source, Point from) {
    combine(area, source, from, [](const std::uint32_t* line, std::size_t width, std::uint32_t* to) {
        copyLine(line, width, to);
    });
}

void Surface::andCopy(const Rect& area, const Surface& source, Point from) {
    combine(area, source, from, [](const std::uint32_t* line, std::size_t width, std::uint32_t* to) {
        std::transform(to, to + width, line, to, std::bit_and());
    });
}

template <typename CombineLine>
void Surface::combine(const Rect& area, const Surface& source, Point origin, CombineLine combineLine) {
    const std::int32_t dx = area.left - origin.x;
    const std::int32_t dy = area.top - origin.y;
    const Rect readable{source.bounds().left + dx, source.bounds().top + dy, source.bounds().right + dx,
                        source.bounds().bottom + dy};
    const Rect clipped = area.intersection(bounds()).intersection(readable);
    if (clipped.isEmpty())
        return;
    const auto width = static_cast<std::size_t>(clipped.width());
    const std::size_t sourceStride = source.index(0, 1);
    const std::size_t stride = index(0, 1);
    const std::uint32_t* from = source.pixels_.data() + source.index(clipped.left - dx, clipped.top - dy);
    std::uint32_t* to = pixels_.data() + index(clipped.left, clipped.top);
    for (std::size_t line = 0; line < static_cast<std::size_t>(clipped.height()); ++line)
        combineLine(from + line * sourceStride, width, to + line * stride);
}

}  // namespace quabble
