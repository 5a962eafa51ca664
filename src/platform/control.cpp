#include "platform/control.hpp"

namespace quabble {
namespace {

constexpr std::int32_t centredLine =
    text_format::centre + text_format::verticalCentre + text_format::singleLine;

constexpr Colour edge{28, 38, 78};
constexpr Colour focusRing{249, 249, 230};

}  // namespace

Task<> Control::mouseUp(Point) {
    co_return;
}
Task<> Control::keyPress(std::int16_t) {
    co_return;
}

void paintFocusRing(Surface& surface, const Rect& area) {
    surface.outline(area.shrunkBy(-1), focusRing);
    surface.outline(area.shrunkBy(-2), focusRing);
}

void paintControlEdge(Surface& surface, const Rect& area, bool hasFocus) {
    surface.outline(area, edge);
    if (hasFocus)
        paintFocusRing(surface, area);
}

void Label::paint(Surface& surface, bool) const {
    surface.fill(area, background);
    drawText(surface, area, caption, centredLine, textColour, font);
}

void PushButton::paint(Surface& surface, bool hasFocus) const {
    if (hasFocus)
        paintFocusRing(surface, area);
}

Task<> PushButton::mouseDown(Point, bool) {
    co_return;
}

Task<> PushButton::mouseUp(Point at) {
    if (area.contains(at.x, at.y))
        co_await onClick();
}

}  // namespace quabble
