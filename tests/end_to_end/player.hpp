#pragma once

#include <array>
#include <optional>
#include <utility>
#include <vector>

namespace quabble {

// The tile numbers of a board as they are seen, row by row from the top.
using SeenBoard = std::array<std::array<int, 12>, 16>;

// A cell, counted from 0, and how many others of its colour hang together with it.
struct Choice {
    int column = 0;
    int row = 0;
    int size = 0;
};

// The largest cluster of plain blocks with at least `smallest` cells, or nothing. Bombs count to a cluster of
// their colour.
inline std::optional<Choice> choose(const SeenBoard& board, int smallest) {
    const auto colourAt = [&](int column, int row) {
        const int tile = board[static_cast<std::size_t>(row)][static_cast<std::size_t>(column)];
        return tile >= 7 && tile <= 9 ? tile - 6 : tile;
    };
    std::array<std::array<bool, 12>, 16> visited{};
    std::optional<Choice> best;
    for (int row = 15; row >= 0; --row) {
        for (int column = 0; column < 12; ++column) {
            const int tile = board[static_cast<std::size_t>(row)][static_cast<std::size_t>(column)];
            if (tile < 1 || tile > 4 ||
                visited[static_cast<std::size_t>(row)][static_cast<std::size_t>(column)])
                continue;
            std::vector<std::pair<int, int>> open{{column, row}};
            int size = 0;
            while (!open.empty()) {
                const auto [c, r] = open.back();
                open.pop_back();
                if (c < 0 || c > 11 || r < 0 || r > 15 || colourAt(c, r) != tile)
                    continue;
                bool& seen = visited[static_cast<std::size_t>(r)][static_cast<std::size_t>(c)];
                if (std::exchange(seen, true))
                    continue;
                ++size;
                open.insert(open.end(), {{c + 1, r}, {c - 1, r}, {c, r + 1}, {c, r - 1}});
            }
            if (size >= smallest && (!best || size > best->size))
                best = Choice{column, row, size};
        }
    }
    return best;
}

}  // namespace quabble
