#pragma once

#include <array>
#include <cstdint>
#include <vector>

namespace quabble {

enum class CellKind : std::int16_t { Block = 0, Bomb = 1, Stone = 5 };

// Numbers of the tiles that paint a cell. A block's tile equals its colour, 1 to 4; a bomb's is its colour
// plus `bombOffset`.
namespace tiles {
constexpr std::int16_t empty = 0;
constexpr std::int16_t stone = 5;
constexpr std::int16_t releasedStone = 6;
constexpr std::int16_t bombOffset = 6;
constexpr std::array<std::int16_t, 4> explosion{10, 11, 12, 13};
constexpr std::int16_t count = 14;
}  // namespace tiles

// The colour that all stones share. Blocks have 1 to 4, bombs 1 to 3, an empty cell 0.
constexpr std::int16_t stoneColour = 5;

// One cell of the board. It is empty exactly when its colour is 0, and then every field is 0.
struct GridCell {
    CellKind kind = CellKind::Block;
    std::int16_t colour = 0;
    std::int16_t tile = tiles::empty;
    std::int16_t reserved = 0;

    bool isEmpty() const { return colour == 0; }
    friend bool operator==(const GridCell&, const GridCell&) = default;

    static GridCell block(std::int16_t colour) { return {CellKind::Block, colour, colour, 0}; }
    static GridCell bomb(std::int16_t colour) {
        return {CellKind::Bomb, colour, static_cast<std::int16_t>(colour + tiles::bombOffset), 0};
    }
    static GridCell stone() { return {CellKind::Stone, stoneColour, tiles::stone, 0}; }
};

// A row of cells, column 1 first; the row that waits to enter the board is one.
using GridRow = std::vector<GridCell>;

// A place on the board, counted from 1; row 1 is the top row.
struct CellPosition {
    std::int16_t column = 0;
    std::int16_t row = 0;
    friend bool operator==(const CellPosition&, const CellPosition&) = default;
};

}  // namespace quabble
