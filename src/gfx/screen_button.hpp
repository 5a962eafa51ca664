#pragma once

#include <cstdint>
#include <optional>

#include "draw/geometry.hpp"
#include "draw/text.hpp"
#include "gfx/palette.hpp"

namespace quabble {

// What a drawn box is for; the values are those of a button's `active` number.
enum class BoxKind : std::int32_t { ValueBox = -1, Label = 0, Button = 1 };

// A box with a caption that is drawn on a window: a button, a label or a value box.
struct ScreenButton {
    std::int32_t left = 0;
    std::int32_t top = 0;
    std::int32_t width = 0;
    std::int32_t height = 0;
    bool hovered = false;  // its highlighted form is on the screen
    std::optional<Brush> fillBrush = std::nullopt;
    std::optional<Pen> framePen = std::nullopt;
    Colour textColour = {};
    Font font = {};
    BoxKind active = BoxKind::Button;

    Rect rect() const { return Rect::ofSize(left, top, width, height); }
};

// Square cells that tiles are drawn in: the board, or the strip of the waiting row.
struct CellBox {
    std::int32_t left = 0;
    std::int32_t top = 0;
    std::int32_t cellSize = 1;  // edge of one cell

    // The cell at a place counted from 0.
    Rect cell(std::int32_t column, std::int32_t row) const {
        return Rect::ofSize(left + column * cellSize, top + row * cellSize, cellSize, cellSize);
    }
};

// True when the point lies strictly inside the area: a point on any edge is outside.
bool hitTest(const Rect& area, float x, float y);
inline bool hitTest(const ScreenButton& box, float x, float y) {
    return hitTest(box.rect(), x, y);
}

}  // namespace quabble
