#include "engine/game.hpp"

#include <string>
#include <utility>

#include "engine/play_grid.hpp"

namespace quabble {

Game::Game(GameState& state, HighScores& highScores, const LevelTable& levelTable, RandomSource& random,
           Stage& stage)
    : state_(state), highScores_(highScores), levelTable_(levelTable), random_(random), stage_(stage) {}

Task<> Game::gameBoardClick(std::int16_t xVal, std::int16_t yVal) {
    if (state_.boolProcessing || !state_.isGameActive())
        co_return;
    const auto place = state_.boardArea.cellAt(xVal, yVal);
    if (!place || !state_.grid.isInGrid(*place) || state_.grid.at(*place).isEmpty())
        co_return;
    if (state_.classicActive)
        co_await clickClassicCell(*place);
    else
        co_await clickArcadeCell(*place);
}

Task<> Game::endGame() {
    if (state_.boolProcessing)
        endRequested_ = true;
    else if (state_.isGameActive())
        co_await gameOver();
}

Task<> Game::gameOver() {
    beginRound();
    endRequested_ = false;
    state_.classicActive = false;
    state_.arcadeActive = false;
    stage_.switchBlockTimer(false);
    const std::int16_t table = state_.scoreTableIndex;
    const std::int16_t place = highScores_.rankOf(table, state_.stats.score);
    co_await stage_.showResult(false);
    if (place <= highScorePlaces) {
        std::string name = co_await stage_.enterName();
        highScores_.insertHighScore(table, state_.stats.score, std::move(name));
        co_await stage_.showHighScores(table);
    }
    stage_.switchBlockTimer(false);
    stage_.showMainMenu();
}

// What was under way on the board before is over.
void Game::beginRound() {
    ++round_;
    state_.boolProcessing = false;
}

void Game::setUpBoard(BoardArea area) {
    state_.boardArea = area;
    state_.grid.recreate(maxGridCols, maxGridRows);
}

void Game::fillFrom(std::int16_t firstRow) {
    state_.nextRow = fillBoard(state_.grid, firstRow, rowRecipe(), random_);
}

RowRecipe Game::rowRecipe() const {
    return {state_.gameMode, state_.stats.level, levelTable_[state_.stats.level].colourCount};
}

// Removes the cluster marked last, counts it and returns its points.
std::int32_t Game::removeCluster() {
    const std::int16_t removed = state_.grid.removeMarked();
    accountMove(state_.stats, removed);
    return pointsFor(removed);
}

void Game::showBoard() {
    stage_.drawBoard();
    stage_.present();
}

}  // namespace quabble
