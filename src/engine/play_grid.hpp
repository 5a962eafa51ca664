#pragma once

#include <array>
#include <cstdint>

#include "engine/grid_cell.hpp"

namespace quabble {

constexpr std::int16_t maxGridCols = 12;
constexpr std::int16_t maxGridRows = 16;

// The four directions in the order in which the cluster search looks at neighbours, and the step that each
// is.
enum class Direction : std::int16_t { Right = 1, Down = 2, Left = 3, Up = 4 };
constexpr std::array<std::int16_t, 4> dirCol{1, 0, -1, 0};
constexpr std::array<std::int16_t, 4> dirRow{0, 1, 0, -1};

// The board and the rules that act on it. Every operation changes it at once; nothing here draws, waits or
// draws lots. Places are (column, row) counted from 1, and every place passed in must lie in the grid unless
// a function says otherwise.
class PlayGrid {
 public:
    std::int16_t gridCols() const { return gridCols_; }
    std::int16_t gridRows() const { return gridRows_; }

    // Sets the board's size, at most 12 columns by 16 rows, and empties every cell.
    void recreate(std::int16_t columns, std::int16_t rows);

    // True when 1 <= column <= gridCols and 1 <= row <= gridRows; any place may be asked for.
    bool isInGrid(CellPosition place) const;

    const GridCell& at(CellPosition place) const { return cells_[index(place)]; }
    GridCell& at(CellPosition place) { return cells_[index(place)]; }

    // Finds the cluster at an occupied place, the cells reached through orthogonal neighbours of the same
    // colour, and says whether it has at least `minimum` cells. The marks stay for removeMarked until the
    // next search; noMovesLeft searches too.
    bool clusterAtLeast(CellPosition place, std::int16_t minimum);

    // Empties the cells of the cluster found last and returns how many there were.
    std::int16_t removeMarked();

    // Moves every occupied cell as far as it can go in the direction.
    void dropBlocks(Direction direction);

    // Closes empty columns toward the middle, after the blocks have fallen; true when any column moved.
    bool closeColumns();

    // True when no occupied cell belongs to a cluster of two or more. Destroys the marks.
    bool noMovesLeft();

    // Moves every row up by one, losing row 1, and copies the given row (gridCols cells) into the bottom row.
    void pushRowFromBottom(const GridRow& row);

    bool isTopRowOccupied() const;

    // True when every cell above the given one is empty or a stone.
    bool isStoneExposed(CellPosition place) const;

    // Empties every cell of the colour: blocks, bombs and stones alike.
    void clearColour(std::int16_t colour);

    // Calls visit(CellPosition, GridCell&) for every cell, row by row from the top, each from the left.
    template <typename Visit>
    void forEachCell(Visit visit) {
        visitCells(*this, visit);
    }
    template <typename Visit>
    void forEachCell(Visit visit) const {
        visitCells(*this, visit);
    }

 private:
    static constexpr std::size_t cellCount = std::size_t{maxGridCols} * maxGridRows;
    static constexpr std::int16_t markValue = 100;  // greater than any colour

    template <typename Grid, typename Visit>
    static void visitCells(Grid& grid, Visit& visit) {
        for (std::int16_t row = 1; row <= grid.gridRows_; ++row) {
            for (std::int16_t column = 1; column <= grid.gridCols_; ++column)
                visit(CellPosition{column, row}, grid.at({column, row}));
        }
    }
    std::size_t index(CellPosition place) const;
    CellPosition neighbour(CellPosition place, Direction direction) const;
    void resetMarks();
    std::int16_t markCluster(CellPosition start);
    bool isColumnEmpty(std::int16_t column) const;
    void shiftColumn(std::int16_t column, std::int16_t delta);
    bool shiftIfBesideGap(std::int16_t column, std::int16_t delta);

    std::int16_t gridCols_ = 0;
    std::int16_t gridRows_ = 0;
    std::array<GridCell, cellCount> cells_{};
    std::array<std::uint8_t, cellCount> clusterMarks_{};
    std::array<CellPosition, cellCount> clusterStack_{};  // a cell is pushed at most once a search
};

}  // namespace quabble
