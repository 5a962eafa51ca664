#include "draw/png_file.hpp"

#ifndef __clang_analyzer__  // which is to look at our own code
#define STB_IMAGE_STATIC
#define STB_IMAGE_IMPLEMENTATION
#endif
#include <stb/stb_image.h>

#include <memory>

namespace quabble {

std::optional<Surface> decodePng(std::span<const std::byte> file) {
    constexpr std::size_t largestFile = 64 << 20;  // bytes
    int width = 0;
    int height = 0;
    if (file.size() > largestFile)
        return std::nullopt;
    const std::unique_ptr<stbi_uc, void (*)(void*)> rgba(
        stbi_load_from_memory(reinterpret_cast<const stbi_uc*>(file.data()), static_cast<int>(file.size()),
                              &width, &height, nullptr, STBI_rgb_alpha),
        stbi_image_free);
    if (!rgba)
        return std::nullopt;
    Surface picture(width, height);
    const stbi_uc* from = rgba.get();
    for (std::int32_t y = 0; y < height; ++y) {
        for (std::uint32_t& pixel : picture.row(y)) {
            const auto overBlack = [&](int channel) {
                return static_cast<std::uint8_t>(from[channel] * from[3] / 255);
            };
            pixel = pixelOf({overBlack(0), overBlack(1), overBlack(2)});
            from += 4;
        }
    }
    return picture;
}

}  // namespace quabble
