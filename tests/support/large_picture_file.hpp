#pragma once

#include <stb/stb_image_write.h>

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <vector>

#include "draw/fingerprint.hpp"
#include "draw/large_picture.hpp"

namespace quabble {

// The file of a large version, drawn `factor` times as large, of a plain picture.
inline std::vector<std::byte> largePictureFile(const Surface& large, std::int32_t factor,
                                               const Surface& plain) {
    std::vector<std::byte> file;
    const auto put = [&](std::uint64_t number, std::size_t bytes) {
        for (std::size_t i = 0; i < bytes; ++i)
            file.push_back(static_cast<std::byte>(number >> (8 * i)));
    };
    for (const std::int32_t number : {factor, plain.width(), plain.height()})
        put(static_cast<std::uint64_t>(number), 4);
    const std::int32_t bandHeight = LargePicture::bandHeight * factor;
    for (std::int32_t top = 0; top < large.height(); top += bandHeight) {
        const std::int32_t bottom = std::min(top + bandHeight, large.height());
        std::vector<std::uint8_t> rgb;
        for (std::int32_t y = top; y < bottom; ++y) {
            for (const std::uint32_t pixel : large.row(y)) {
                const Colour colour = colourOf(pixel);
                rgb.insert(rgb.end(), {colour.red, colour.green, colour.blue});
            }
        }
        std::vector<std::byte> band;
        const auto append = [](void* to, void* bytes, int size) {
            const auto* from = static_cast<const std::byte*>(bytes);
            static_cast<std::vector<std::byte>*>(to)->insert(static_cast<std::vector<std::byte>*>(to)->end(),
                                                             from, from + size);
        };
        stbi_write_png_to_func(append, &band, large.width(), bottom - top, 3, rgb.data(), 0);
        put(band.size(), 4);
        file.insert(file.end(), band.begin(), band.end());
    }
    put(fingerprintOf(plain), fingerprintSize);
    return file;
}

}  // namespace quabble
