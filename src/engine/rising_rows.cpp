#include "engine/game.hpp"

namespace quabble {

Task<bool> Game::putnextRow() {
    if (endRequested_)
        co_return false;
    if (state_.grid.isTopRowOccupied()) {
        co_await gameOver();
        co_return false;
    }
    ++state_.rowsEntered;
    state_.tickCount = 0;
    stage_.drawGauge(rowsPercentage());
    state_.grid.pushRowFromBottom(state_.nextRow);
    stage_.drawBoard();
    fillRow(state_.nextRow, rowRecipe(), random_);
    stage_.drawPreviewRow(state_.tickCount);
    if (state_.arcadeActive && state_.rowsEntered >= levelTable_[state_.stats.level].rowsToComplete)
        co_await completeLevel();
    stage_.present();
    co_return true;
}

// The row that completed the level is seen on the board behind the dialog.
Task<> Game::completeLevel() {
    stage_.switchBlockTimer(false);
    stage_.present();
    co_await stage_.showResult(true);
    co_await initArcadeLevel();
}

Task<> Game::blockTimerTick() {
    if (!state_.arcadeActive || state_.boolProcessing)
        co_return;
    ++state_.tickCount;
    if (state_.tickCount == ticksPerRow) {
        co_await putnextRow();
    } else {
        stage_.drawPreviewRow(state_.tickCount);
        stage_.present();
    }
}

double Game::rowsPercentage() const {
    return state_.rowsEntered * 100.0 / levelTable_[state_.stats.level].rowsToComplete;
}

}  // namespace quabble
