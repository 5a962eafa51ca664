#pragma once

#include <cstdint>
#include <optional>

#include "draw/canvas.hpp"
#include "draw/geometry.hpp"
#include "gfx/palette.hpp"

namespace quabble {

// What a drawn box is for; the values are those of a button's `active` number.
enum class BoxKind : std::int32_t { ValueBox = -1, Label = 0, Button = 1 };

// A rectangle that is drawn on a window: a button, a label, a value box, the board or a whole background.
struct ScreenButton {
    Canvas* surface = nullptr;  // what it is drawn on; whoever lays the box out owns that
    std::int32_t left = 0;
    std::int32_t top = 0;
    std::int32_t width = 0;
    std::int32_t height = 0;
    bool hovered = false;  // its highlighted form is on the screen
    std::optional<Brush> fillBrush = std::nullopt;
    std::optional<Pen> framePen = std::nullopt;
    Colour textColour = {};
    std::int32_t cellSize = 1;  // edge of one cell, for boxes that hold cells
    BoxKind active = BoxKind::Button;

    Rect rect() const { return Rect::ofSize(left, top, width, height); }
};

// True when the point lies strictly inside the box: a point on any edge is outside.
bool hitTest(const ScreenButton& box, float x, float y);

}  // namespace quabble
