#pragma once

#include "draw/canvas.hpp"
#include "gfx/screen_button.hpp"
#include "platform/place.hpp"

namespace quabble {

// The OK button that the dialogs have in common. It is drawn on the dialog's canvas; a dialog that takes the
// keyboard lays a PushButton over it.
constexpr Size okButtonSize{90, 30};
ScreenButton layOutOkButton(std::int32_t left, std::int32_t top);

Place okPlace(const ScreenButton& button);

// Draws it, highlighted when it is hovered.
void drawOkButton(Canvas& canvas, const ScreenButton& button);

}  // namespace quabble
