#include <chrono>

#include "engine/game.hpp"

namespace quabble {
namespace {

using namespace std::chrono_literals;

constexpr std::int16_t smallestCluster = 3;
constexpr std::chrono::milliseconds stepPause = 125ms;
constexpr std::chrono::milliseconds strategyRowPause = 100ms;
constexpr std::chrono::milliseconds releasedStonePause = 120ms;
constexpr std::chrono::milliseconds noPause = 0ms;

}  // namespace

Task<> Game::startArcadeGame() {
    endRequested_ = false;
    state_.arcadeActive = true;
    state_.stats.level = 0;
    state_.stats.score = 0;
    state_.mainMenuActive = false;
    state_.classicActive = false;
    stage_.switchBlockTimer(true);
    state_.stats.bestScore = highScores_.table(state_.scoreTableIndex).scores[0];
    stage_.clearWindow();
    stage_.drawArcadePanel();
    co_await initArcadeLevel();
}

Task<> Game::initArcadeLevel() {
    beginRound();
    ++state_.stats.level;
    state_.stats.blocksCleared = 0;
    state_.stats.largestCluster = 0;
    if (state_.stats.level > lastLevel) {
        co_await gameOver();
        co_return;
    }
    const ArcadeLevelSpec& entry = levelTable_[state_.stats.level];
    state_.rowsEntered = 0;
    if (state_.gameMode == GameMode::Timed)
        stage_.setBlockTimerInterval(std::chrono::milliseconds(entry.tickInterval()));
    stage_.switchBlockTimer(state_.gameMode == GameMode::Timed);
    setUpBoard(stage_.layOutArcade());
    state_.tickCount = 0;
    fillFrom(static_cast<std::int16_t>(state_.grid.gridRows() - entry.startRows + 1));
    stage_.drawPlayPanel();
    stage_.drawBoard();
    stage_.drawPreviewRow(state_.tickCount);
    stage_.drawGauge(rowsPercentage());
    stage_.displayLevel();
    stage_.present();
}

Task<> Game::clickArcadeCell(CellPosition place) {
    const Round round(*this);
    const GridCell cell = state_.grid.at(place);
    bool bringsRow = true;
    switch (cell.kind) {
        case CellKind::Stone:
            co_return;
        case CellKind::Bomb:
            co_await arcadeBombClicked(cell.colour);
            break;
        case CellKind::Block:
            bringsRow = state_.grid.clusterAtLeast(place, smallestCluster);
            if (bringsRow)
                co_await arcadeGameBoardClick(place);
            break;
    }
    if (endRequested_) {
        co_await gameOver();
        co_return;
    }
    if (round.isOver())
        co_return;
    if (bringsRow && state_.gameMode == GameMode::Strategy) {
        co_await stage_.pause(strategyRowPause);
        // The row may complete the level; the next one's board then takes part in what follows.
        const bool accepted = co_await putnextRow();
        if (!accepted || !state_.arcadeActive)
            co_return;
    }
    co_await releaseExposedStones(noPause);
}

Task<> Game::arcadeGameBoardClick(CellPosition place) {
    const Move move(*this);
    const std::int32_t points = removeCluster();
    stage_.drawBoard();
    stage_.updateScore();
    stage_.drawPoints(place, points);
    stage_.present();
    co_await stage_.pause(stepPause);
    co_await stage_.runPendingMessages();
    if (move.isOver())
        co_return;
    state_.grid.dropBlocks(Direction::Down);
    showBoard();
    if (state_.grid.closeColumns()) {
        co_await stage_.pause(stepPause);
        co_await stage_.runPendingMessages();
        if (move.isOver())
            co_return;
        showBoard();
    }
}

// Lets go of the stones that nothing but stones lies above.
Task<> Game::releaseExposedStones(std::chrono::milliseconds closingPause) {
    if (!releaseStones(false))
        co_return;
    releaseStones(true);
    stage_.present();
    co_await stage_.pause(releasedStonePause);
    showBoard();
    if (!state_.grid.closeColumns())
        co_return;
    if (closingPause > noPause)
        co_await stage_.pause(closingPause);
    showBoard();
}

// Paints every exposed stone as released or, with `remove`, empties its cell; true when there was any.
bool Game::releaseStones(bool remove) {
    bool found = false;
    for (std::int16_t column = 1; column <= state_.grid.gridCols(); ++column) {
        for (std::int16_t row = state_.grid.gridRows(); row >= 1; --row) {
            const CellPosition place{column, row};
            if (state_.grid.at(place).colour != stoneColour || !state_.grid.isStoneExposed(place))
                continue;
            found = true;
            if (remove)
                state_.grid.at(place) = GridCell{};
            else
                stage_.drawCell(place, tiles::releasedStone);
        }
    }
    return found;
}

}  // namespace quabble
