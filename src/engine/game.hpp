#pragma once

#include <chrono>
#include <cstdint>

#include "base/task.hpp"
#include "engine/game_state.hpp"
#include "engine/high_scores.hpp"
#include "engine/level_table.hpp"
#include "engine/random_source.hpp"
#include "engine/rows.hpp"
#include "engine/stage.hpp"

namespace quabble {

// The three games: what happens, in which order and at which pace, when the player acts or time passes.
//
// A move waits for its animation, and while it waits the player may push a row that ends the level or the
// game, and start another one. So every board has a number, its round; a move that wakes up in another round
// than it began in gives up without touching anything (see Round).
class Game {
 public:
    // All of them must outlive the game.
    Game(GameState& state, HighScores& highScores, const LevelTable& levelTable, RandomSource& random,
         Stage& stage);

    // Starts a Training game, and a Timed or Strategy game. The caller has set gameMode and scoreTableIndex.
    void startStandardGame();
    Task<> startArcadeGame();

    // A click on the game's screen at a window pixel; it acts when it hits a cell that can be played.
    Task<> gameBoardClick(std::int16_t xVal, std::int16_t yVal);

    // Pushes the waiting row into the board. False when there was no room and the game has ended, and when it
    // ends after the move that is under way.
    Task<bool> putnextRow();

    // One tick of the block timer: uncovers one more cell of the waiting row, the twelfth pushes the row.
    Task<> blockTimerTick();

    // Ends the running game at the player's wish: at once, or after the move that is being carried out.
    Task<> endGame();

 private:
    class Round;
    class Move;

    Task<> clickClassicCell(CellPosition place);
    Task<> clickArcadeCell(CellPosition place);
    Task<> standardGameBoardClick(CellPosition place);
    Task<> arcadeGameBoardClick(CellPosition place);
    Task<> arcadeBombClicked(std::int16_t colNum);
    Task<> releaseExposedStones(std::chrono::milliseconds closingPause);
    Task<> initArcadeLevel();
    Task<> completeLevel();
    Task<> gameOver();

    void beginRound();
    void setUpBoard(BoardArea area);
    void fillFrom(std::int16_t firstRow);
    RowRecipe rowRecipe() const;
    double rowsPercentage() const;
    std::int32_t removeCluster();
    bool releaseStones(bool remove);
    void paintColourCells(std::int16_t colour, std::int16_t tile);
    void showBoard();

    GameState& state_;
    HighScores& highScores_;
    const LevelTable& levelTable_;
    RandomSource& random_;
    Stage& stage_;
    std::uint64_t round_ = 0;
    bool endRequested_ = false;
};

// Remembers the round in which it was made.
class Game::Round {
 public:
    explicit Round(const Game& game) : game_(game), number_(game.round_) {}
    bool isOver() const { return game_.round_ != number_; }

 private:
    const Game& game_;
    std::uint64_t number_;
};

// A move being carried out: board clicks and timer ticks do nothing while it lives. A move whose round is
// over leaves the flag to the round that came after it.
class Game::Move {
 public:
    explicit Move(Game& game) : game_(game), round_(game) { game_.state_.boolProcessing = true; }
    ~Move() {
        if (!isOver())
            game_.state_.boolProcessing = false;
    }
    Move(const Move&) = delete;
    Move& operator=(const Move&) = delete;

    bool isOver() const { return round_.isOver(); }

 private:
    Game& game_;
    Round round_;
};

}  // namespace quabble
