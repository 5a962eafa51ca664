#pragma once

#include <cstdint>

namespace quabble {

// Rounds to the nearest integer, a half to the even neighbour: 4.5 gives 4, 5.5 gives 6, -0.5 gives 0.
// The value must lie within the range of a 32-bit signed integer. It does not depend on the
// floating-point rounding mode. This is the only way a fraction becomes an integer in this program.
std::int32_t roundHalfEven(double value);

}  // namespace quabble
