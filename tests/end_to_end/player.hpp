#pragma once

#include "../engine/rules_model.hpp"

namespace quabble {

// A place on a board and the size of the cluster that it belongs to.
struct Choice {
    model::Place place;
    int size = 0;
};

// A plain block of the largest cluster; its size is 0 when there is none.
inline Choice choose(const model::Board& board) {
    Choice best;
    model::Places seen;
    for (const auto& [place, letter] : board) {
        if (letter > '4' || seen.contains(place))
            continue;
        const model::Places cluster = model::cluster(board, place);
        seen.insert(cluster.begin(), cluster.end());
        if (std::ssize(cluster) > best.size)
            best = {place, static_cast<int>(cluster.size())};
    }
    return best;
}

}  // namespace quabble
