#pragma once

#include <cstdint>

namespace quabble {

// Rounds to the nearest integer, a half to the even neighbour: 4.5 gives 4, 5.5 gives 6, -0.5 gives 0.
// The value must lie within the range of a 32-bit signed integer. It does not depend on the
// floating-point rounding mode. Whatever the game computes, measures and places is rounded so; the front ends
// and the glyphs have to tell which pixel a point lies in, and take the floor.
std::int32_t roundHalfEven(double value);

}  // namespace quabble
