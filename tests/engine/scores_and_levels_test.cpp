#include <gtest/gtest.h>

#include <numeric>

#include "engine/high_scores.hpp"
#include "engine/level_table.hpp"

namespace quabble {
namespace {

TEST(HighScores, AScoreRanksBelowItsEqualsAndMovesTheRestDown) {
    struct Case {
        std::int32_t score;
        std::int16_t place;
        std::array<std::int32_t, 8> scores;
        std::string names;
    };
    for (const Case& c : {Case{900, 1, {900, 500, 400, 300, 200, 100, 30, 20}, "*abcdefg"},
                          {300, 4, {500, 400, 300, 300, 200, 100, 30, 20}, "abc*defg"},
                          {11, 8, {500, 400, 300, 200, 100, 30, 20, 11}, "abcdefg*"}}) {
        HighScores highScores;
        HighScoreTable& table = highScores.table(2);
        table = {{500, 400, 300, 200, 100, 30, 20, 10}, {"a", "b", "c", "d", "e", "f", "g", "h"}};
        EXPECT_EQ(highScores.rankOf(2, c.score), c.place);
        EXPECT_EQ(highScores.rankOf(2, 10), 9);
        highScores.insertHighScore(2, c.score, "*");
        EXPECT_EQ(table.scores, c.scores);
        EXPECT_EQ(std::accumulate(table.names.begin(), table.names.end(), std::string()), c.names);
        EXPECT_EQ(highScores.table(1).scores[0] + highScores.table(3).scores[0], 0);
    }
}

TEST(LevelTable, HoldsTheTenLevels) {
    // The first rows, the colours, a row's and a tick's milliseconds, and the rows to complete.
    using Level = std::array<int, 5>;
    const Level levels[] = {{4, 3, 3000, 250, 48}, {5, 3, 2000, 167, 51}, {6, 4, 3000, 250, 54},
                            {6, 4, 2300, 192, 57}, {6, 4, 3000, 250, 60}, {7, 4, 2500, 208, 63},
                            {8, 4, 2000, 167, 66}, {8, 4, 1800, 150, 69}, {8, 4, 1500, 125, 72},
                            {9, 4, 1200, 100, 75}};
    std::int16_t number = 0;
    for (const Level& level : levels) {
        const LevelTable table;
        const ArcadeLevelSpec& entry = table[++number];
        EXPECT_EQ((Level{entry.startRows, entry.colourCount, entry.rowPeriod, entry.tickInterval(),
                         entry.rowsToComplete}),
                  level)
            << number;
    }
}

}  // namespace
}  // namespace quabble
