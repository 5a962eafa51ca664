#pragma once

#include <optional>
#include <span>

#include "draw/canvas.hpp"
#include "platform/input_event.hpp"

namespace quabble {

// The places of a window: the areas that can be clicked, from one to another of which the arrow keys move the
// program's own pointer.

constexpr Point middleOf(const Rect& area) {
    return {(area.left + area.right) / 2, (area.top + area.bottom) / 2};
}

// The place that holds a point, and the one that is nearest to it; nothing when there is none.
std::optional<Rect> placeAt(std::span<const Rect> places, Point at);
std::optional<Rect> placeNearestTo(std::span<const Rect> places, Point at);

// Where a step from a place leads. Up and Down stay in its column. Left and Right go on to whatever comes
// first on that side. Of several as far away it is the one nearest to the goal; the middle of the place that
// the last steps began at will do, so that a walk over a large place goes on in its old row or column.
std::optional<Rect> placeBeside(std::span<const Rect> places, const Rect& from, EditCommand direction,
                                Point goal);

// Paints the ring that shows the pointer at a place. It is dark and bright, so that it is seen on everything.
void paintPointerRing(Canvas& canvas, const Rect& place);

}  // namespace quabble
