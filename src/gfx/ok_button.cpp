#include "gfx/ok_button.hpp"

#include "gfx/painters.hpp"
#include "gfx/string_table.hpp"

namespace quabble {

ScreenButton layOutOkButton(Canvas& canvas, std::int32_t left, std::int32_t top) {
    return {.surface = &canvas,
            .left = left,
            .top = top,
            .width = okButtonSize.width,
            .height = okButtonSize.height,
            .fillBrush = palette::backgroundBrush,
            .framePen = palette::outlinePen,
            .textColour = palette::panelTextColour};
}

void drawOkButton(const ScreenButton& button) {
    button.surface->font = {Typeface::Sans, 14};
    const BoxStyle style = button.hovered ? BoxStyle::DoubleFramed : BoxStyle::Framed;
    drawLabelledBox(button, style, button.hovered, button.hovered ? 8 : 6, loadString(string_ids::ok));
}

}  // namespace quabble
