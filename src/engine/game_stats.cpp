#include "engine/game_stats.hpp"

#include <algorithm>

namespace quabble {

std::int32_t pointsFor(std::int32_t clusterSize) {
    return clusterSize * (clusterSize + 1) / 2;
}

void accountMove(GameStats& stats, std::int32_t clusterSize) {
    stats.score += pointsFor(clusterSize);
    stats.blocksCleared += clusterSize;
    stats.largestCluster = std::max(stats.largestCluster, clusterSize);
}

}  // namespace quabble
