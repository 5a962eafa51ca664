#pragma once

#include <vector>

#include "draw/canvas.hpp"
#include "draw/geometry.hpp"
#include "gfx/screen_button.hpp"

namespace quabble {

// Where everything lies in the main window. Button sets are counted from 1 in the comments and the string
// table, from 0 here.
using ButtonSet = std::vector<ScreenButton>;

constexpr double captionPoints = 14;  // of buttons and labels

// The whole client area.
ScreenButton layOutBackground(Canvas& canvas);

// The eight buttons of the main menu, one below the other.
ButtonSet initMMBtns(Canvas& canvas, const ScreenButton& background);

// The side panels: labels, value boxes and buttons.
ButtonSet initStandardBtns(Canvas& canvas);
ButtonSet initArcadeBtns(Canvas& canvas);

// Places in the side panels of the boxes that show a number.
namespace panel_boxes {
constexpr std::size_t bestScore = 2;
constexpr std::size_t score = 4;
constexpr std::size_t level = 6;  // in the arcade panel
}  // namespace panel_boxes

// The play panel as it lies behind the menu.
ScreenButton layOutPlayPanel(Canvas& canvas, const ScreenButton& background);

// The board, 12 x 16 cells in the middle of the play panel.
ScreenButton layOutBoard(Canvas& canvas, const ScreenButton& playPanel);
// The strip of the waiting row below an arcade board and the gauge beside it.
ScreenButton layOutPreview(Canvas& canvas, const ScreenButton& board);
ScreenButton layOutGauge(Canvas& canvas, const ScreenButton& playPanel, const ScreenButton& board);

}  // namespace quabble
