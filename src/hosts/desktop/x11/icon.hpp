#pragma once

#include <array>
#include <span>

#include "draw/geometry.hpp"

namespace quabble {

// A small picture that stands for the program, four bytes a pixel: red, green, blue and opacity.
struct Icon {
    Size size;
    std::span<const unsigned char> rgba;
};

// The program's icon from small to large, drawn in res/art/icon.svg and made part of the program.
std::array<Icon, 5> applicationIcons();

}  // namespace quabble
