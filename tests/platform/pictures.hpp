#pragma once

#include <algorithm>

#include "platform/surface.hpp"

namespace quabble {

inline bool same(const Surface& picture, const Surface& other) {
    bool equal = picture.bounds() == other.bounds();
    for (std::int32_t y = 0; equal && y < picture.height(); ++y)
        equal = std::ranges::equal(picture.row(y), other.row(y));
    return equal;
}

}  // namespace quabble
