#include "platform/surface.hpp"

#include <algorithm>
#include <cassert>

namespace quabble {

Surface::Surface(std::int32_t width, std::int32_t height)
    : width_(width),
      height_(height),
      pixels_(static_cast<std::size_t>(width) * static_cast<std::size_t>(height)) {}

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

void Surface::outline(const Rect& area, Colour colour) {
    if (area.isEmpty())
        return;
    fill({area.left, area.top, area.right, area.top + 1}, colour);
    fill({area.left, area.bottom - 1, area.right, area.bottom}, colour);
    fill({area.left, area.top, area.left + 1, area.bottom}, colour);
    fill({area.right - 1, area.top, area.right, area.bottom}, colour);
}

void Surface::copy(const Rect& area, const Surface& source, Point from) {
    combine(area, source, from, [](std::uint32_t, std::uint32_t incoming) { return incoming; });
}

void Surface::andCopy(const Rect& area, const Surface& source, Point from) {
    combine(area, source, from, [](std::uint32_t held, std::uint32_t incoming) { return held & incoming; });
}

template <typename Combine>
void Surface::combine(const Rect& area, const Surface& source, Point from, Combine combine) {
    const std::int32_t dx = area.left - from.x;
    const std::int32_t dy = area.top - from.y;
    const Rect readable{source.bounds().left + dx, source.bounds().top + dy, source.bounds().right + dx,
                        source.bounds().bottom + dy};
    const Rect clipped = area.intersection(bounds()).intersection(readable);
    if (clipped.isEmpty())
        return;
    for (std::int32_t y = clipped.top; y < clipped.bottom; ++y) {
        const auto to =
            row(y).subspan(static_cast<std::size_t>(clipped.left), static_cast<std::size_t>(clipped.width()));
        const auto line = source.row(y - dy).subspan(static_cast<std::size_t>(clipped.left - dx), to.size());
        std::transform(to.begin(), to.end(), line.begin(), to.begin(), combine);
    }
}

}  // namespace quabble
