#include <gtest/gtest.h>

#include <functional>

#include "pictures.hpp"

namespace quabble {
namespace {

// A picture in digits: a pixel's value is that of its character.
Surface picture(std::string_view digits) {
    Surface surface = digits.size() == 12 ? Surface(4, 3) : Surface(3, 2);
    for (std::int32_t y = 0; y < surface.height(); ++y)
        std::ranges::copy_n(digits.begin() + y * surface.width(), surface.width(), surface.row(y).begin());
    return surface;
}

TEST(Drawing, EveryOperationIsClippedToBothPictures) {
    const Surface source = picture("123457");
    const Colour five = colourOf('5');
    const std::pair<const char*, std::function<void(Surface&)>> cases[] = {
        {"655665566666", [&](Surface& s) { s.fill({1, 0, 3, 2}, five); }},
        {"555555555555", [&](Surface& s) { s.fill({-2, -9, 9, 4}, five); }},
        {"666666666666", [&](Surface& s) { s.fill({3, 2, 1, 0}, five); }},
        {"555556655555", [&](Surface& s) { s.outline({0, 0, 4, 3}, five); }},
        {"665666565556", [&](Surface& s) { s.outline({-1, -1, 3, 3}, five); }},
        {"666666666666", [&](Surface& s) { s.outline({1, 1, 3, 1}, five); }},
        {"666666665766", [&](Surface& s) { s.copy({0, 2, 2, 3}, source, {1, 1}); }},
        {"576666666666", [&](Surface& s) { s.copy({-1, -1, 2, 1}, source, {}); }},
        {"666666126645", [&](Surface& s) { s.copy({2, 1, 9, 9}, source, {}); }},
        {"666666666612", [&](Surface& s) { s.copy({0, 0, 4, 3}, source, {-2, -2}); }},
        {"666622664666", [&](Surface& s) { s.andCopy({-1, 1, 9, 9}, source, {}); }}};
    for (const auto& [expected, draw] : cases) {
        Surface surface = picture("666666666666");
        draw(surface);
        EXPECT_TRUE(same(surface, picture(expected))) << expected;
    }
}

}  // namespace
}  // namespace quabble
