#pragma once

#include <cstdint>

#include "engine/game_stats.hpp"
#include "engine/grid_cell.hpp"
#include "engine/play_grid.hpp"
#include "engine/random_source.hpp"

namespace quabble {

// What a random row depends on.
struct RowRecipe {
    GameMode gameMode = GameMode::None;  // only the arcade modes get bombs and stones
    std::int16_t level = 0;              // 1 to 10
    std::int16_t colourCount = 0;        // 3 or 4
};

// A random row of the given width. A bomb has the chance 2.5 / N per cell, with N = 10 level + 608 up to
// level 3 and 30 level from there; a stone has (stone limit) / N, with the limit 0 up to level 4, 6 up to 6,
// 10 at 7 and 8 from 8 on. The colours of blocks are nearly alike in their chances: 13 : 14 : 13
// of three, 15 : 16 : 15 : 14 of four.
GridRow makeNextRow(std::int16_t gridCols, const RowRecipe& recipe, RandomSource& random);

// Draws every cell of a row that is there already anew.
void fillRow(GridRow& row, const RowRecipe& recipe, RandomSource& random);

// Empties the board, then fills its rows from `firstRow` down with random ones. Returns the last row made,
// which is also the board's bottom row.
GridRow fillBoard(PlayGrid& grid, std::int16_t firstRow, const RowRecipe& recipe, RandomSource& random);

}  // namespace quabble
