#include <gtest/gtest.h>

#include <bitset>
#include <map>
#include <ranges>
#include <set>
#include <string>

#include "../support/files.hpp"
#include "base/round_half_even.hpp"
#include "colour_vision.hpp"
#include "draw/fingerprint.hpp"
#include "draw/large_picture.hpp"
#include "draw/scaling.hpp"
#include "gfx/palette.hpp"
#include "platform/places.hpp"

namespace quabble {
namespace {

constexpr double leastDifference = 12;  // of CIEDE2000
constexpr double leastLightnessStep = 8;
constexpr double leastFigureDifference = 0.25;  // of the pixels that are seen
constexpr double leastContrast = 3;

constexpr int lastBlock = 4;
constexpr int stone = 5;
constexpr int stoneLettingGo = 6;
constexpr int firstBomb = 7;
constexpr int lastBomb = 9;

constexpr std::size_t tilePixels = 28 * 28;
using TilePart = std::bitset<tilePixels>;

// Pixels of a tile that lie within a rectangle.
TilePart partWithin(const Rect& area) {
    TilePart part;
    for (std::size_t i = 0; i < tilePixels; ++i)
        part[i] = area.contains(static_cast<std::int32_t>(i % 28), static_cast<std::int32_t>(i / 28));
    return part;
}

// The iron of a bomb, within its hoop, and what is on it.
TilePart bombBall() {
    TilePart part;
    for (std::size_t i = 0; i < tilePixels; ++i) {
        const double x = static_cast<double>(i % 28) + 0.5;
        const double y = static_cast<double>(i / 28) + 0.5;
        part[i] = std::hypot(x - 12.5, y - 15.8) < 8.5;
    }
    return part;
}

// The picture sheet as it is rendered.
class Art : public ::testing::Test {
 protected:
    void SetUp() override { ASSERT_EQ(sheet_.width(), 400) << QUABBLE_SHEET; }

    static LinearColour linearOf(Colour c) { return {linear(c.red), linear(c.green), linear(c.blue)}; }

    LinearColour light(int tile, std::size_t i) const {
        const auto pixel = static_cast<std::int32_t>(i);
        return linearOf(sheet_.at(28 * tile + pixel % 28, pixel / 28));
    }

    // The pixels that the veil lets through.
    TilePart opening() const {
        TilePart part;
        for (std::size_t i = 0; i < tilePixels; ++i) {
            const auto pixel = static_cast<std::int32_t>(i);
            part[i] = sheet_.at(pixel % 28, 28 + pixel / 28) == Colour{255, 255, 255};
        }
        return part;
    }

    // The mean light of a part of a tile, of which only the pixels that are let through shine.
    LinearColour mean(int tile, const TilePart& part, const TilePart& letThrough) const {
        LinearColour sum{};
        for (std::size_t i = 0; i < tilePixels; ++i) {
            if (!part[i] || !letThrough[i])
                continue;
            const LinearColour c = light(tile, i);
            for (std::size_t channel = 0; channel < 3; ++channel)
                sum[channel] += c[channel] / static_cast<double>(part.count());
        }
        return sum;
    }

    // The pixels of a part that are nearer to its darkest than to its brightest.
    TilePart darkOf(int tile, const TilePart& part) const {
        std::map<std::size_t, double> lightness;
        for (std::size_t i = 0; i < tilePixels; ++i) {
            if (part[i])
                lightness[i] = labOf(light(tile, i))[0];
        }
        const auto [darkest, brightest] = std::ranges::minmax(lightness | std::views::values);
        TilePart pixels;
        for (const auto& [i, l] : lightness)
            pixels[i] = l < (darkest + brightest) / 2;
        return pixels;
    }

    // What there is to see on a tile beside its colour: the emblem of a block, the facets of a stone.
    TilePart figure(int tile) const { return darkOf(tile, partWithin({4, 4, 24, 24})); }

