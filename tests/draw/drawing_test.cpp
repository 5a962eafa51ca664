#include <gtest/gtest.h>

#include <cmath>
#include <functional>

#include "draw/bitmap_file.hpp"
#include "draw/text.hpp"

namespace quabble {
namespace {

// A picture in digits: a pixel's value is that of its character.
Surface pixels(std::string_view digits) {
    Surface surface = digits.size() == 12 ? Surface(4, 3) : Surface(3, 2);
    for (std::int32_t y = 0; y < surface.height(); ++y)
        std::ranges::transform(
            digits.substr(static_cast<std::size_t>(y * surface.width()), surface.row(y).size()),
            surface.row(y).begin(),
            [](char digit) { return static_cast<std::uint32_t>(digit) | pixel_layout::opaque; });
    return surface;
}

TEST(Drawing, EveryOperationIsClippedToBothPictures) {
    const Surface source = pixels("123457");
    const Colour five = colourOf('5');
    const std::pair<const char*, std::function<void(Surface&)>> cases[] = {
        {"655665566666", [&](Surface& s) { s.fill({1, 0, 3, 2}, five); }},
        {"555555555555", [&](Surface& s) { s.fill({-2, -9, 9, 4}, five); }},
        {"666666666666", [&](Surface& s) { s.fill({3, 2, 1, 0}, five); }},
        {"666666665766", [&](Surface& s) { s.copy({0, 2, 2, 3}, source, {1, 1}); }},
        {"576666666666", [&](Surface& s) { s.copy({-1, -1, 2, 1}, source, {}); }},
        {"666666126645", [&](Surface& s) { s.copy({2, 1, 9, 9}, source, {}); }},
        {"666666666612", [&](Surface& s) { s.copy({0, 0, 4, 3}, source, {-2, -2}); }},
        {"666622664666", [&](Surface& s) { s.andCopy({-1, 1, 9, 9}, source, {}); }}};
    for (const auto& [expected, draw] : cases) {
        Surface surface = pixels("666666666666");
        draw(surface);
        EXPECT_TRUE(surface == pixels(expected)) << expected;
    }
}

// 3 x 2 pixels, six bytes between the header and them; the bytes of the pixels are 1, 2, 3 and so on.
std::string bitmapOfSix() {
    std::string file("BM\0\0\0\0\0\0\0\0\x3C\0\0\0\x28\0\0\0\3\0\0\0\2\0\0\0\1\0\x18", 29);
    file.resize(60);
    for (char byte = 1; byte <= 24; ++byte)
        file += byte;
    return file;
}

// The same with its rows from the top down, which a negative height says.
std::string bitmapOfSixFromTheTop() {
    return bitmapOfSix().replace(22, 4, "\376\377\377\377");
}

std::optional<Surface> decode(const std::string& file) {
    return decodeBitmap(std::as_bytes(std::span(file)));
}

TEST(Drawing, ABitmapFileIsReadWholeOrNotAtAll) {
    const std::string good = bitmapOfSix();
    const std::string fromTop = bitmapOfSixFromTheTop();
    ASSERT_TRUE(decode(good));
    ASSERT_TRUE(decode(fromTop));
    ASSERT_EQ(decode(good)->bounds(), (Rect{0, 0, 3, 2}));
    EXPECT_EQ(decode(good)->at(2, 0), (Colour{21, 20, 19}));
    EXPECT_EQ(decode(fromTop)->at(2, 1), (Colour{21, 20, 19}));
    for (std::size_t size = 0; size < good.size(); ++size)
        EXPECT_FALSE(decode(good.substr(0, size))) << size;
}

// Whatever a byte of the header says: where a picture comes of it, its pixels lie behind the header and
// within the file, and it has the type and the depth that are read.
TEST(Drawing, NoByteOfABitmapsHeaderLeadsOutOfTheFile) {
    constexpr std::size_t headerSize = 54;
    const auto isFixed = [](std::size_t at) {
        const bool isType = at < 2;
        const bool isDepthOrCompression = at >= 28 && at < 34;
        return isType || isDepthOrCompression;
    };
    for (const std::string& good : {bitmapOfSix(), bitmapOfSixFromTheTop()}) {
        for (std::size_t at = 0; at < headerSize; ++at) {
            for (int byte = 0; byte < 256; ++byte) {
                SCOPED_TRACE(testing::Message() << "byte " << at << " is " << byte);
                std::string file = good;
                file[at] = static_cast<char>(byte);
                const auto picture = decode(file);
                if (!picture)
                    continue;
                const int start = static_cast<unsigned char>(file[10]);
                const int lineSize = (picture->width() * 3 + 3) / 4 * 4;
                EXPECT_FALSE(picture->isEmpty());
                EXPECT_GE(start, static_cast<int>(headerSize));
                EXPECT_LE(start + lineSize * picture->height(), static_cast<int>(file.size()));
                if (isFixed(at)) {
                    EXPECT_EQ(file[at], good[at]);
                }
            }
        }
    }
}

Surface written(const char* text, std::int32_t format, const Rect& area) {
    Surface surface(120, 90);
    drawText(surface, Scale(), area, text, format, {255, 255, 255}, {Typeface::Sans, 14});
    return surface;
}

TEST(Drawing, TextIsBrokenCentredAndClipped) {
    constexpr const char* line = "Wj \xC4 lines";
    const std::int32_t height = measureText(line, {Typeface::Sans, 14}).height;
    for (const Rect& area : {Rect{20, 10, 110, 80}, Rect{-4, 10, 86, 200}, Rect{50, 10, 80, 20}}) {
        const std::int32_t middle =
            10 + static_cast<std::int32_t>(std::floor((area.height() - height + 1) / 2.0));
        for (const std::int32_t format : {0, 1, 1 + 4, 1 + 4 + 32}) {
            // The line alone, with as much room as it needs.
            Rect room{area.left, format > 32 ? middle : 10, area.right + 200, 90};
            if (format != 0)
                room.left -= 200;
            Surface lines = written(line, format & 1, room);
            if (format < 32)
                lines.copy({0, 10 + 2 * height, 120, 90}, lines, {0, 10});
            const Rect clip = area.intersection({0, 0, 120, 90});
            Surface expected(120, 90);
            expected.copy(clip, lines, {clip.left, clip.top});
            const char* text = format < 32 ? "Wj \xC4 lines\r\n\nWj \xC4 lines\n" : line;
            EXPECT_TRUE(written(text, format, area) == expected) << area.left << " " << format;
        }
    }
    EXPECT_NEAR(measureText("012345\x80", {Typeface::SansBold, 14}).width, 7 * 1139 / 2048.0 * 14 * 4 / 3, 1);
}

// The middle of what is written on a picture.
struct Ink {
    double x = 0;
    double y = 0;

