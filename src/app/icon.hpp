#pragma once

#include "platform/front_end.hpp"

namespace quabble {

// The program's icon, drawn in res/art/icon.svg and made part of the program.
Icon applicationIcon();

}  // namespace quabble
