#include "hosts/web/page_layout.hpp"

#include <gtest/gtest.h>

namespace quabble {
namespace {

NativeWindow windowOf(Size clientSize) {
    NativeWindow window;
    window.clientSize = clientSize;
    return window;
}
NativeWindow borderless(NativeWindow window) {
    window.borderless = true;
    return window;
}
const NativeWindow mainWindow = windowOf({675, 562});
const NativeWindow splash = borderless(windowOf({680, 340}));
const NativeWindow table = windowOf({473, 473});

struct Device {
    const char* name;
    Page page;  // in device pixels
    double factor;
};
constexpr Device devices[] = {
    {"a laptop", {{1366, 657}, 1}, 1},
    {"a desktop", {{1920, 937}, 1}, 1.5},
    {"the same at 110 %", {{1920, 937}, 1.1}, 1.5},
    {"the same at 133 %", {{1920, 937}, 4.0 / 3}, 1.5},
    {"a large screen, not more than twice as large", {{3840, 1937}, 1}, 2},
    {"a fine screen", {{2880, 1600}, 2}, 2.5},
    {"a very fine one, not more than 4", {{7680, 4320}, 3}, 4},
    {"a phone sideways", {{2532, 990}, 3}, 1.5},
    {"a phone upright", {{1170, 1992}, 3}, 1.5},
};

bool isWithin(const Rect& inner, const Size& outer) {
    return inner.left >= 0 && inner.top >= 0 && inner.right <= outer.width && inner.bottom <= outer.height;
}

TEST(PageLayout, EveryWindowIsWholeOnThePageAsLargeAsItCanBe) {
    for (const auto& [name, page, factor] : devices) {
        EXPECT_EQ(factorOn(page), factor) << name;
        for (const NativeWindow& window : {mainWindow, splash}) {
            const WindowPlace place = placeOn(page, window, factor, nullptr);
            EXPECT_TRUE(isWithin(place.frame, page.size)) << name;
            EXPECT_TRUE(isWithin(place.client, {place.frame.width(), place.frame.height()})) << name;
            // In the middle, to a pixel.
            EXPECT_NEAR(place.frame.left + place.frame.right, page.size.width, 1) << name;
            EXPECT_NEAR(place.frame.top + place.frame.bottom, page.size.height, 1) << name;
        }
    }
}

TEST(PageLayout, AClientAreaIsAsLargeAsItsPicture) {
    for (const auto& [name, page, factor] : devices) {
        const Rect client = placeOn(page, mainWindow, factor, nullptr).client;
        EXPECT_EQ(Size(client.width(), client.height()), Scale::nearest(factor).device(mainWindow.clientSize))
            << name;
    }
}

TEST(PageLayout, WhereThereIsNoRoomThePictureIsBroughtDown) {
    const Page phone{{390, 664}, 1};
    const double factor = factorOn(phone);
    EXPECT_GT(factor, 0.5);
    EXPECT_LT(factor, 1);
    const WindowPlace place = placeOn(phone, mainWindow, factor, nullptr);
    EXPECT_TRUE(isWithin(place.frame, phone.size));
    EXPECT_GT(place.frame.width(), 380);  // nothing of the width is given away
    EXPECT_NEAR(place.client.width() * 562.0, place.client.height() * 675.0, 675);
    EXPECT_GE(factorOn({{0, 0}, 1}), 0.25);  // a page that has no room yet
}

TEST(PageLayout, ABarIsHighEnoughForAFinger) {
    EXPECT_GE(placeOn({{1170, 1992}, 3}, mainWindow, 1.5, nullptr).client.top, 28 * 3);
    EXPECT_EQ(placeOn({{1920, 937}, 1}, splash, 1.5, nullptr).client.top, 0);
}

TEST(PageLayout, ADialogIsCentredOnItsOwnerAndStaysOnThePage) {
    const Page page{{1280, 800}, 1};
    const Rect inTheMiddle = Rect::ofSize(300, 100, 687, 597);
    const WindowPlace place = placeOn(page, table, 1, &inTheMiddle);
    EXPECT_NEAR(place.frame.left + place.frame.right, inTheMiddle.left + inTheMiddle.right, 1);
    EXPECT_NEAR(place.frame.top + place.frame.bottom, inTheMiddle.top + inTheMiddle.bottom, 1);
    const Rect atTheEdge = Rect::ofSize(1000, 600, 280, 200);
    EXPECT_TRUE(isWithin(placeOn(page, table, 1, &atTheEdge).frame, page.size));
}

}  // namespace
}  // namespace quabble
