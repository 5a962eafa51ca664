#include "draw/bitmap_file.hpp"

#include <cstdint>

namespace quabble {
namespace {

constexpr std::size_t fileHeaderSize = 14;
constexpr std::size_t smallestInfoHeader = 40;
constexpr std::int32_t largestEdge = 4096;

// Reads little-endian numbers; the caller has checked that they lie within the bytes.
std::uint32_t read32(std::span<const std::byte> bytes, std::size_t at) {
    std::uint32_t value = 0;
    for (std::size_t i = 0; i < 4; ++i)
        value |= std::to_integer<std::uint32_t>(bytes[at + i]) << (8 * i);
    return value;
}

std::uint32_t read16(std::span<const std::byte> bytes, std::size_t at) {
    return std::to_integer<std::uint32_t>(bytes[at]) | std::to_integer<std::uint32_t>(bytes[at + 1]) << 8;
}

struct BitmapLayout {
    std::int32_t width = 0;
    std::int32_t height = 0;
    bool topDown = false;
    std::size_t pixelsAt = 0;
    std::size_t stride = 0;  // bytes a row, padded to a multiple of four
};

std::optional<BitmapLayout> readLayout(std::span<const std::byte> file) {
    if (file.size() < fileHeaderSize + smallestInfoHeader || file[0] != std::byte{'B'} ||
        file[1] != std::byte{'M'})
        return std::nullopt;
    const auto width = static_cast<std::int32_t>(read32(file, 18));
    const auto height = static_cast<std::int32_t>(read32(file, 22));
    const bool uncompressed24 = read16(file, 28) == 24 && read32(file, 30) == 0;
    if (read32(file, 14) < smallestInfoHeader || !uncompressed24 || width < 1 || width > largestEdge ||
        height == 0 || height > largestEdge || height < -largestEdge)
        return std::nullopt;
    BitmapLayout layout;
    layout.width = width;
    layout.height = height < 0 ? -height : height;
    layout.topDown = height < 0;
    layout.pixelsAt = read32(file, 10);
    layout.stride = (static_cast<std::size_t>(width) * 3 + 3) / 4 * 4;
    const std::size_t needed = layout.stride * static_cast<std::size_t>(layout.height);
    if (layout.pixelsAt < fileHeaderSize + smallestInfoHeader || layout.pixelsAt > file.size() ||
        file.size() - layout.pixelsAt < needed)
        return std::nullopt;
    return layout;
}

}  // namespace

std::optional<Surface> decodeBitmap(std::span<const std::byte> file) {
    const auto layout = readLayout(file);
    if (!layout)
        return std::nullopt;
    Surface picture(layout->width, layout->height);
    for (std::int32_t y = 0; y < layout->height; ++y) {
        const auto stored = static_cast<std::size_t>(layout->topDown ? y : layout->height - 1 - y);
        const std::byte* from = file.data() + layout->pixelsAt + stored * layout->stride;
        for (std::uint32_t& pixel : picture.row(y)) {
            pixel = pixelOf({std::to_integer<std::uint8_t>(from[2]), std::to_integer<std::uint8_t>(from[1]),
                             std::to_integer<std::uint8_t>(from[0])});
            from += 3;
        }
    }
    return picture;
}

std::vector<std::byte> encodeBitmap(const Surface& picture) {
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
