#pragma once

#include <array>

#include "platform/front_end.hpp"

namespace quabble {

// The program's icon from small to large, drawn in res/art/icon.svg and made part of the program.
std::array<Icon, 5> applicationIcons();

}  // namespace quabble
