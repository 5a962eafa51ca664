#pragma once

#include <stdexcept>
#include <string>
#include <string_view>

#include "engine/grid_cell.hpp"
#include "engine/play_grid.hpp"

namespace quabble {

// Boards as text: '.' is an empty cell, '1' to '4' a block, 'a' to 'c' a bomb of colour 1 to 3, 'S' a stone.
// The rows stand from the top down with a '/' between them. The last is the bottom row: rows left out at the
// top are empty, and so are cells left out at the right end of a row.

constexpr std::string_view cellLetters = ".1234abcS";
constexpr GridCell lettersCells[] = {{},
                                     {CellKind::Block, 1, 1, 0},
                                     {CellKind::Block, 2, 2, 0},
                                     {CellKind::Block, 3, 3, 0},
                                     {CellKind::Block, 4, 4, 0},
                                     {CellKind::Bomb, 1, 7, 0},
                                     {CellKind::Bomb, 2, 8, 0},
                                     {CellKind::Bomb, 3, 9, 0},
                                     {CellKind::Stone, 5, 5, 0}};

inline GridCell cellOf(char letter) {
    const std::size_t found = cellLetters.find(letter);
    if (found == std::string_view::npos)
        throw std::invalid_argument(std::string("not a cell: ") + letter);
    return lettersCells[found];
}

// '?' for a cell that differs from all of them in any field.
inline char letterOf(const GridCell& cell) {
    for (std::size_t i = 0; i < cellLetters.size(); ++i) {
        if (lettersCells[i] == cell)
            return cellLetters[i];
    }
    return '?';
}

inline GridRow gridRow(std::string_view text) {
    GridRow row(maxGridCols);
    for (std::size_t i = 0; i < text.size(); ++i)
        row.at(i) = cellOf(text[i]);
    return row;
}

// A board of 12 x 16.
inline PlayGrid board(std::string_view text) {
    PlayGrid grid;
    grid.recreate(maxGridCols, maxGridRows);
    for (std::int16_t row = maxGridRows;; --row) {
        const std::size_t slash = text.rfind('/');
        std::int16_t column = 1;
        for (const GridCell& cell : gridRow(slash == std::string_view::npos ? text : text.substr(slash + 1)))
            grid.at({column++, row}) = cell;
        if (slash == std::string_view::npos)
            return grid;
        text = text.substr(0, slash);
    }
}

inline std::string show(const GridRow& row) {
    std::string text;
    for (const GridCell& cell : row)
        text += letterOf(cell);
    return text.substr(0, text.find_last_not_of('.') + 1);
}

inline std::string show(const PlayGrid& grid) {
    std::string text;
    for (std::int16_t row = 1; row <= grid.gridRows(); ++row) {
        GridRow cells;
        for (std::int16_t column = 1; column <= grid.gridCols(); ++column)
            cells.push_back(grid.at({column, row}));
        const std::string line = show(cells);
        text += text.empty() ? line : "/" + line;
    }
    return text;
}

// The text of a board whose lowest rows hold one letter.
inline std::string fullRows(int count, char letter) {
    std::string text(maxGridCols, letter);
    for (int i = 1; i < count; ++i)
        text += "/" + std::string(maxGridCols, letter);
    return text;
}

}  // namespace quabble
