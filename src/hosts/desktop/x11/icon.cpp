#include "hosts/desktop/x11/icon.hpp"

#include <cstddef>

extern "C" {
extern const unsigned char quabbleIcons[];
}

namespace quabble {

std::array<Icon, 5> applicationIcons() {
    std::array<Icon, 5> icons;
    constexpr std::array<std::int32_t, 5> widths{16, 32, 48, 64, 128};
    std::size_t start = 0;
    for (std::size_t i = 0; i < icons.size(); ++i) {
        const auto width = static_cast<std::size_t>(widths[i]);
        const std::size_t bytes = 4 * width * width;
        icons[i] = {{widths[i], widths[i]}, {quabbleIcons + start, bytes}};
        start += bytes;
    }
    return icons;
}

}  // namespace quabble
