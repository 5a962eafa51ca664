#include <array>
#include <chrono>

#include "engine/game.hpp"

namespace quabble {
namespace {

using namespace std::chrono_literals;

constexpr std::array<std::chrono::milliseconds, 4> explosionPauses{75ms, 75ms, 75ms, 100ms};
constexpr std::chrono::milliseconds clearedPause = 250ms;
constexpr std::chrono::milliseconds fallenPause = 125ms;
constexpr std::chrono::milliseconds closedPause = 125ms;
constexpr std::chrono::milliseconds lastClosingPause = 100ms;

}  // namespace

// A bomb wipes its colour off the board. No message is delivered before it has finished.
Task<> Game::arcadeBombClicked(std::int16_t colNum) {
    const Move move(*this);
    for (std::size_t frame = 0; frame < explosionPauses.size(); ++frame) {
        paintColourCells(colNum, tiles::explosion[frame]);
        stage_.present();
        co_await stage_.pause(explosionPauses[frame]);
    }
    state_.grid.clearColour(colNum);
    showBoard();
    co_await stage_.pause(clearedPause);
    state_.grid.dropBlocks(Direction::Down);
    showBoard();
    co_await stage_.pause(fallenPause);
    state_.grid.closeColumns();
    stage_.drawBoard();
    co_await stage_.pause(closedPause);
    stage_.present();
    co_await releaseExposedStones(lastClosingPause);
}

void Game::paintColourCells(std::int16_t colour, std::int16_t tile) {
    state_.grid.forEachCell([&](CellPosition place, const GridCell& cell) {
        if (cell.colour == colour)
            stage_.drawCell(place, tile);
    });
}

}  // namespace quabble
