#include "game_fixture.hpp"

namespace quabble {
namespace {

class RowsAndLevels : public GameFixture {};

TEST_F(RowsAndLevels, TwelveTicksOrAClickOnTheStripPushTheRow) {
    play(GameMode::Timed, ".....4");
    for (int i = 1; i <= 11; ++i) {
        run(tick());
        EXPECT_EQ(stage.takeLines(), lines("strip=" + std::to_string(i) + ":123123123123 present"));
    }
    run(tick());
    EXPECT_EQ(stage.takeLines(),
              lines("gauge=2.08333 board=.....4/123123123123 strip=0:222222222222 present"));
    for (int i = 1; i <= 5; ++i)
        run(tick());
    stage.takeLines();
    run(pushRow());
    EXPECT_TRUE(rowAccepted);
    EXPECT_EQ(stage.takeLines(),
              lines("gauge=4.16667 board=.....4/123123123123/222222222222 strip=0:222222222222 present"));
    run(tick());
    EXPECT_EQ(stage.takeLines(), lines("strip=1:222222222222 present"));
    run(game.endGame());
    stage.takeLines();
    run(tick());
    EXPECT_EQ(stage.takeLines(), "");
}

TEST_F(RowsAndLevels, RowIsRefusedOnlyWhileTheTopRowIsOccupied) {
    play(GameMode::Strategy, "...111S");
    fillColumn(7, 2);
    run(click({5, 16}));
    EXPECT_TRUE(state.arcadeActive);
    EXPECT_TRUE(state.grid.isTopRowOccupied());
    EXPECT_TRUE(stage.takeLines().ends_with("present\n"));
    run(pushRow());
    EXPECT_FALSE(rowAccepted);
    EXPECT_EQ(stage.takeLines(), lines("timer=off result:1,6,3,3 " + named() + "timer=off menu"));
    EXPECT_TRUE(isAtMenu());

    play(GameMode::Strategy, "...111SS");
    fillColumn(7, 1);
    run(click({5, 16}));
    EXPECT_TRUE(stage.takeLines().ends_with(
        lines("pause=100 timer=off result:1,6,3,3 " + named() + "timer=off menu")));
    EXPECT_EQ(state.grid.at({7, 16}), GridCell::stone());
    EXPECT_EQ(state.rowsEntered, 0);
    EXPECT_TRUE(isAtMenu());
}

TEST_F(RowsAndLevels, LevelIsCompleteWhenItsLastRowHasEntered) {
    for (const GameMode mode : {GameMode::Timed, GameMode::Strategy}) {
        for (std::int16_t level = 1; level < 10; ++level) {
            play(mode, ".....4");
            skipToLastRowOf(level);
            state.stats = {1000, 30, 7, level, 0};
            state.tickCount = 11;
            run(mode == GameMode::Timed ? tick() : pushRow());
            const ArcadeLevelSpec& next = levelTable[static_cast<std::int16_t>(level + 1)];
            const std::string row = fullRows(1, level < 2 ? '2' : '4');
            const std::string newBoard = fullRows(next.startRows, row[0]);
            EXPECT_EQ(
                stage.takeLines(),
                lines("gauge=100 board=.....4/123123123123 strip=0:" + fullRows(1, level < 3 ? '2' : '4') +
                      " timer=off present completed:" + std::to_string(level) + ",1000,30,7 " +
                      (mode == GameMode::Timed
                           ? "interval=" + std::to_string(next.tickInterval()) + " timer=on"
                           : "timer=off") +
                      " play-panel board=" + newBoard + " strip=0:" + row +
                      " gauge=0 level=" + std::to_string(level + 1) + " present present"));
            EXPECT_EQ(state.stats.score, 1000);
            EXPECT_EQ(state.stats.blocksCleared + state.stats.largestCluster + state.rowsEntered, 0);
            EXPECT_TRUE(state.arcadeActive);
        }
    }
}

TEST_F(RowsAndLevels, NothingIsReleasedOnTheBoardOfAWonGame) {
    play(GameMode::Strategy, "....111S");
    skipToLastRowOf(lastLevel);
    run(click({5, 16}));
    EXPECT_TRUE(stage.takeLines().ends_with(lines("result:11,6,0,0 " + named() + "timer=off menu present")));
    EXPECT_TRUE(isAtMenu());
}

TEST_F(RowsAndLevels, EndGameActsAtOnceAndNothingReachesTheGameBehindTheResult) {
    for (const GameMode mode : {GameMode::Training, GameMode::Timed, GameMode::Strategy}) {
        play(mode, ".....1112S");
        stage.inDialogs = {{endGame, clickCell({6, 16}), clickCell({9, 16}), tick}};
        run(game.endGame());
        run(game.endGame());
        run(click({6, 16}));
        EXPECT_EQ(stage.takeLines(), lines("timer=off result:1,0,0,0 timer=off menu"));
        EXPECT_TRUE(isAtMenu());
    }
}

}  // namespace
}  // namespace quabble
