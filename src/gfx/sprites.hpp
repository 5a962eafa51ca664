#pragma once

#include <array>
#include <cstdint>

#include "draw/large_picture.hpp"
#include "draw/scale.hpp"
#include "draw/surface.hpp"
#include "engine/grid_cell.hpp"

namespace quabble {

// What the games are drawn with, cut out of the sprite sheet and made for one scale, each by itself.
struct Sprites {
    std::array<Surface, tiles::count> tiles;
    std::array<Surface, tiles::count> veiledTiles;  // darkened, in a cell that is not uncovered yet
    Surface emptyGauge;
    Surface fullGauge;
    Surface playPanel;
};

// The map of the sprite sheet, in the program's pixels.
namespace sheet_map {
constexpr Size size{400, 838};  // at least
constexpr std::int32_t tileSize = 28;
constexpr Rect tile(std::int32_t number) {
    return Rect::ofSize(number * tileSize, 0, tileSize, tileSize);
}
constexpr Rect veil = Rect::ofSize(0, tileSize, tileSize, tileSize);  // combined with a tile by a bitwise AND
constexpr std::int32_t gaugeRows = 241;
constexpr Rect fullGauge = Rect::ofSize(274, 29, 30, gaugeRows);
constexpr Rect emptyGauge =
    Rect::ofSize(246, 29, 30, gaugeRows);  // its last two columns are the full one's first
constexpr Rect playPanel = Rect::ofSize(0, 338, 400, 500);
}  // namespace sheet_map

// Makes the sprites from a sheet of at least that size, as it is at scale 1 and magnified at others.
Sprites spritesOf(const Surface& sheet, Scale scale);
// Makes them from a large version of a sheet of at least that size.
Sprites spritesOf(LargePicture& sheet, Scale scale);

}  // namespace quabble
