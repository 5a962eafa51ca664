#include "gfx/ok_button.hpp"

#include "gfx/painters.hpp"
#include "gfx/string_table.hpp"

namespace quabble {

ScreenButton layOutOkButton(std::int32_t left, std::int32_t top) {
    return {.left = left,
            .top = top,
            .width = okButtonSize.width,
            .height = okButtonSize.height,
            .fillBrush = palette::backgroundBrush,
            .framePen = palette::outlinePen,
            .textColour = palette::panelTextColour,
            .font = {Typeface::Sans, 14}};
}

Place okPlace(const ScreenButton& button) {
    return {button.rect(), Place::Role::Button, std::string(loadString(string_ids::ok))};
}

void drawOkButton(Canvas& canvas, const ScreenButton& button) {
    const BoxStyle style = button.hovered ? BoxStyle::DoubleFramed : BoxStyle::Framed;
    drawLabelledBox(canvas, button, style, button.hovered, button.hovered ? 8 : 6,
                    loadString(string_ids::ok));
}

}  // namespace quabble
