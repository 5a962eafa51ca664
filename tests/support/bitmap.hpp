#pragma once

#include <cstddef>
#include <vector>

#include "draw/surface.hpp"

namespace quabble {

// A picture as a 24-bit BMP file, whose rows lie from the bottom up and take whole groups of four bytes.
inline std::vector<std::byte> bitmapOf(const Surface& picture) {
    std::vector<std::byte> file;
    const auto add = [&file](std::uint32_t number, int bytes) {
        for (int i = 0; i < bytes; ++i)
            file.push_back(static_cast<std::byte>(number >> (8 * i)));
    };
    const auto width = static_cast<std::uint32_t>(picture.width());
    const auto height = static_cast<std::uint32_t>(picture.height());
    const std::uint32_t row = (3 * width + 3) / 4 * 4;
    add(0x4D42, 2);  // "BM"
    for (const std::uint32_t number : {54 + row * height, 0U, 54U, 40U, width, height})
        add(number, 4);
    add(1, 2);
    add(24, 2);
    for (const std::uint32_t number : {0U, row * height, 0U, 0U, 0U, 0U})
        add(number, 4);
    for (std::int32_t y = picture.height() - 1; y >= 0; --y) {
        for (const std::uint32_t pixel : picture.row(y)) {
            const Colour colour = colourOf(pixel);
            add(std::uint32_t{colour.red} << 16 | std::uint32_t{colour.green} << 8 | colour.blue, 3);
        }
        add(0, static_cast<int>(row - 3 * width));
    }
    return file;
}

}  // namespace quabble
