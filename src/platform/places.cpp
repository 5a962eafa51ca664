#include "platform/places.hpp"

#include <algorithm>
#include <utility>
#include <vector>

namespace quabble {
namespace {

constexpr Colour dark{0, 0, 0};
constexpr Colour bright{255, 255, 255};

// How far a number lies outside of a range.
std::int32_t distance(std::int32_t number, std::int32_t first, std::int32_t last) {
    return std::max({first - number, number - last, 0});
}

bool isSideways(EditCommand direction) {
    return direction == EditCommand::Left || direction == EditCommand::Right;
}

// How far the one place lies beyond the other's edge; negative when it does not.
std::int32_t gapTo(const Rect& place, const Rect& from, EditCommand direction) {
    switch (direction) {
        case EditCommand::Left:
            return from.left - place.right;
        case EditCommand::Right:
            return place.left - from.right;
        case EditCommand::Up:
            return from.top - place.bottom;
        default:
            return place.top - from.bottom;
    }
}

template <typename Measure>
std::optional<Rect> least(std::span<const Rect> places, Measure measure) {
    const auto found = std::ranges::min_element(places, {}, measure);
    return found == places.end() ? std::nullopt : std::optional(*found);
}

}  // namespace

std::optional<Rect> placeAt(std::span<const Rect> places, Point at) {
    const auto found =
        std::ranges::find_if(places, [&](const Rect& place) { return place.contains(at.x, at.y); });
    return found == places.end() ? std::nullopt : std::optional(*found);
}

std::optional<Rect> placeNearestTo(std::span<const Rect> places, Point at) {
    return least(places, [&](const Rect& place) {
        return distance(at.x, place.left, place.right - 1) + distance(at.y, place.top, place.bottom - 1);
    });
}

std::optional<Rect> placeBeside(std::span<const Rect> places, const Rect& from, EditCommand direction,
                                Point goal) {
    std::vector<Rect> beyond;
    std::ranges::copy_if(places, std::back_inserter(beyond), [&](const Rect& place) {
        const bool isInColumn = place.left < from.right && from.left < place.right;
        return gapTo(place, from, direction) >= 0 && (isSideways(direction) || isInColumn);
    });
    return least(beyond, [&](const Rect& place) {
        const std::int32_t aside = isSideways(direction) ? distance(goal.y, place.top, place.bottom - 1)
                                                         : distance(goal.x, place.left, place.right - 1);
        return std::pair(gapTo(place, from, direction), aside);
    });
}

void paintPointerRing(Canvas& canvas, const Rect& place) {
    canvas.outline(place, dark, -1);
    canvas.outline(place, bright, 0);
    canvas.outline(place, bright, 1);
    canvas.outline(place, dark, 2);
}

}  // namespace quabble
