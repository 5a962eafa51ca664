#include "draw/canvas.hpp"

namespace quabble {

void Canvas::outline(const Rect& area, Colour colour, std::int32_t linesInside) {
    if (area.isEmpty())
        return;
    const std::int32_t line = scale_.line();
    const Rect outer = scale_.device(area).shrunkBy(linesInside * line);
    const Rect inner = outer.shrunkBy(line);
    picture_.fill({outer.left, outer.top, outer.right, inner.top}, colour);
    picture_.fill({outer.left, inner.bottom, outer.right, outer.bottom}, colour);
    picture_.fill({outer.left, outer.top, inner.left, outer.bottom}, colour);
    picture_.fill({inner.right, outer.top, outer.right, outer.bottom}, colour);
}

}  // namespace quabble
