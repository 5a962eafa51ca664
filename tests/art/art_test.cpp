#include <gtest/gtest.h>

#include <bitset>
#include <functional>
#include <map>
#include <ranges>

#include "colour_vision.hpp"
#include "platform/bitmap_file.hpp"

namespace quabble {
namespace {

constexpr double leastDifference = 12;  // of CIEDE2000
constexpr double leastLightnessStep = 8;
constexpr double leastEmblemDifference = 0.25;  // of a tile's pixels
constexpr double leastContrast = 3;

constexpr Rect tile(int number) {
    return Rect::ofSize(28 * number, 0, 28, 28);
}

// The picture sheet as it is rendered.
class Art : public ::testing::Test {
 protected:
    void SetUp() override { ASSERT_EQ(sheet_.width(), 400) << QUABBLE_SHEET; }

    static LinearColour linearOf(Colour c) { return {linear(c.red), linear(c.green), linear(c.blue)}; }

    // The mean light of an area's pixels that are wanted.
    LinearColour mean(
        const Rect& area, const std::function<bool(int)>& isWanted = [](int) { return true; }) const {
        LinearColour sum{};
        int count = 0;
        for (int i = 0; i < area.width() * area.height(); ++i) {
            if (!isWanted(i))
                continue;
            const LinearColour c =
                linearOf(sheet_.at(area.left + i % area.width(), area.top + i / area.width()));
            for (std::size_t channel = 0; channel < 3; ++channel)
                sum[channel] += c[channel];
            ++count;
        }
        for (double& channel : sum)
            channel /= count;
        return sum;
    }

    // The pixels of a tile that are nearer to its darkest than to its brightest, but for the rim of 4.
    std::bitset<784> emblem(int number) const {
        std::map<std::size_t, double> lightness;
        for (int i = 0; i < 784; ++i) {
            if (Rect::ofSize(4, 4, 20, 20).contains(i % 28, i / 28))
                lightness[static_cast<std::size_t>(i)] =
                    labOf(linearOf(sheet_.at(28 * number + i % 28, i / 28)))[0];
        }
        const auto [darkest, brightest] = std::ranges::minmax(lightness | std::views::values);
        std::bitset<784> pixels;
        for (const auto& [i, l] : lightness)
            pixels[i] = l < (darkest + brightest) / 2;
        return pixels;
    }

    const Surface sheet_ = loadBitmap(QUABBLE_SHEET).value_or(Surface());
};

TEST(ColourDifference, IsThatOfThePublishedPairs) {
    struct Pair {
        Lab one, other;
        double difference;
    };
    for (const Pair& p : {Pair{{50, 2.6772, -79.7751}, {50, 0, -82.7485}, 2.0425},
                          {{50, -1, 2}, {50, 0, 0}, 2.3669},
                          {{50, 2.5, 0}, {50, 0, -2.5}, 4.3065},
                          {{50, 2.5, 0}, {73, 25, -18}, 27.1492},
                          {{60.2574, -34.0099, 36.2677}, {60.4626, -34.1751, 39.4387}, 1.2644},
                          {{22.7233, 20.0904, -46.6940}, {23.0331, 14.9730, -42.5619}, 2.0373},
                          {{2.0776, 0.0795, -1.1350}, {0.9033, -0.0636, -0.5514}, 0.9082}})
        EXPECT_NEAR(ciede2000(p.one, p.other), p.difference, 0.0001);
}

TEST_F(Art, BlocksStayApartForEverySight) {
    for (int one = 1; one <= 4; ++one) {
        for (int other = one + 1; other <= 4; ++other) {
            const LinearColour a = mean(tile(one));
            const LinearColour b = mean(tile(other));
            for (const Sight& sight : sights)
                EXPECT_GE(ciede2000(labOf(sight(a)), labOf(sight(b))), leastDifference)
                    << one << " and " << other << ", " << sight.name;
            const double step = std::abs(labOf(a)[0] - labOf(b)[0]);
            const double emblems = static_cast<double>((emblem(one) ^ emblem(other)).count()) / 784;
            EXPECT_TRUE(step >= leastLightnessStep || emblems >= leastEmblemDifference)
                << one << " and " << other << " in grey: " << step << ", " << emblems;
        }
    }
}

TEST_F(Art, EmblemsStandOutFromBlocksAndBlocksFromThePanel) {
    const Rect panel = Rect::ofSize(40, 380, 320, 440);
    for (int number = 1; number <= 4; ++number) {
        const std::bitset<784> emblemPixels = emblem(number);
        EXPECT_GE(emblemPixels.count(), 100U) << number << ": large enough to be seen";
        const auto isEmblem = [&](int i) { return emblemPixels[static_cast<std::size_t>(i)]; };
        const auto isBody = [&](int i) {
            return !isEmblem(i) && Rect::ofSize(2, 2, 24, 24).contains(i % 28, i / 28);
        };
        const LinearColour body = mean(tile(number), isBody);
        EXPECT_GE(contrast(mean(tile(number), isEmblem), body), leastContrast) << number;
        EXPECT_GE(contrast(body, mean(panel)), leastContrast) << number << " and the panel";
        EXPECT_GE(contrast(body, mean(tile(0))), leastContrast) << number << " and an empty cell";
    }
}

// The strip of the waiting row hangs out of the window's blue, below the panel's last row of pixels.
TEST_F(Art, ThePanelIsClosedAboveTheStrip) {
    const Colour windowBlue{62, 105, 214};
    for (std::int32_t x = 0; x < 400; ++x) {
        for (std::int32_t y = 494; y < 500; ++y)
            EXPECT_EQ(sheet_.at(x, 338 + y), windowBlue) << x << ", " << y;
    }
}

}  // namespace
}  // namespace quabble
