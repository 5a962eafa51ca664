#include "engine/play_grid.hpp"

#include <algorithm>
#include <cassert>

#include "base/round_half_even.hpp"

namespace quabble {

void PlayGrid::recreate(std::int16_t columns, std::int16_t rows) {
    assert(columns >= 1 && columns <= maxGridCols && rows >= 1 && rows <= maxGridRows);
    gridCols_ = columns;
    gridRows_ = rows;
    cells_.fill(GridCell{});
}

bool PlayGrid::isInGrid(CellPosition place) const {
    return place.column >= 1 && place.column <= gridCols_ && place.row >= 1 && place.row <= gridRows_;
}

std::size_t PlayGrid::index(CellPosition place) const {
    assert(isInGrid(place));
    const auto row = static_cast<std::size_t>(place.row - 1);
    return row * maxGridCols + static_cast<std::size_t>(place.column - 1);
}

CellPosition PlayGrid::neighbour(CellPosition place, Direction direction) const {
    const auto step = static_cast<std::size_t>(direction) - 1;
    return {static_cast<std::int16_t>(place.column + dirCol[step]),
            static_cast<std::int16_t>(place.row + dirRow[step])};
}

bool PlayGrid::clusterAtLeast(CellPosition place, std::int16_t minimum) {
    resetMarks();
    return markCluster(place) >= minimum;
}

void PlayGrid::resetMarks() {
    for (std::size_t i = 0; i < cellCount; ++i)
        clusterMarks_[i] = static_cast<std::uint8_t>(cells_[i].colour);
}

std::int16_t PlayGrid::markCluster(CellPosition start) {
    const std::int16_t colour = at(start).colour;
    assert(colour != 0);
    std::int16_t size = 1;
    std::size_t top = 0;
    clusterMarks_[index(start)] = markValue;
    clusterStack_[top++] = start;
    while (top > 0) {
        const CellPosition place = clusterStack_[--top];
        for (std::size_t direction = 1; direction <= dirCol.size(); ++direction) {
            const CellPosition next = neighbour(place, static_cast<Direction>(direction));
            if (!isInGrid(next) || clusterMarks_[index(next)] == markValue || at(next).colour != colour)
                continue;
            clusterMarks_[index(next)] = markValue;
            clusterStack_[top++] = next;
            ++size;
        }
    }
    return size;
}

std::int16_t PlayGrid::removeMarked() {
    std::int16_t removed = 0;
    forEachCell([&](CellPosition place, GridCell& cell) {
        if (clusterMarks_[index(place)] != markValue)
            return;
        cell = GridCell{};
        ++removed;
    });
    return removed;
}

void PlayGrid::dropBlocks(Direction direction) {
    bool moved = true;
    while (moved) {
        moved = false;
        for (std::int16_t row = gridRows_; row >= 1; --row) {
            for (std::int16_t column = gridCols_; column >= 1; --column) {
                const CellPosition place{column, row};
                const CellPosition next = neighbour(place, direction);
                if (at(place).isEmpty() || !isInGrid(next) || !at(next).isEmpty())
                    continue;
                at(next) = at(place);
                at(place) = GridCell{};
                moved = true;
            }
        }
    }
}

bool PlayGrid::closeColumns() {
    const auto lastLeft = static_cast<std::int16_t>(roundHalfEven(gridCols_ / 2.0 - 1));
    const auto firstRight = static_cast<std::int16_t>(roundHalfEven(gridCols_ / 2.0 + 1));
    bool anyMoved = false;
    bool rightMoved = true;
    while (rightMoved) {
        bool leftMoved = true;
        while (leftMoved) {
            leftMoved = false;
            for (std::int16_t column = 1; column <= lastLeft; ++column)
                leftMoved |= shiftIfBesideGap(column, +1);
            anyMoved |= leftMoved;
        }
        rightMoved = false;
        for (std::int16_t column = firstRight; column <= gridCols_; ++column)
            rightMoved |= shiftIfBesideGap(column, -1);
        anyMoved |= rightMoved;
    }
    return anyMoved;
}

bool PlayGrid::shiftIfBesideGap(std::int16_t column, std::int16_t delta) {
    if (isColumnEmpty(column) || !isColumnEmpty(static_cast<std::int16_t>(column + delta)))
        return false;
    shiftColumn(column, delta);
    return true;
}

// The blocks have fallen: a column is empty exactly when its bottom cell is.
bool PlayGrid::isColumnEmpty(std::int16_t column) const {
    return at({column, gridRows_}).isEmpty();
}

void PlayGrid::shiftColumn(std::int16_t column, std::int16_t delta) {
    for (std::int16_t row = 1; row <= gridRows_; ++row) {
        at({static_cast<std::int16_t>(column + delta), row}) = at({column, row});
        at({column, row}) = GridCell{};
    }
}

bool PlayGrid::noMovesLeft() {
    for (std::int16_t row = 1; row <= gridRows_; ++row) {
        for (std::int16_t column = 1; column <= gridCols_; ++column) {
            if (!at({column, row}).isEmpty() && clusterAtLeast({column, row}, 2))
                return false;
        }
    }
    return true;
}

void PlayGrid::pushRowFromBottom(const GridRow& row) {
    assert(row.size() == static_cast<std::size_t>(gridCols_));
    std::copy(cells_.begin() + maxGridCols, cells_.begin() + std::ptrdiff_t{maxGridCols} * gridRows_,
              cells_.begin());
    std::ranges::copy(row, &at({1, gridRows_}));
}

bool PlayGrid::isTopRowOccupied() const {
    return std::any_of(cells_.begin(), cells_.begin() + gridCols_,
                       [](const GridCell& cell) { return !cell.isEmpty(); });
}

bool PlayGrid::isStoneExposed(CellPosition place) const {
    for (auto row = static_cast<std::int16_t>(place.row - 1); row >= 1; --row) {
        const GridCell& above = at({place.column, row});
        if (!above.isEmpty() && above.kind != CellKind::Stone)
            return false;
    }
    return true;
}

void PlayGrid::clearColour(std::int16_t colour) {
    forEachCell([&](CellPosition, GridCell& cell) {
        if (cell.colour == colour)
            cell = GridCell{};
    });
}

}  // namespace quabble
