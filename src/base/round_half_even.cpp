#include "base/round_half_even.hpp"

#include <cassert>
#include <cmath>
#include <limits>

namespace quabble {

std::int32_t roundHalfEven(double value) {
    const double below = std::floor(value);
    const double fraction = value - below;
    const bool belowIsEven = std::fmod(below, 2.0) == 0.0;
    const bool up = fraction > 0.5 || (fraction == 0.5 && !belowIsEven);
    const double rounded = up ? below + 1.0 : below;
    assert(rounded >= std::numeric_limits<std::int32_t>::min() &&
           rounded <= std::numeric_limits<std::int32_t>::max());
    return static_cast<std::int32_t>(rounded);
}

}  // namespace quabble
