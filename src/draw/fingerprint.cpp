#include "draw/fingerprint.hpp"

namespace quabble {

std::uint64_t fingerprintOf(const Surface& picture) {
    std::uint64_t hash = 0xCBF29CE484222325;
    const auto add = [&hash](std::uint32_t number) { hash = (hash ^ number) * 0x100000001B3; };
    add(static_cast<std::uint32_t>(picture.width()));
    for (std::int32_t y = 0; y < picture.height(); ++y) {
        for (const std::uint32_t pixel : picture.row(y)) {
            const Colour colour = colourOf(pixel);
            add(std::uint32_t{colour.red} << 16 | std::uint32_t{colour.green} << 8 | colour.blue);
        }
    }
    return hash;
}

}  // namespace quabble
