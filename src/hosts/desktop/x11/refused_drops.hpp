#pragma once

#include "hosts/desktop/x11/x11_window.hpp"

namespace quabble {

// From now on nothing is heard of what other programs offer to drop on the program's windows: they take
// nothing, and SDL does not outlive an offer of a kind that has no name.
void refuseDrops(const X11Window& window);

}  // namespace quabble
