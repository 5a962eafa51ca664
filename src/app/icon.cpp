#include "app/icon.hpp"

#include <cstddef>

extern "C" {
extern const unsigned char quabbleIcon[];  // icon_pixels.S
}

namespace quabble {

Icon applicationIcon() {
    constexpr Size size{64, 64};
    constexpr std::size_t bytes = std::size_t{4} * size.width * size.height;
    return {size, {quabbleIcon, bytes}};
}

}  // namespace quabble
