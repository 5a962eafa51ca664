#pragma once

#include "draw/geometry.hpp"

struct HWND__;

namespace quabble {

// What depends on how many dots an inch of a screen has. Where a window's screen has a number of its own
// (Windows 10) it is that, elsewhere that of all screens.
unsigned dotsPerInchOf(HWND__* window);

// A window's outer size around a client area, with the frame that its style has at this number of dots.
Size outerSizeAround(Size client, HWND__* window, unsigned dotsPerInch);

// The part of the window's screen that bars of the desktop leave free, in the desktop's coordinates.
Rect workAreaOf(HWND__* window);

}  // namespace quabble
