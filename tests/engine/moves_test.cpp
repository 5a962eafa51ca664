#include "game_fixture.hpp"

namespace quabble {
namespace {

class Moves : public GameFixture {
 protected:
    // Clicks a cell of a board and compares what that brings.
    void expectClick(const char* name, GameMode mode, const char* rows, CellPosition place,
                     const std::string& expected) {
        play(mode, rows);
        run(click(place));
        EXPECT_EQ(stage.takeLines(), lines(expected)) << name;
        EXPECT_EQ(state.mainMenuActive, expected.ends_with("menu")) << name;
        EXPECT_EQ(state.rowsEntered, countOf("gauge", expected)) << name;
        EXPECT_FALSE(state.boolProcessing) << name;
    }
};

TEST_F(Moves, EveryGameStartsClean) {
    struct Case {
        GameMode mode;
        std::int32_t bestScore;
        int rows;
        std::string before, after;
    };
    const std::string strip = " strip=0:222222222222 gauge=0 level=1 present";
    const Case cases[] = {
        {GameMode::Training, 60, 16, "clear classic-panel play-panel ", " present present"},
        {GameMode::Timed, 70, 4, "timer=on clear arcade-panel interval=250 timer=on play-panel ", strip},
        {GameMode::Strategy, 80, 4, "timer=on clear arcade-panel timer=off play-panel ", strip}};
    for (int i = 0; i < 2; ++i) {
        for (const Case& c : cases) {
            const auto table = static_cast<std::int16_t>(c.mode);
            highScores = {};
            highScores.insertHighScore(table, c.bestScore, "");
            random.drawn = 0;
            start(c.mode);
            EXPECT_EQ(stage.takeLines(), lines(c.before + "board=" + fullRows(c.rows, '2') + c.after));
            EXPECT_EQ(show(state.nextRow), fullRows(1, '2'));
            EXPECT_EQ(random.drawn, 2 * 12 * c.rows);
            const bool isTraining = c.mode == GameMode::Training;
            EXPECT_EQ(state.classicActive, isTraining);
            EXPECT_EQ(state.arcadeActive, !isTraining);
            EXPECT_FALSE(state.mainMenuActive);
            EXPECT_EQ(state.stats, (GameStats{.level = 1, .bestScore = c.bestScore}));

            run(click({12, 16}));
            EXPECT_EQ(state.stats.score, 12 * c.rows * (12 * c.rows + 1) / 2);
            EXPECT_EQ(state.stats.bestScore, c.bestScore);
            run(game.endGame());
            EXPECT_TRUE(isAtMenu());
            EXPECT_EQ(highScores.table(table).names[0], "Player");
            EXPECT_EQ(highScores.table(table).scores[1], c.bestScore);
            stage.takeLines();
        }
    }
}

TEST_F(Moves, ClustersGoStepByStep) {
    expectClick("nothing to close", GameMode::Training, "....31/....11/221222332211", {6, 14},
                "score=6 board=....3//221222332211 points=6@6,14 present pause=250 messages "
                "board=....3/221222332211 points=6@6,14 present board=....3/221222332211 present");
    expectClick("columns to close", GameMode::Training, "....3/...13/..211332", {4, 15},
                "score=6 board=....3/....3/..2..332 points=6@4,15 present pause=250 messages "
                "board=....3/..2.3332 points=6@4,15 present messages pause=250 messages board=....3/...23332 "
                "present");
    expectClick("nothing left", GameMode::Training, ".....11", {7, 16},
                "score=3 board= points=3@7,16 present pause=250 messages board= points=3@7,16 present board= "
                "present timer=off result:1,3,2,2 name? scores:1 timer=off menu");
    expectClick(
        "a single block left", GameMode::Training, ".....112", {6, 16},
        "score=3 board=.......2 points=3@6,16 present pause=250 messages board=.......2 points=3@6,16 "
        "present messages pause=250 messages board=.....2 present timer=off result:1,3,2,2 name? scores:1 "
        "timer=off "
        "menu");
    expectClick("nothing to close", GameMode::Timed, "....31/....11/221222332211", {6, 14},
                "board=....3//221222332211 score=6 points=6@6,14 present pause=125 messages "
                "board=....3/221222332211 present");
    expectClick("columns to close", GameMode::Timed, "....3/...13/..211332", {4, 15},
                "board=....3/....3/..2..332 score=6 points=6@4,15 present pause=125 messages "
                "board=....3/..2.3332 present pause=125 messages board=....3/...23332 present");
    expectClick("a bomb goes unexploded", GameMode::Timed, "....1a1/....1332", {5, 16},
                "board=.....332 score=10 points=10@5,16 present pause=125 messages board=.....332 present");
    expectClick("nothing left", GameMode::Timed, ".....111", {7, 16},
                "board= score=6 points=6@7,16 present pause=125 messages board= present");
    expectClick("stones are released", GameMode::Timed, ".....1/.....1/.....1/.....S42", {6, 13},
                "board=.....S42 score=6 points=6@6,13 present pause=125 messages board=.....S42 present "
                "cell=6,16:6 present pause=120 board=......42 present board=.....42 present");
    expectClick(
        "a row and then the stones", GameMode::Strategy, "......S/....1112", {5, 16},
        "board=......S/.......2 score=6 points=6@5,16 present pause=125 messages board=......S2 present "
        "pause=125 messages board=.....S2 present pause=100 gauge=2.08333 board=.....S2/123123123123 "
        "strip=0:222222222222 present cell=6,15:6 present pause=120 board=......2/123123123123 present");
}

// What a bomb shows until the cells have gone: each cell in the four tiles.
std::string explosion(const std::vector<std::string>& cells) {
    std::string words;
    for (const auto& [tile, pause] : {std::pair{"10", "75"}, {"11", "75"}, {"12", "75"}, {"13", "100"}}) {
        for (const std::string& cell : cells)
            words += "cell=" + cell + ":" + tile + " ";
        words += std::string("present pause=") + pause + " ";
    }
    return words;
}

TEST_F(Moves, BombsWipeTheirColourOffTheBoard) {
    expectClick("blocks fall, columns close", GameMode::Timed, ".....3/....2b/....12123", {6, 15},
                explosion({"5,15", "6,15", "6,16", "8,16"}) +
                    "board=.....3//....1.1.3 present pause=250 board=....131.3 present pause=125 "
                    "board=....1313 pause=125 present");
    expectClick("another bomb goes too", GameMode::Timed, "....4a.a/....12134", {8, 15},
                explosion({"6,15", "8,15", "5,16", "7,16"}) +
                    "board=....4/.....2.34 present pause=250 board=....42.34 present pause=125 "
                    "board=....4234 pause=125 present");
    expectClick(
        "stones leave a gap", GameMode::Timed, "....2b2/....12S13", {6, 15},
        explosion({"5,15", "6,15", "7,15", "6,16"}) +
            "board=....1.S13 present pause=250 board=....1.S13 present pause=125 board=.....1S13 pause=125 "
            "present cell=7,16:6 present pause=120 board=.....1.13 present pause=100 board=.....113 present");
    expectClick(
        "alone in its colour, a stone and a row", GameMode::Strategy, "......c/......S/.....11", {7, 14},
        explosion({"7,14"}) +
            "board=......S/.....11 present pause=250 board=......S/.....11 present pause=125 "
            "board=......S/.....11 pause=125 present cell=7,15:6 present pause=120 board=.....11 present "
            "pause=100 gauge=2.08333 board=.....11/123123123123 strip=0:222222222222 present");
    EXPECT_EQ(state.stats.score + state.stats.blocksCleared + state.stats.largestCluster, 0);
}

// None of them brings a row either.
TEST_F(Moves, OtherClicksReleaseStonesAtMost) {
    expectClick("a single block", GameMode::Training, "....21/....12/.....2", {5, 14}, "");
    expectClick("an empty cell", GameMode::Training, "....21/....12/.....2", {7, 16}, "");
    expectClick("below the board", GameMode::Training, ".....11", {6, 17}, "");
    expectClick("too few cells", GameMode::Timed, ".....11", {6, 16}, "");
    expectClick("too few cells, a stone above", GameMode::Strategy, ".....S/.....11", {7, 16},
                "cell=6,15:6 present pause=120 board=.....11 present");
    expectClick("too few cells, columns of stones", GameMode::Strategy, ".....1SS2/....41SS3", {6, 16},
                "cell=7,16:6 cell=7,15:6 cell=8,16:6 cell=8,15:6 present pause=120 board=.....1..2/....41..3 "
                "present board=.....12/....413 present");
    expectClick("too few cells, covered stones", GameMode::Strategy, ".....3b/.....SS/.....SS/.....1",
                {6, 16}, "");
    expectClick("too few cells, one stone covered", GameMode::Strategy, ".....S/.....1/.....S/.....2",
                {6, 16}, "cell=6,13:6 present pause=120 board=.....1/.....S/.....2 present");
    expectClick("too few cells, a stone in the top row", GameMode::Strategy, ".....S///////////////.....1",
                {6, 16}, "cell=6,1:6 present pause=120 board=.....1 present");
    expectClick("a stone", GameMode::Strategy, ".....S/.....SS", {6, 16}, "");
    expectClick("an empty cell", GameMode::Strategy, ".....S/.....11", {8, 16}, "");
}

}  // namespace
}  // namespace quabble
