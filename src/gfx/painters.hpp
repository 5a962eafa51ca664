#pragma once

#include <cstdint>
#include <string_view>

#include "draw/canvas.hpp"
#include "engine/grid_cell.hpp"
#include "engine/play_grid.hpp"
#include "gfx/screen_button.hpp"
#include "gfx/sprites.hpp"

namespace quabble {

// The painters draw on a window's canvas, where it stays unseen until the window is refreshed. Every text is
// written twice: a black copy and, up and to the right of it, one in the box's colour.

enum class BoxStyle { Plain, Framed, DoubleFramed };

// Fills the box; one without a brush is left as it is.
void fillBox(Canvas& canvas, const ScreenButton& box);

// Draws the box with its caption in the middle. The front copy is written in the rectangle whose right edge
// is moved right and whose bottom edge is moved up by `shadowOffset` pixels, so it lies half as far from the
// black one. Each copy is clipped to its own rectangle.
void drawLabelledBox(Canvas& canvas, const ScreenButton& box, BoxStyle style, bool highlighted,
                     std::int32_t shadowOffset, std::string_view caption);

constexpr std::int32_t defaultTextFormat = -1;  // at the top left

// Writes a text of one or more lines. The front copy is written in the rectangle whose left edge is moved
// right and whose top edge is moved up by `offset` pixels. The format is drawText's, or the default.
void drawShadowText(Canvas& canvas, const ScreenButton& box, std::int32_t offset, std::string_view text,
                    std::int32_t format);

// The painters below copy pictures that were made for the canvas's scale.

// Copies a tile to the cell at (column, row), counted from 0.
void drawCell(Canvas& canvas, const CellBox& box, const Sprites& sprites, std::int16_t column,
              std::int16_t row, std::int16_t tile);
void drawBoard(Canvas& canvas, const CellBox& box, const Sprites& sprites, const PlayGrid& grid);

// Draws the waiting row; its last `revealed` + 1 cells show plainly, the others darkened.
void drawPreviewRow(Canvas& canvas, const CellBox& box, const Sprites& sprites, const GridRow& nextRow,
                    std::int16_t revealed);

// Draws how far a level has come, 0 to 100 percent, from the top down. It is 241 pixels high whatever the
// area.
void drawGauge(Canvas& canvas, const Rect& area, const Sprites& sprites, double percentage);

void drawPlayPanel(Canvas& canvas, const Rect& area, const Sprites& sprites);

}  // namespace quabble
