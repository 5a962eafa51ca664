#pragma once

#include <cstdint>

#include "draw/surface.hpp"

namespace quabble {

// Shows a picture in a window of the page, in the form that a page takes pixels in.
void showInPage(std::uint32_t window, const Surface& picture);

}  // namespace quabble
