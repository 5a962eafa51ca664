#pragma once

#include <algorithm>
#include <iterator>
#include <string>
#include <string_view>

#include "engine/play_grid.hpp"

namespace quabble {

// Boards as text, each cell by the letter of its tile: '.' is an empty cell, '1' to '4' a block, 'S' a stone
// and 's' one that is let go, 'a' to 'c' a bomb of colour 1 to 3, 'W' to 'Z' an explosion. The rows stand
// from the top down with a '/' between them. The last is the bottom row: rows left out at the top are empty,
// and so are cells left out at the right end of a row.
constexpr std::string_view tileLetters = ".1234SsabcWXYZ";

inline GridCell cellOf(char letter) {
    const auto tile = static_cast<std::int16_t>(tileLetters.find(letter));
    const auto kind = tile > 6 ? CellKind::Bomb : tile == 5 ? CellKind::Stone : CellKind::Block;
    return {kind, static_cast<std::int16_t>(tile > 6 ? tile - 6 : tile), tile, 0};
}

// '?' for a cell that differs from all of them in any field.
inline char letterOf(const GridCell& cell) {
    const char letter = tileLetters.at(static_cast<std::size_t>(cell.tile));
    return cell == cellOf(letter) ? letter : '?';
}

inline GridRow gridRow(std::string_view text) {
    GridRow row(maxGridCols);
    std::ranges::transform(text, row.begin(), cellOf);
    return row;
}

// A board of 12 x 16.
inline PlayGrid board(std::string_view text) {
    PlayGrid grid;
    grid.recreate(maxGridCols, maxGridRows);
    auto row = static_cast<std::int16_t>(maxGridRows - std::ranges::count(text, '/'));
    std::int16_t column = 1;
    for (const char letter : text) {
        if (letter == '/')
            ++row, column = 1;
        else
            grid.at({column++, row}) = cellOf(letter);
    }
    return grid;
}

// The text of letters that stand for all the cells, 12 a row.
inline std::string boardText(std::string_view letters) {
    std::string text;
    for (std::size_t i = 0; i < letters.size(); i += maxGridCols) {
        const std::string_view row = letters.substr(i, maxGridCols);
        text += text.empty() ? "" : "/";
        text += row.substr(0, row.find_last_not_of('.') + 1);
    }
    return text;
}

inline std::string lettersOf(const PlayGrid& grid) {
    std::string letters;
    grid.forEachCell([&](CellPosition, const GridCell& cell) { letters += letterOf(cell); });
    return letters;
}

inline std::string show(const PlayGrid& grid) {
    return boardText(lettersOf(grid));
}

inline std::string show(const GridRow& row) {
    std::string letters;
    std::ranges::transform(row, std::back_inserter(letters), letterOf);
    return boardText(letters);
}

// The text of a board whose lowest rows hold one letter.
inline std::string fullRows(int count, char letter) {
    return boardText(std::string(static_cast<std::size_t>(count * maxGridCols), letter));
}

}  // namespace quabble
