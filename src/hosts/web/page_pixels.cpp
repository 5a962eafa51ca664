#include "hosts/web/page_pixels.hpp"

#include <algorithm>
#include <vector>

#include "hosts/web/page.hpp"

namespace quabble {
namespace {

constexpr std::int32_t rowsAtOnce = 64;

// Red, green, blue and 255, the lowest byte first.
constexpr std::uint32_t pagePixel(std::uint32_t pixel) {
    return 0xFF000000U | (pixel & 0x0000FFU) << 16 | (pixel & 0x00FF00U) | pixel >> 16;
}

}  // namespace

// Some rows at a time, for a copy of all of them would take as much memory as the picture.
void showInPage(std::uint32_t window, const Surface& picture) {
    const auto width = static_cast<std::size_t>(picture.width());
    std::vector<std::uint32_t> pixels(width * rowsAtOnce);
    for (std::int32_t top = 0; top < picture.height(); top += rowsAtOnce) {
        const std::int32_t rows = std::min(rowsAtOnce, picture.height() - top);
        for (std::int32_t y = 0; y < rows; ++y)
            std::ranges::transform(picture.row(top + y), pixels.begin() + y * picture.width(), pagePixel);
        page::showRows(window, picture.width(), picture.height(), top, rows, pixels.data());
    }
}

}  // namespace quabble