    explicit Ink(const Surface& surface) {
        double light = 0;
        for (std::int32_t row = 0; row < surface.height(); ++row) {
            for (std::int32_t column = 0; column < surface.width(); ++column) {
                const double value = surface.at(column, row).green;
                x += value * (column + 0.5);
                y += value * (row + 0.5);
                light += value;
            }
        }
        x /= light;
        y /= light;
    }
};

TEST(Drawing, ACentredTextMovesByHalfOfWhatItsRectangleGrows) {
    constexpr std::int32_t format = 1 + 4 + 32;
    EXPECT_NEAR(Ink(written("HOH", format, {10, 20, 110, 50})).x, 60, 0.25);
    for (const char* text : {"Training", "Timed", "High scores", "Help", "Exit", "OK"}) {
        const Ink shadow(written(text, format, {10, 20, 110, 50}));
        for (const std::int32_t offset : {2, 3, 4, 6, 8}) {
            const Ink front(written(text, format, {10, 20, 110 + offset, 50 - offset}));
            EXPECT_NEAR(front.x - shadow.x, offset / 2.0, 0.02) << text << " " << offset;
            EXPECT_NEAR(shadow.y - front.y, (offset + 1) / 2, 0.02) << text << " " << offset;
        }
    }
}

}  // namespace
}  // namespace quabble
