#pragma once

#include <cstddef>
#include <cstdint>

#include "draw/surface.hpp"

namespace quabble {

constexpr std::size_t fingerprintSize = 8;  // bytes

// A number that two different pictures hardly ever share: FNV-1a (Fowler, Noll and Vo) of 64 bits over the
// size and the pixels.
std::uint64_t fingerprintOf(const Surface& picture);

}  // namespace quabble
