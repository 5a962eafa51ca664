#pragma once

#include <chrono>
#include <cstdint>
#include <string>

#include "base/task.hpp"
#include "engine/board_area.hpp"
#include "engine/grid_cell.hpp"

namespace quabble {

// What a game asks of the screen it is played on. Drawing stays invisible until `present`. The screen reads
// what it draws (board, waiting row, numbers) from the game's state.
//
// In `runPendingMessages` the player may act and the state may change; while a dialog is shown only the
// dialog can be acted on; in `pause` nothing is delivered.
class Stage {
 public:
    virtual ~Stage() = default;

    // Moves the play panel to its place for the game and says where the board lies in it.
    virtual BoardArea layOutClassic() = 0;
    virtual BoardArea layOutArcade() = 0;

    virtual void clearWindow() = 0;
    virtual void drawClassicPanel() = 0;
    virtual void drawArcadePanel() = 0;
    virtual void drawPlayPanel() = 0;
    virtual void drawBoard() = 0;
    virtual void drawCell(CellPosition place, std::int16_t tile) = 0;
    virtual void drawPoints(CellPosition place, std::int32_t points) = 0;  // over the cell
    virtual void updateScore() = 0;
    virtual void displayLevel() = 0;
    virtual void drawPreviewRow(std::int16_t revealed) = 0;
    virtual void drawGauge(double percentage) = 0;
    virtual void present() = 0;

    virtual Task<> pause(std::chrono::milliseconds duration) = 0;
    virtual Task<> runPendingMessages() = 0;

    virtual void switchBlockTimer(bool on) = 0;
    virtual void setBlockTimerInterval(std::chrono::milliseconds interval) = 0;

    // Shows the result of the game or, with `goNextLevel`, of the level, until the player closes it.
    virtual Task<> showResult(bool goNextLevel) = 0;
    // Asks the player for the name that a high score is entered with.
    virtual Task<std::string> enterName() = 0;
    virtual Task<> showHighScores(std::int16_t tableIndex) = 0;
    virtual void showMainMenu() = 0;
};

}  // namespace quabble
