#pragma once

#include <cstdint>

#include "engine/board_area.hpp"
#include "engine/game_stats.hpp"
#include "engine/grid_cell.hpp"
#include "engine/play_grid.hpp"

namespace quabble {

// Everything about the game being played that its screen reads. Before the first game the
// numbers are zero.
struct GameState {
    GameMode gameMode = GameMode::None;
    std::int16_t scoreTableIndex =
        0;  // the high-score table of the mode chosen last, 1 to 3; 0 before any was
    GameStats stats;

    PlayGrid grid;
    GridRow nextRow;               // the row that enters the board next
    std::int32_t rowsEntered = 0;  // rows that have entered since the level started
    std::int16_t tickCount = 0;    // ticks counted for the waiting row, 0 to 12
    BoardArea boardArea;

    // Which screen is showing; at most one is set.
    bool mainMenuActive = false;
    bool classicActive = false;
    bool arcadeActive = false;

    bool boolProcessing = false;  // a move is being carried out

    bool isGameActive() const { return classicActive || arcadeActive; }
};

}  // namespace quabble
