#pragma once

#include <string>

#include "draw/surface.hpp"

namespace quabble {

// Compares with the picture kept under that name, which QUABBLE_REFRESH_GOLDEN=1 writes anew.
void expectGolden(const Surface& seen, const std::string& name);

}  // namespace quabble
