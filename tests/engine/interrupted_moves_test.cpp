#include <span>

#include "game_fixture.hpp"

namespace quabble {
namespace {

// What the player does while a move lets the messages run: before the blocks fall (the first chance) and once
// columns have closed (the second).
class InterruptedMoves : public GameFixture {
 protected:
    // Carries out the move of this board with something done at one of its chances.
    std::string moveWith(std::vector<Action> actions, int chance) {
        stage.inMessages = {std::move(actions)};
        if (chance == 2)
            stage.inMessages.push_front({});
        run(click(cluster));
        stage.inMessages.clear();
        return stage.takeLines();
    }

    static constexpr const char* rows = "....3/...13/..211332";
    static constexpr CellPosition cluster{4, 15};
    const std::string toFirst =
        "board=....3/....3/..2..332 score=6 points=6@4,15 present pause=125 messages ";
    const std::string toSecond = toFirst + "board=....3/..2.3332 present pause=125 messages ";
    const std::string closed = "board=....3/...23332 present";

    // The same with column 12 up to the top row.
    void playFull(GameMode mode) {
        play(mode, std::string(rows) + "...4");
        fillColumn(12, 1);
    }

    static constexpr std::pair<GameMode, int> moves[] = {{GameMode::Timed, 1},    {GameMode::Timed, 2},
                                                         {GameMode::Strategy, 1}, {GameMode::Strategy, 2},
                                                         {GameMode::Training, 1}, {GameMode::Training, 2}};
};

TEST_F(InterruptedMoves, DropClicksOnTheBoardAndTicks) {
    for (const auto& [mode, chance] : moves) {
        play(mode, rows);
        const std::string undisturbed = moveWith({}, chance);
        play(mode, rows);
        state.tickCount = 11;
        EXPECT_EQ(moveWith({clickCell({6, 16}), tick, clickCell({5, 14})}, chance), undisturbed);
        EXPECT_EQ(state.tickCount, mode == GameMode::Strategy ? 0 : 11);
    }
}

TEST_F(InterruptedMoves, EndGameActsOnceAfterThem) {
    for (const auto& [mode, chance] : moves) {
        play(mode, rows);
        EXPECT_TRUE(
            moveWith({endGame, endGame}, chance)
                .ends_with(lines(closed + " timer=off result:1,6,3,3 " + named() + "timer=off menu")));
        EXPECT_TRUE(isAtMenu());
        play(mode, rows);
        moveWith({}, chance);
        EXPECT_TRUE(state.isGameActive()) << "the wish to end the game before is still remembered";
    }
    play(GameMode::Training, ".....11");
    stage.inMessages = {{endGame}};
    run(click({6, 16}));
    EXPECT_EQ(countOf("result:", stage.takeLines()), 1) << "the last move ends the game as well";
}

TEST_F(InterruptedMoves, GoOnWithTheBoardMovedUpByTheStrip) {
    const std::string pushed = "/123123123123 strip=0:222222222222 present ";
    play(GameMode::Timed, rows);
    EXPECT_EQ(moveWith({clickStrip}, 1), lines(toFirst + "gauge=2.08333 board=....3/....3/..2..332" + pushed +
                                               "board=....3/..2.3332/123123123123 present"));
    play(GameMode::Timed, rows);
    EXPECT_EQ(moveWith({clickStrip}, 2), lines(toSecond + "gauge=2.08333 board=....3/...23332" + pushed +
                                               "board=....3/...23332/123123123123 present"));
    play(GameMode::Strategy, rows);
    EXPECT_TRUE(moveWith({clickStrip}, 1)
                    .ends_with(lines("pause=100 gauge=4.16667 board=....3/..2.3332/123123123123/222222222222 "
                                     "strip=0:222222222222 present")));
    EXPECT_FALSE(state.boolProcessing);
}

TEST_F(InterruptedMoves, GiveUpWhenTheStripEndsTheLevelOrTheGame) {
    for (const auto& [mode, chance] : std::span(moves).first(4)) {
        play(mode, rows);
        skipToLastRowOf(1);
        EXPECT_TRUE(moveWith({clickStrip}, chance).ends_with(lines("gauge=0 level=2 present present")));
        EXPECT_EQ(show(state.grid), fullRows(5, '2'));
        EXPECT_EQ(state.rowsEntered, 0);
        EXPECT_TRUE(state.arcadeActive);
        EXPECT_FALSE(state.boolProcessing);
        play(mode, rows);
        skipToLastRowOf(10);
        EXPECT_TRUE(moveWith({clickStrip}, chance)
                        .ends_with(lines("result:11,6,0,0 " + named() + "timer=off menu present")));
        EXPECT_TRUE(isAtMenu());
        playFull(mode);
        EXPECT_TRUE(
            moveWith({clickStrip}, chance).ends_with(lines("result:1,6,3,3 " + named() + "timer=off menu")));
        EXPECT_TRUE(isAtMenu());
    }
}

TEST_F(InterruptedMoves, LeaveAGameStartedMeanwhileAlone) {
    for (const GameMode mode : {GameMode::Training, GameMode::Timed, GameMode::Strategy}) {
        playFull(GameMode::Strategy);
        const std::string recorded = moveWith({clickStrip, startGame(mode)}, 1);
        EXPECT_EQ(countOf("result:", recorded), 1);
        const std::string lastOfStart = mode == GameMode::Training ? "present present" : "level=1 present";
        EXPECT_TRUE(recorded.ends_with(lines(lastOfStart))) << recorded;
        EXPECT_EQ(show(state.grid), fullRows(mode == GameMode::Training ? 16 : 4, '2'));
        EXPECT_EQ(state.stats.score + state.rowsEntered, 0);
        EXPECT_FALSE(state.boolProcessing);

        state.grid = board(rows);
        moveWith({}, 1);
        EXPECT_EQ(state.stats.score, 6);
        EXPECT_TRUE(state.isGameActive());
    }
}

TEST_F(InterruptedMoves, BringNoRowOnceTheGameIsToEnd) {
    for (const std::int16_t level : {std::int16_t{1}, lastLevel}) {
        play(GameMode::Strategy, rows);
        skipToLastRowOf(level);
        EXPECT_TRUE(moveWith({endGame, clickStrip}, 1)
                        .ends_with(lines(closed + " timer=off result:" + std::to_string(level) + ",6,3,3 " +
                                         named() + "timer=off menu")));
        play(GameMode::Strategy, rows);
        skipToLastRowOf(level);
        const std::string recorded = moveWith({clickStrip, endGame}, 1);
        for (const std::string once : {"completed:", "result:", "menu"})
            EXPECT_EQ(countOf(once, recorded), 1) << recorded;
        EXPECT_TRUE(isAtMenu());
    }
}

}  // namespace
}  // namespace quabble
