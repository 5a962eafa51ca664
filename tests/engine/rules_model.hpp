#pragma once

#include <algorithm>
#include <map>
#include <set>
#include <string>
#include <utility>
#include <vector>

#include "board_notation.hpp"
#include "engine/game_stats.hpp"

namespace quabble::model {

// The rules once more, as plainly as they can be said and without a thought for speed, to hold the engine
// against. A board is the letters of its occupied places, (column, row).
using Place = std::pair<int, int>;
using Places = std::set<Place>;
using Board = std::map<Place, char>;

// From 12 letters a row.
inline Board read(std::string_view letters) {
    Board board;
    int i = 0;
    for (const char letter : letters) {
        if (letter != '.')
            board[{i % 12 + 1, i / 12 + 1}] = letter;
        ++i;
    }
    return board;
}

inline Board read(const PlayGrid& grid) {
    return read(lettersOf(grid));
}

inline int colourOf(char letter) {
    if (letter == 'S')
        return 5;
    return letter >= 'a' ? letter - 'a' + 1 : letter - '0';
}

inline void reach(const Board& board, int colour, Place place, Places& reached) {
    if (!board.contains(place) || colourOf(board.at(place)) != colour || !reached.insert(place).second)
        return;
    for (const auto& [x, y] : {Place{0, -1}, {0, 1}, {-1, 0}, {1, 0}})
        reach(board, colour, {place.first + x, place.second + y}, reached);
}

inline Places cluster(const Board& board, Place place) {
    Places reached;
    reach(board, colourOf(board.at(place)), place, reached);
    return reached;
}

inline bool isAnyMoveLeft(const Board& board) {
    return std::any_of(board.begin(), board.end(),
                       [&](const auto& cell) { return cluster(board, cell.first).size() >= 2; });
}

inline Board without(Board board, const Places& places) {
    for (const Place& place : places)
        board.erase(place);
    return board;
}

// From the top of each column, the stones down to the first cell that is none.
inline Places exposedStones(const Board& board) {
    Places exposed;
    int covered = 0;
    for (const auto& [place, letter] : board) {  // column by column, from the top
        if (letter != 'S')
            covered = place.first;
        else if (covered != place.first)
            exposed.insert(place);
    }
    return exposed;
}

// The letters of the columns from the bottom up, whatever gaps lie between them.
using Piles = std::map<int, std::string>;

inline Piles piles(const Board& board) {
    Piles result;
    for (const auto& [place, letter] : board)
        result[place.first].insert(0, 1, letter);
    return result;
}

inline Board stacked(const Piles& piles) {
    Board board;
    for (const auto& [column, letters] : piles) {
        for (std::size_t i = 0; i < letters.size(); ++i)
            board.emplace(Place{column, 16 - static_cast<int>(i)}, letters[i]);
    }
    return board;
}

inline Board fallen(const Board& board) {
    return stacked(piles(board));
}

// The piles side by side: those of the left half reach up to column 6, and the others begin beside them, or
// in column 6 when there are none.
inline Board closed(const Board& board) {
    const Piles before = piles(board);
    const auto left =
        std::count_if(before.begin(), before.end(), [](const auto& pile) { return pile.first <= 6; });
    int column = left == 0 ? 6 : 7 - static_cast<int>(left);
    Piles after;
    for (const auto& pile : before)
        after[column++] = pile.second;
    return stacked(after);
}

inline bool isTopRowOccupied(const Board& board) {
    return std::any_of(board.begin(), board.end(), [](const auto& cell) { return cell.first.second == 1; });
}

// A running game.
struct Game {
    GameMode mode;
    Board board;
    GameStats stats;
    int rowsEntered = 0;
    bool isOver = false;

    // The board of the next level is what follows when a row completes this one.
    void click(Place place, const std::string& nextRow, const Board& nextLevel) {
        if (!board.contains(place) || (board.at(place) == 'S' && mode != GameMode::Training))
            return;
        const char letter = board.at(place);
        const Places reached = cluster(board, place);
        if (mode == GameMode::Training) {
            if (reached.size() >= 2)
                remove(reached);
            isOver = !isAnyMoveLeft(board);
            return;
        }
        const bool isBomb = letter >= 'a';
        if (isBomb) {
            std::erase_if(board, [&](const auto& cell) { return colourOf(cell.second) == colourOf(letter); });
            board = closed(fallen(board));
            release();
        } else if (reached.size() >= 3) {
            remove(reached);
        }
        const bool bringsRow = mode == GameMode::Strategy && (isBomb || reached.size() >= 3);
        if (!bringsRow || push(nextRow, nextLevel))
            release();
    }

    // False when the game has ended.
    bool push(const std::string& nextRow, const Board& nextLevel) {
        isOver = isTopRowOccupied(board);
        if (isOver)
            return false;
        Piles grown = piles(board);
        for (int column = 1; column <= 12; ++column)
            grown[column].insert(0, 1, nextRow.at(static_cast<std::size_t>(column - 1)));
        board = stacked(grown);
        ++rowsEntered;
        if (rowsEntered < 45 + 3 * stats.level)
            return true;
        stats.blocksCleared = stats.largestCluster = 0;
        isOver = stats.level++ == 10;
        if (isOver)
            return false;
        rowsEntered = 0;
        board = nextLevel;
        return true;
    }

 private:
    void remove(const Places& places) {
        const auto size = static_cast<std::int32_t>(places.size());
        for (std::int32_t i = 1; i <= size; ++i)
            stats.score += i;
        stats.blocksCleared += size;
        stats.largestCluster = std::max(stats.largestCluster, size);
        board = closed(fallen(without(board, places)));
    }
    void release() { board = closed(without(board, exposedStones(board))); }
};

}  // namespace quabble::model
