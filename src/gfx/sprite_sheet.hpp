#pragma once

#include <cstdint>

#include "draw/geometry.hpp"
#include "draw/surface.hpp"
#include "platform/front_end.hpp"

namespace quabble {

// The map of the sprite sheet, in pixels of the sheet.
namespace sprites {
constexpr Size sheetSize{400, 838};  // at least
constexpr std::int32_t tileSize = 28;
constexpr Point tileAt(std::int16_t tile, std::int32_t cellSize) {
    return {tile * cellSize, 0};
}
constexpr Point maskAt(std::int32_t cellSize) {
    return {0, cellSize};
}
constexpr std::int32_t gaugeRows = 241;
constexpr std::int32_t gaugeWidth = 30;
constexpr Point fullGauge{274, 29};
constexpr Point emptyGauge{246, 29};  // its last two pixel columns are the full one's first two
constexpr Point playPanel{0, 338};
constexpr Size playPanelSize{400, 500};
}  // namespace sprites

// The two pictures of the program.
struct Pictures {
    Surface spriteSheet;
    Surface backdrop;  // without pixels when there is none
};

// Loads the pictures from the program's files. When the sprite sheet is missing, damaged or too small, plain
// coloured tiles with their numbers stand in for it.
Pictures loadGraphics(FrontEnd& frontEnd);

}  // namespace quabble
