#pragma once

#include "draw/surface.hpp"
#include "draw/text.hpp"

namespace quabble {

// A window's drawing surface: its picture and the font that texts are drawn with.
struct Canvas {
    Surface picture;
    Font font;
};

}  // namespace quabble
