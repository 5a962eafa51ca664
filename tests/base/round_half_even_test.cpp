#include "base/round_half_even.hpp"

#include <gtest/gtest.h>

#include <cmath>

namespace quabble {
namespace {

TEST(RoundHalfEven, GoesToTheNearestAndAHalfToTheEvenNeighbour) {
    for (const auto& [value, rounded] : {std::pair{0.0, 0},
                                         {0.5, 0},
                                         {1.5, 2},
                                         {2.5, 2},
                                         {4.5, 4},
                                         {5.5, 6},
                                         {2.49, 2},
                                         {2.51, 3},
                                         {-0.5, 0},
                                         {-1.5, -2},
                                         {-2.5, -2},
                                         {-2.49, -2},
                                         {-2.51, -3},
                                         {std::nextafter(0.5, 0.0), 0},
                                         {std::nextafter(0.5, 1.0), 1},
                                         {2147483646.5, 2147483646},
                                         {-2147483648.0, -2147483647 - 1}}) {
        EXPECT_EQ(roundHalfEven(value), rounded) << value;
    }
}

}  // namespace
}  // namespace quabble