    const Surface sheet_ = readPicture(QUABBLE_SHEET);
    const TilePart whole_ = partWithin({0, 0, 28, 28});
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

// Blocks and stones differ in colour wherever they lie in the open; for the rest another figure is enough.
TEST_F(Art, TilesStayApartForEverySightBelowTheVeilToo) {
    for (const TilePart& seen : {whole_, opening()}) {
        const bool isVeiled = seen != whole_;
        for (int one = 1; one <= lastBomb; ++one) {
            for (int other = one + 1; other <= lastBomb; ++other) {
                const bool isLettingGo = one == stoneLettingGo || other == stoneLettingGo;
                if (isLettingGo && (isVeiled || one == stone))
                    continue;
                const auto figures = static_cast<double>(((figure(one) ^ figure(other)) & seen).count()) /
                                     static_cast<double>(seen.count());
                const LinearColour a = mean(one, whole_, seen);
                const LinearColour b = mean(other, whole_, seen);
                const std::string pair =
                    std::to_string(one) + " and " + std::to_string(other) + (isVeiled ? ", veiled, " : ", ");
                const bool areFiguresEnough = figures >= leastFigureDifference;
                const bool isToldByColour = !isVeiled && other <= stoneLettingGo;
                if (isToldByColour || !areFiguresEnough) {
                    for (const Sight& sight : sights)
                        EXPECT_GE(ciede2000(labOf(sight(a)), labOf(sight(b))), leastDifference)
                            << pair << sight.name << ", figures " << figures;
                }
                if (other <= stone && !areFiguresEnough) {
                    EXPECT_GE(std::abs(labOf(a)[0] - labOf(b)[0]), leastLightnessStep) << pair << "in grey";
                }
            }
        }
    }
}

TEST_F(Art, EmblemsStandOutBelowTheVeilToo) {
    for (const TilePart& seen : {whole_, opening()}) {
        for (int number = 1; number <= lastBomb; ++number) {
            if (number == stone || number == stoneLettingGo)
                continue;
            const TilePart ball = bombBall();
            const TilePart dark = number >= firstBomb ? darkOf(number, ball) : figure(number);
            const TilePart emblem = number >= firstBomb ? ball & ~dark : dark;
            const TilePart face = number >= firstBomb ? dark : partWithin({2, 2, 26, 26}) & ~dark;
            EXPECT_GE(emblem.count(), 100U) << number << ": large enough to be seen";
            EXPECT_GE(contrast(mean(number, emblem, seen), mean(number, face, seen)), leastContrast)
                << number << (seen == whole_ ? "" : ", veiled");
        }
    }
}

TEST_F(Art, BlocksStandOutFromThePanel) {
    const LinearColour panel = linearOf(sheet_.at(200, 600));
    for (int number = 1; number <= lastBlock; ++number) {
        const LinearColour body = mean(number, partWithin({2, 2, 26, 26}) & ~figure(number), whole_);
        EXPECT_GE(contrast(body, panel), leastContrast) << number << " and the panel";
        EXPECT_GE(contrast(body, mean(0, whole_, whole_)), leastContrast) << number << " and an empty cell";
    }
}

// Of its two colours one is enough anywhere, and they stand out from one another, so that the ring is seen
// whatever it lies on.
TEST_F(Art, TheRingOfThePointerStandsOutFromEverythingForEverySight) {
    const Rect cell = Rect::ofSize(10, 10, 28, 28);
    std::vector<Colour> lines;  // across the ring, from the outside
    for (const int quarters : {4, 5, 6, 7, 8, 10, 12, 16}) {
        const Scale scale = Scale::ofQuarters(quarters);
        Canvas canvas({48, 48}, scale);
        canvas.fill(canvas.bounds(), {90, 90, 90});
        paintPointerRing(canvas, cell);
        lines.clear();
        for (std::int32_t x = scale.edge(cell.left) - scale.line(); x < scale.edge(cell.left + 4);
             x += scale.line())
            lines.push_back(canvas.picture().at(x, canvas.picture().height() / 2));
        ASSERT_GE(lines.size(), 4U);
        EXPECT_EQ(lines[0], lines[3]) << quarters;
        EXPECT_EQ(lines[1], lines[2]) << quarters;
        EXPECT_NE(lines[0], lines[1]) << quarters;
    }
    std::set<std::uint32_t> beside;
    for (std::int32_t y = 0; y < sheet_.height(); ++y)
        beside.insert(sheet_.row(y).begin(), sheet_.row(y).end());
    for (int tile = 0; tile < 14; ++tile) {
        for (std::int32_t i = 0; i < 28 * 28; ++i)
            beside.insert(pixelOf(sheet_.at(28 * tile + i % 28, i / 28)) &
                          pixelOf(sheet_.at(i % 28, 28 + i / 28)));
    }
    for (const Colour plain : {palette::backgroundColour, palette::black, palette::pauseBackground})
        beside.insert(pixelOf(plain));
    for (const Sight& sight : sights) {
        const auto seen = [&](Colour colour) { return sight(linearOf(colour)); };
        const LinearColour dark = seen(lines[0]), bright = seen(lines[1]);
        EXPECT_GE(contrast(dark, bright), leastContrast) << sight.name;
        for (const std::uint32_t pixel : beside) {
            const LinearColour other = seen(colourOf(pixel));
            EXPECT_GE(std::max(contrast(dark, other), contrast(bright, other)), leastContrast)
                << sight.name << ", " << pixel;
        }
    }
}

// A pattern whose repeats are no whole number of the screen's pixels apart beats there.
TEST_F(Art, TheVeilIsAlikeAllOverAtEveryScale) {
    Surface veil(28, 28);
    veil.copy(veil.bounds(), sheet_, {0, 28});
    for (const bool isAcross : {false, true}) {
        const auto isAlike = [&](const Surface& shown, std::int32_t from, std::int32_t to) {
            for (std::int32_t i = 0; i < shown.width(); ++i) {
                if (isAcross ? shown.at(from, i) != shown.at(to, i) : shown.at(i, from) != shown.at(i, to))
                    return false;
            }
            return true;
        };
        // The border left out.
        const auto repeatsAfter = [&](const Surface& shown, std::int32_t border, std::int32_t distance) {
            std::int32_t i = border;
            while (i + distance < shown.width() - border && isAlike(shown, i, i + distance))
                ++i;
            return i + distance == shown.width() - border;
        };
        std::int32_t distance = 1;
        while (!repeatsAfter(veil, 3, distance))
            ++distance;
        EXPECT_LE(distance, 8) << "it is a pattern";
        for (const double scale : {1.25, 1.5, 1.75, 2.0, 2.25, 2.5, 2.75, 3.0}) {
            Surface shown(roundHalfEven(28 * scale), roundHalfEven(28 * scale));
            Magnifier({28, 28}, {shown.width(), shown.height()})
                .show(veil, shown.row(0).data(), 4 * std::ptrdiff_t{shown.width()});
            EXPECT_TRUE(repeatsAfter(shown, roundHalfEven(4 * scale), roundHalfEven(distance * scale)))
                << scale << (isAcross ? ", across" : ", down");
        }
    }
}

// The large version belongs to the sheet, and brought down to its size it is much the same picture.
TEST_F(Art, IsTheSameInTheLargeVersion) {
    const std::string file = bytesOf(QUABBLE_LARGE_SHEET);
    auto large = LargePicture::of(std::as_bytes(std::span(file)));
    ASSERT_TRUE(large);
    const Surface small = reduced(*large, sheet_.bounds(), Scale());
    EXPECT_FALSE(large->isDamaged());
    double difference = 0;
    for (std::int32_t i = 0; i < 400 * 838; ++i) {
        const Colour one = small.at(i % 400, i / 400), other = sheet_.at(i % 400, i / 400);
        difference += std::abs(one.red - other.red) + std::abs(one.green - other.green) +
                      std::abs(one.blue - other.blue);
    }
    EXPECT_LT(difference / (3 * 400 * 838), 1.0);
    std::uint64_t fingerprint = 0;
    for (std::size_t i = 0; i < fingerprintSize; ++i)
        fingerprint |= std::uint64_t{static_cast<unsigned char>(file[file.size() - fingerprintSize + i])}
                       << (8 * i);
    EXPECT_EQ(fingerprint, fingerprintOf(sheet_));
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
