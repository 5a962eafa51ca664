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

void paintFocusRing(Canvas& canvas, const Rect& area) {
    canvas.outline(area, focusRing, -1);
    canvas.outline(area, focusRing, -2);
}

void paintControlEdge(Canvas& canvas, const Rect& area, bool hasFocus) {
    canvas.outline(area, edge);
    if (hasFocus)
        paintFocusRing(canvas, area);
}

void Label::paint(Canvas& canvas, bool) const {
    canvas.fill(area, background);
    canvas.write(area, caption, centredLine, font, textColour);
}

void PushButton::paint(Canvas& canvas, bool hasFocus) const {
    if (hasFocus)
        paintFocusRing(canvas, area);
}

Task<> PushButton::mouseDown(Point, bool) {
    co_return;
}

Task<> PushButton::mouseUp(Point at) {
    if (area.contains(at.x, at.y))
        co_await onClick_();
}

}  // namespace quabble
