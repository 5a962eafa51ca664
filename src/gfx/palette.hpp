#pragma once

#include "draw/surface.hpp"

namespace quabble {

struct Brush {
    Colour colour;
};
struct Pen {  // 1 pixel wide
    Colour colour;
};

// The colours that everything but the pictures is drawn with.
namespace palette {
constexpr Colour black{0, 0, 0};
constexpr Colour backgroundColour{62, 105, 214};  // windows, menus, panels, buttons
constexpr Colour highlightColour{200, 220, 180};  // captions of hovered buttons
constexpr Colour labelColour{140, 140, 80};       // captions of panel labels
constexpr Colour panelTextColour{180, 180, 140};  // captions of buttons, points of a move
constexpr Colour valueColour{249, 249, 230};      // numbers in the panels
constexpr Colour pauseTextColour{255, 255, 192};
constexpr Colour pauseBackground{128, 128, 255};
constexpr Brush backgroundBrush{backgroundColour};
constexpr Brush viewBrush{backgroundColour};  // the view of the high scores
constexpr Brush blackBrush{black};
constexpr Pen lightPen{highlightColour};
constexpr Pen outlinePen{{170, 170, 100}};  // the dialogs' OK button
}  // namespace palette

}  // namespace quabble
