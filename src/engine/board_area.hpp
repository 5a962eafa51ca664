#pragma once

#include <cstdint>
#include <optional>

#include "engine/grid_cell.hpp"
#include "engine/play_grid.hpp"

namespace quabble {

// Where the board lies on the screen, in window pixels: square cells of `cellSize`, 12 x 16 of them.
struct BoardArea {
    std::int32_t left = 0;
    std::int32_t top = 0;
    std::int32_t cellSize = 28;

    std::int32_t width() const { return maxGridCols * cellSize; }
    std::int32_t height() const { return maxGridRows * cellSize; }

    // The cell under a point, or nothing: the points on the board's border lines belong to no cell.
    std::optional<CellPosition> cellAt(std::int32_t x, std::int32_t y) const {
        if (x <= left || x >= left + width() || y <= top || y >= top + height())
            return std::nullopt;
        return CellPosition{static_cast<std::int16_t>((x - left) / cellSize + 1),
                            static_cast<std::int16_t>((y - top) / cellSize + 1)};
    }
};

}  // namespace quabble
