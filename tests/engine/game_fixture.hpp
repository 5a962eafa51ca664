#pragma once

#include <gtest/gtest.h>

#include <algorithm>
#include <optional>
#include <string>
#include <vector>

#include "engine/game.hpp"
#include "recording_stage.hpp"

namespace quabble {

// The lines of a recording, here with spaces between them.
inline std::string lines(std::string words) {
    std::replace(words.begin(), words.end(), ' ', '\n');
    return words.empty() ? words : words + "\n";
}

// How often a word is in a text.
inline int countOf(const std::string& word, const std::string& text) {
    int count = 0;
    for (std::size_t at = text.find(word); at != std::string::npos; at = text.find(word, at + 1))
        ++count;
    return count;
}

// Draws 0.5 again and again, or the numbers of a seed. At 0.5 every cell of a row is a block, of colour 2
// while there are three colours and of colour 4 when there are four.
struct TestRandom final : RandomSource {
    double next() override {
        ++drawn;
        return seeded ? seeded->next() : 0.5;
    }
    std::optional<SeededRandom> seeded;
    int drawn = 0;
};

// Runs a task that never really has to wait.
inline void run(Task<> task) {
    task.start();
    ASSERT_TRUE(task.done());
}

// A game on a recording stage.
class GameFixture : public ::testing::Test {
 protected:
    using Action = RecordingStage::Action;

    void start(GameMode mode) {
        state.gameMode = mode;
        state.scoreTableIndex = static_cast<std::int16_t>(mode);
        if (mode == GameMode::Training)
            game.startStandardGame();
        else
            run(game.startArcadeGame());
    }

    // Starts a game, puts a board into it and forgets what was recorded.
    void play(GameMode mode, std::string_view rows) {
        start(mode);
        state.grid = board(rows);
        state.nextRow = gridRow("123123123123");
        stage.takeLines();
    }

    // Goes to just before the last row of a level.
    void skipToLastRowOf(std::int16_t level) {
        state.stats.level = level;
        state.rowsEntered = levelTable[level].rowsToComplete - 1;
    }

    // Fills a column from a row to above its bottom cell with two colours by turns.
    void fillColumn(std::int16_t column, std::int16_t top) {
        for (std::int16_t row = top; row < maxGridRows; ++row)
            state.grid.at({column, row}) = cellOf("34"[row % 2]);
    }

    // Clicks the middle of a cell.
    Task<> click(CellPosition place) {
        const BoardArea& area = state.boardArea;
        return game.gameBoardClick(static_cast<std::int16_t>(area.left + place.column * 28 - 14),
                                   static_cast<std::int16_t>(area.top + place.row * 28 - 14));
    }
    Task<> pushRow() {
        const bool accepted = co_await game.putnextRow();
        rowAccepted = accepted;
    }
    Task<> startTask(GameMode mode) {
        start(mode);
        co_return;
    }

    // What follows the result when the score enters its table.
    std::string named() const { return "name? scores:" + std::to_string(state.scoreTableIndex) + " "; }

    bool isAtMenu() const { return state.mainMenuActive && !state.isGameActive() && !state.boolProcessing; }

    GameState state;
    HighScores highScores;
    LevelTable levelTable;
    TestRandom random;
    RecordingStage stage{state};
    Game game{state, highScores, levelTable, random, stage};
    bool rowAccepted = false;  // by the last pushRow

    // What the player may do in the middle of something else.
    const Action endGame = [this] { return game.endGame(); };
    const Action tick = [this] { return game.blockTimerTick(); };
    const Action clickStrip = [this] { return pushRow(); };
    Action clickCell(CellPosition place) {
        return [this, place] { return click(place); };
    }
    Action startGame(GameMode mode) {
        return [this, mode] { return startTask(mode); };
    }
};

}  // namespace quabble
