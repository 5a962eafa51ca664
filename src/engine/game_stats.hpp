#pragma once

#include <cstdint>

namespace quabble {

enum class GameMode : std::int16_t { None = 0, Training = 1, Timed = 2, Strategy = 3 };

// The numbers of a game. They keep their last values after its end, until the next game starts.
struct GameStats {
    std::int32_t score = 0;
    std::int32_t blocksCleared = 0;   // by clusters, in the current classic game or arcade level
    std::int32_t largestCluster = 0;  // likewise
    // 1 in a classic game; 1 to 10, and 11 once all are done, in an arcade game; 0 before the first.
    std::int16_t level = 0;
    std::int32_t bestScore = 0;  // the mode's best score when the game started

    friend bool operator==(const GameStats&, const GameStats&) = default;
};

// The points for a cluster of n cells: n (n + 1) / 2.
std::int32_t pointsFor(std::int32_t clusterSize);

// Adds a removed cluster to the numbers.
void accountMove(GameStats& stats, std::int32_t clusterSize);

}  // namespace quabble
