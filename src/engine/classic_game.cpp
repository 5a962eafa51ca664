#include <chrono>

#include "engine/game.hpp"

namespace quabble {
namespace {

using namespace std::chrono_literals;

constexpr std::int16_t smallestCluster = 2;
constexpr std::chrono::milliseconds stepPause = 250ms;

}  // namespace

void Game::startStandardGame() {
    beginRound();
    endRequested_ = false;
    state_.stats.score = 0;
    state_.stats.bestScore = highScores_.table(state_.scoreTableIndex).scores[0];
    state_.classicActive = true;
    state_.mainMenuActive = false;
    state_.arcadeActive = false;
    stage_.clearWindow();
    stage_.drawClassicPanel();
    setUpBoard(stage_.layOutClassic());
    state_.stats.level = 1;
    state_.stats.blocksCleared = 0;
    state_.stats.largestCluster = 0;
    fillFrom(1);
    stage_.drawPlayPanel();
    showBoard();
    stage_.present();
}

Task<> Game::clickClassicCell(CellPosition place) {
    if (!state_.grid.clusterAtLeast(place, smallestCluster))
        co_return;
    const Round round(*this);
    co_await standardGameBoardClick(place);
    if (!round.isOver() && (endRequested_ || state_.grid.noMovesLeft()))
        co_await gameOver();
}

Task<> Game::standardGameBoardClick(CellPosition place) {
    const Move move(*this);
    const std::int32_t points = removeCluster();
    stage_.updateScore();
    stage_.drawBoard();
    stage_.drawPoints(place, points);
    stage_.present();
    co_await stage_.pause(stepPause);
    co_await stage_.runPendingMessages();
    if (move.isOver())
        co_return;
    state_.grid.dropBlocks(Direction::Down);
    stage_.drawBoard();
    stage_.drawPoints(place, points);
    stage_.present();
    if (state_.grid.closeColumns()) {
        co_await stage_.runPendingMessages();
        co_await stage_.pause(stepPause);
        // A click in this pause, too, belongs to the move and is dropped.
        co_await stage_.runPendingMessages();
        if (move.isOver())
            co_return;
    }
    showBoard();
}

}  // namespace quabble
