#include "hosts/web/page_layout.hpp"

#include <algorithm>
#include <cmath>

#include "draw/scale.hpp"
#include "draw/scaling.hpp"
#include "platform/window.hpp"

namespace quabble {
namespace {

constexpr Size largestClient{680, 562};  // the splash is the widest window, the main one the highest
constexpr std::int32_t border = Window::nominalFrame.width / 2;
constexpr std::int32_t bar = Window::nominalFrame.height - border;
constexpr double lowestBar = 28;  // of the page's pixels, for a finger to hit its buttons

Size clientSize(Size size, double factor) {
    return factor < 1 ? scaled(size, factor) : Scale::nearest(factor).device(size);
}

WindowPlace placeAtCorner(const Page& page, Size client, bool isBorderless, double factor) {
    const Size size = clientSize(client, factor);
    const auto edge =
        static_cast<std::int32_t>(std::lround(isBorderless ? 0 : border * std::max(factor, 1.0)));
    const double wantedBar = std::max(bar * factor, lowestBar * page.ratio);
    const auto top = static_cast<std::int32_t>(isBorderless ? 0 : std::lround(wantedBar));
    return {Rect::ofSize(0, 0, size.width + 2 * edge, size.height + top + edge),
            Rect::ofSize(edge, top, size.width, size.height)};
}

bool hasRoom(const Page& page, double factor) {
    const Rect frame = placeAtCorner(page, largestClient, false, factor).frame;
    return frame.width() <= page.size.width && frame.height() <= page.size.height;
}

}  // namespace

double factorOn(const Page& page) {
    constexpr double quarter = 0.25;
    const double largest = std::clamp(std::floor(2 * page.ratio / quarter) * quarter, 1.0, 4.0);
    for (double factor = largest; factor >= 1; factor -= quarter) {
        if (hasRoom(page, factor))
            return factor;
    }
    const Rect frame = placeAtCorner(page, largestClient, false, 1).frame;
    const double across = static_cast<double>(page.size.width - frame.width()) / largestClient.width;
    const double down = static_cast<double>(page.size.height - frame.height()) / largestClient.height;
    constexpr double smallest = 0.25;
    return std::max(1 + std::min(across, down), smallest);
}

WindowPlace placeOn(const Page& page, const NativeWindow& window, double factor, const Rect* owner) {
    WindowPlace place = placeAtCorner(page, window.clientSize, window.borderless, factor);
    const Rect around = owner != nullptr ? *owner : Rect::ofSize(0, 0, page.size.width, page.size.height);
    const auto centred = [](std::int32_t begin, std::int32_t end, std::int32_t length, std::int32_t room) {
        return std::max(std::min((begin + end - length) / 2, room - length), 0);
    };
    const Size size{place.frame.width(), place.frame.height()};
    place.frame = Rect::ofSize(centred(around.left, around.right, size.width, page.size.width),
                               centred(around.top, around.bottom, size.height, page.size.height), size.width,
                               size.height);
    return place;
}

}  // namespace quabble
