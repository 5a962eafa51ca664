#include "engine/rows.hpp"

#include "base/round_half_even.hpp"

namespace quabble {
namespace {

constexpr std::int32_t bombColours = 3;

std::int32_t stoneLimit(std::int16_t level) {
    if (level <= 4)
        return 0;
    if (level <= 6)
        return 6;
    return level == 7 ? 10 : 8;
}

std::int32_t drawRange(std::int16_t level) {
    return level <= 3 ? level * 10 + 608 : level * 30;
}

GridCell randomBlock(std::int16_t colourCount, RandomSource& random) {
    const std::int32_t drawn = roundHalfEven(random.next() * (colourCount * 10 - 10));
    return GridCell::block(static_cast<std::int16_t>(drawn % colourCount + 1));
}

GridCell randomCell(const RowRecipe& recipe, RandomSource& random) {
    const std::int32_t drawn = roundHalfEven(random.next() * drawRange(recipe.level));
    if (recipe.gameMode >= GameMode::Timed) {
        if (drawn < bombColours)
            return GridCell::bomb(static_cast<std::int16_t>(drawn + 1));
        if (drawn < bombColours + stoneLimit(recipe.level))
            return GridCell::stone();
    }
    return randomBlock(recipe.colourCount, random);
}

}  // namespace

void fillRow(GridRow& row, const RowRecipe& recipe, RandomSource& random) {
    for (GridCell& cell : row)
        cell = randomCell(recipe, random);
}

GridRow makeNextRow(std::int16_t gridCols, const RowRecipe& recipe, RandomSource& random) {
    GridRow row(static_cast<std::size_t>(gridCols));
    fillRow(row, recipe, random);
    return row;
}

GridRow fillBoard(PlayGrid& grid, std::int16_t firstRow, const RowRecipe& recipe, RandomSource& random) {
    grid.recreate(grid.gridCols(), grid.gridRows());
    GridRow row;
    for (std::int16_t i = firstRow; i <= grid.gridRows(); ++i) {
        row = makeNextRow(grid.gridCols(), recipe, random);
        grid.pushRowFromBottom(row);
    }
    return row;
}

}  // namespace quabble
