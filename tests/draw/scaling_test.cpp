#include "draw/scaling.hpp"

#include <gtest/gtest.h>

#include "draw/canvas.hpp"

namespace quabble {
namespace {

constexpr Size mainWindow{675, 562};
constexpr Size large{5000, 5000};

TEST(Scale, FollowsTheDotsPerInchAsFarAsTheWindowFits) {
    struct Case {
        double dotsPerInch;
        Size available;
        double expected;
    };
    for (const Case& c :
         {Case{96, large, 1}, Case{144, large, 1.5}, Case{192, large, 2}, Case{120, large, 1.25},
          Case{100, large, 1}, Case{72, large, 1}, Case{192, {1350, 1124}, 2}, Case{192, {1349, 1124}, 1.75},
          Case{288, {1920, 1050}, 1.75}, Case{192, {700, 600}, 1}, Case{96, {5000, 281}, 0.5},
          Case{96, {0, 0}, 1}})
        EXPECT_EQ(scaleFor(c.dotsPerInch, mainWindow, c.available), c.expected) << c.dotsPerInch;
    EXPECT_EQ(scaled({675, 30}, 1.5), (Size{1012, 45}));
}

TEST(Scale, PutsEveryDevicePixelIntoTheProgramsPixelThatIsSeenThere) {
    for (int quarters = 4; quarters <= 16; ++quarters) {
        const Scale scale = Scale::ofQuarters(quarters);
        for (std::int32_t device = -40; device < 3000; ++device) {
            const std::int32_t pixel = scale.pixelAt({device, 0}).x;
            EXPECT_LE(scale.edge(pixel), device) << quarters;
            EXPECT_LT(device, scale.edge(pixel + 1)) << quarters;
        }
        EXPECT_EQ(scale.edge(232 + 28) - scale.edge(232), 7 * quarters) << "a tile";
        EXPECT_EQ(scale.edge(37 + 28) - scale.edge(37), 7 * quarters) << "another one";
        EXPECT_EQ(Scale::nearest(quarters / 4.0 + 0.1), scale);
    }
    EXPECT_EQ(Scale::ofQuarters(6).line(), 2);
    EXPECT_EQ(Scale::ofQuarters(5).line(), 1);
    EXPECT_EQ(Scale::nearest(0.5), Scale());
    EXPECT_EQ(Scale::nearest(9), Scale::ofQuarters(16));
}

TEST(Canvas, DrawsFramesALineThickWithoutAGap) {
    for (int quarters = 4; quarters <= 16; ++quarters) {
        const Scale scale = Scale::ofQuarters(quarters);
        Canvas canvas({40, 30}, scale);
        const Rect area{7, 5, 31, 22};
        for (const std::int32_t inside : {-2, -1, 0, 1})
            canvas.outline(area, {255, 255, 255}, inside);
        const Rect outer = scale.device(area).shrunkBy(-2 * scale.line());
        const Rect inner = outer.shrunkBy(4 * scale.line());
        for (std::int32_t y = 0; y < canvas.picture().height(); ++y) {
            for (std::int32_t x = 0; x < canvas.picture().width(); ++x) {
                EXPECT_EQ(canvas.picture().at(x, y).red == 255, outer.contains(x, y) && !inner.contains(x, y))
                    << quarters << ": " << x << "," << y;
            }
        }
    }
}

TEST(Reduced, IsTheMeanOfWhatAPixelCovers) {
    Surface drawing(8, 4);  // of 2 x 1 pixels: the left one is dark, the right one bright
    drawing.fill({4, 0, 8, 4}, {200, 100, 40});
    const Surface plain = reduced(drawing, 4, Scale());
    EXPECT_EQ(plain.at(0, 0), (Colour{0, 0, 0}));
    EXPECT_EQ(plain.at(1, 0), (Colour{200, 100, 40}));
    const Surface half = reduced(drawing, 4, Scale::ofQuarters(6));
    ASSERT_EQ(half.bounds(), (Rect{0, 0, 3, 2}));
    EXPECT_EQ(half.at(0, 0), (Colour{0, 0, 0}));
    EXPECT_EQ(half.at(1, 0), (Colour{100, 50, 20})) << "half of each";
    EXPECT_EQ(half.at(2, 1), (Colour{200, 100, 40})) << "what is beyond the edge does not count";
}

TEST(Magnifier, RepeatsPixelsAtWholeScalesAndMixesNeighboursAtOthers) {
    Surface picture(7, 5);  // its red tells the column and its blue the row
    for (std::int32_t i = 0; i < 35; ++i)
        picture.row(i / 7)[static_cast<std::size_t>(i % 7)] =
            pixelOf({static_cast<std::uint8_t>(i % 7), 0, static_cast<std::uint8_t>(i / 7)});
    for (const Size& shown : {Size{7, 5}, {14, 10}, {21, 15}, {9, 6}, {10, 8}, {4, 3}}) {
        Surface screen(shown.width + 1, shown.height);
        screen.fill(screen.bounds(), {1, 2, 3});
        Magnifier({7, 5}, shown).show(picture, screen.row(0).data(), (shown.width + 1) * 4);
        const bool isWhole = shown.width % 7 == 0;
        for (std::int32_t y = 0; y < shown.height; ++y) {
            EXPECT_EQ(screen.at(shown.width, y), (Colour{1, 2, 3})) << "beyond the row";
            for (std::int32_t x = 0; x < shown.width; ++x) {
                const Colour seen = screen.at(x, y);
                const Point from = pixelSeenAt({x, y}, shown, {7, 5});
                const int tolerance = isWhole ? 0 : 1;
                EXPECT_LE(std::abs(seen.red - from.x), tolerance) << x << " of " << shown.width;
                EXPECT_LE(std::abs(seen.blue - from.y), tolerance) << y << " of " << shown.height;
            }
        }
    }
}

// What the pointer is on is what is seen there: of each pixel between black and white that one whose colour
// the shown pixel is closer to.
TEST(Magnifier, AClickIsOnThePixelThatIsSeen) {
    const Size picture = mainWindow;
    const std::int32_t across[] = {0, 231, 232, 233, 259, 260, 567, 568, 674, 20, 169, 170, 279, 280, 394};
    const std::int32_t down[] = {0, 30, 31, 32, 58, 59, 478, 479, 503, 504, 531, 532, 561, 52, 82, 83};
    for (const double scale : {1.0, 1.25, 1.5, 2.0, 3.0}) {
        const Size shown = scaled(picture, scale);
        Magnifier magnifier(picture, shown);
        Surface screen(shown.width, shown.height);
        const auto check = [&](bool isColumn, std::int32_t edge) {
            Surface drawn(picture.width, picture.height);
            drawn.fill(
                isColumn ? Rect::ofSize(edge, 0, 1, picture.height) : Rect::ofSize(0, edge, picture.width, 1),
                {255, 255, 255});
            magnifier.show(drawn, screen.row(0).data(), shown.width * 4);
            int hits = 0;
            for (std::int32_t i = 0; i < (isColumn ? shown.width : shown.height); ++i) {
                const Point at = isColumn ? Point{i, 9} : Point{9, i};
                const Point pixel = pixelSeenAt(at, shown, picture);
                const bool isOnEdge = (isColumn ? pixel.x : pixel.y) == edge;
                const int brightness = screen.at(at.x, at.y).green;
                EXPECT_TRUE(isOnEdge ? brightness >= 127 : brightness <= 128)
                    << edge << " at " << scale << ", " << i << ": " << brightness;
                hits += isOnEdge ? 1 : 0;
            }
            EXPECT_TRUE(hits >= static_cast<int>(scale) && hits <= static_cast<int>(scale + 0.99)) << hits;
        };
        for (const std::int32_t edge : across)
            check(true, edge);
        for (const std::int32_t edge : down)
            check(false, edge);
        EXPECT_EQ(pixelSeenAt({-1, -1}, shown, picture), (Point{-1, -1})) << "beside the window";
    }
}

}  // namespace
}  // namespace quabble
