#pragma once

#include <cstdint>
#include <vector>

#include "draw/geometry.hpp"
#include "gfx/screen_button.hpp"

// Where everything lies in the main window.
namespace quabble::layout {

constexpr std::int16_t layoutUnit = 45;  // pixels; the windows' layouts are multiples of it

constexpr Font captionFont{Typeface::SansBold, 14};  // of buttons, labels and values

// The whole client area.
Size clientSize();

// The eight buttons of the main menu, one below the other.
std::vector<ScreenButton> initMMBtns();

// The side panels: labels, value boxes and buttons.
std::vector<ScreenButton> initStandardBtns();
std::vector<ScreenButton> initArcadeBtns();

// Places in the side panels of the boxes that show a number.
constexpr std::size_t bestScoreBox = 2;
constexpr std::size_t scoreBox = 4;
constexpr std::size_t levelBox = 6;  // in the arcade panel

// The play panel behind a game of that kind.
Rect classicPlayPanel();
Rect arcadePlayPanel();

// The board, 12 x 16 cells in the middle of the play panel.
CellBox board(const Rect& playPanel);
// The strip of the waiting row below an arcade board and the gauge beside it.
CellBox preview(const CellBox& board);
Rect gauge(const Rect& playPanel, const CellBox& board);

}  // namespace quabble::layout
