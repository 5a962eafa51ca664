#include "draw/png_file.hpp"

#ifndef __clang_analyzer__  // which is to look at our own code
#define STB_IMAGE_STATIC
#define STB_IMAGE_IMPLEMENTATION
#endif
#include <stb/stb_image.h>

#include <cstring>
#include <memory>

namespace quabble {
namespace {

// Whether the file has all of the pieces that it is made of, each as long as it says: the decoder makes room
// for a piece before it looks. A piece is its length, four bytes with the highest first, a name, its content
// and a checksum.
bool hasWholePieces(std::span<const std::byte> file) {
    constexpr std::size_t signature = 8;
    constexpr std::size_t around = 12;
    constexpr std::size_t nameAt = 4;
    if (file.size() < signature)
        return false;
    file = file.subspan(signature);
    while (file.size() >= around) {
        std::size_t length = 0;
        for (const std::byte byte : file.first(nameAt))
            length = length << 8 | std::to_integer<std::size_t>(byte);
        if (file.size() - around < length)
            return false;
        if (std::memcmp(file.data() + nameAt, "IEND", 4) == 0)
            return true;
        file = file.subspan(around + length);
    }
    return false;
}

}  // namespace

std::optional<Surface> decodePng(std::span<const std::byte> file) {
    constexpr std::size_t largestFile = 64 << 20;  // bytes
    int width = 0;
    int height = 0;
    if (file.size() > largestFile || !hasWholePieces(file))
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
