#pragma once

#include <cstddef>
#include <optional>
#include <span>

#include "draw/surface.hpp"

namespace quabble {

// Decodes a PNG picture of at most 4096 x 4096 pixels; what is transparent becomes black. Nothing when the
// bytes are anything else. What follows the picture does not count.
std::optional<Surface> decodePng(std::span<const std::byte> file);

}  // namespace quabble
