#pragma once

#include <cstddef>
#include <optional>
#include <span>
#include <vector>

#include "draw/surface.hpp"

namespace quabble {

// Decodes a 24-bit uncompressed BMP picture of at most 4096 x 4096 pixels. Nothing when the bytes are
// anything else, or fewer than the header promises: a picture that was cut off is refused, not filled up.
std::optional<Surface> decodeBitmap(std::span<const std::byte> file);

// A picture as such a file, whose rows lie from the bottom up and take whole groups of four bytes.
std::vector<std::byte> encodeBitmap(const Surface& picture);

}  // namespace quabble
