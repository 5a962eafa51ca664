#pragma once

#include <cstddef>
#include <optional>
#include <span>

#include "draw/surface.hpp"

namespace quabble {

// Decodes a 24-bit uncompressed BMP picture of at most 4096 x 4096 pixels. Nothing when the bytes are
// anything else, or fewer than the header promises: a picture that was cut off is refused, not filled up.
std::optional<Surface> decodeBitmap(std::span<const std::byte> file);

}  // namespace quabble
