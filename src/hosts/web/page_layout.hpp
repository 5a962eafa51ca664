#pragma once

#include <cstdint>

#include "draw/geometry.hpp"
#include "platform/front_end.hpp"

namespace quabble {

// The part of a page that windows have room in.
struct Page {
    Size size;         // in device pixels
    double ratio = 1;  // device pixels to one of the page's
};

// Where a window is: its frame in the page, and its client area in the frame. In device pixels.
struct WindowPlace {
    Rect frame;
    Rect client;
};

// How many device pixels one of the program's takes, across and down: the largest quarter for which the main
// window has room with its frame, at least 1 and at most twice the page's ratio. Less than 1, and then any
// number, only where there is no room for that.
double factorOn(const Page& page);

// A dialog is centred on its owner, as far as the page has room, any other window on the page.
WindowPlace placeOn(const Page& page, const NativeWindow& window, double factor, const Rect* owner);

}  // namespace quabble
