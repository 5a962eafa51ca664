#include <gtest/gtest.h>

#include "engine/game_stats.hpp"
#include "engine/high_scores.hpp"
#include "engine/level_table.hpp"

namespace quabble {
namespace {

TEST(GameStats, MovesAddUp) {
    for (const auto& [size, points] : {std::pair{2, 3}, {3, 6}, {4, 10}, {5, 15}, {12, 78}, {192, 18528}})
        EXPECT_EQ(pointsFor(size), points);
    GameStats stats;
    for (const std::int32_t size : {4, 7, 2})
        accountMove(stats, size);
    EXPECT_EQ(stats.score, 41);
    EXPECT_EQ(stats.blocksCleared, 13);
    EXPECT_EQ(stats.largestCluster, 7);
}

TEST(HighScores, AScoreRanksBelowItsEqualsAndMovesTheRestDown) {
    using Scores = std::array<std::int32_t, 8>;
    using Names = std::array<std::string, 8>;
    const Scores before{500, 400, 300, 200, 100, 0, 0, 0};
    struct Case {
        std::int32_t score;
        std::int16_t place;
        Scores scores;
        Names names;
    };
    const Case cases[] = {
        {300, 4, {500, 400, 300, 300, 200, 100, 0, 0}, {"a", "b", "c", "new", "d", "e", "f", "g"}},
        {900, 1, {900, 500, 400, 300, 200, 100, 0, 0}, {"new", "a", "b", "c", "d", "e", "f", "g"}},
        {50, 6, {500, 400, 300, 200, 100, 50, 0, 0}, {"a", "b", "c", "d", "e", "new", "f", "g"}},
    };
    for (const Case& c : cases) {
        HighScores highScores;
        highScores.table(2) = {before, {"a", "b", "c", "d", "e", "f", "g", "h"}};
        EXPECT_EQ(highScores.rankOf(2, c.score), c.place);
        EXPECT_EQ(highScores.rankOf(2, 0), 9);
        highScores.insertHighScore(2, c.score, "new");
        EXPECT_EQ(highScores.table(2).scores, c.scores);
        EXPECT_EQ(highScores.table(2).names, c.names);
        EXPECT_EQ(highScores.table(1).scores, Scores{});
        EXPECT_EQ(highScores.table(3).scores, Scores{});
    }
    HighScores full;
    full.table(1).scores = {80, 70, 60, 50, 40, 30, 20, 10};
    EXPECT_EQ(full.rankOf(1, 11), 8);
    EXPECT_EQ(full.rankOf(1, 10), 9);
    full.insertHighScore(1, 11, "");
    EXPECT_EQ(full.table(1).scores, (Scores{80, 70, 60, 50, 40, 30, 20, 11}));
}

TEST(LevelTable, HoldsTheTenLevels) {
    struct Level {
        std::int16_t startRows, colourCount, rowPeriod;
        std::int32_t rowsToComplete, tickInterval;
    };
    const Level levels[] = {{4, 3, 3000, 48, 250}, {5, 3, 2000, 51, 167}, {6, 4, 3000, 54, 250},
                            {6, 4, 2300, 57, 192}, {6, 4, 3000, 60, 250}, {7, 4, 2500, 63, 208},
                            {8, 4, 2000, 66, 167}, {8, 4, 1800, 69, 150}, {8, 4, 1500, 72, 125},
                            {9, 4, 1200, 75, 100}};
    const LevelTable table;
    std::int16_t number = 0;
    for (const Level& level : levels) {
        const ArcadeLevelSpec& entry = table[++number];
        EXPECT_EQ(entry.startRows, level.startRows) << number;
        EXPECT_EQ(entry.colourCount, level.colourCount) << number;
        EXPECT_EQ(entry.rowPeriod, level.rowPeriod) << number;
        EXPECT_EQ(entry.rowsToComplete, level.rowsToComplete) << number;
        EXPECT_EQ(entry.tickInterval(), level.tickInterval) << number;
    }
}

}  // namespace
}  // namespace quabble
