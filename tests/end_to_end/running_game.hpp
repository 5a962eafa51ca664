#pragma once

#include <sys/types.h>

#include <array>
#include <string>
#include <vector>

#include "desktop.hpp"
#include "draw/surface.hpp"
#include "engine/game_state.hpp"
#include "gfx/sprites.hpp"

namespace quabble {

inline Surface partOf(const Surface& picture, const Rect& area) {
    Surface part(area.width(), area.height());
    part.copy(part.bounds(), picture, {area.left, area.top});
    return part;
}

// The program while it runs: its process, its main window and what is to be seen there.
class RunningGame {
 public:
    // The command's last word is the program's path; its pictures lie beside it.
    RunningGame(Desktop& desktop, std::vector<std::string> command);

    // Comes back when the main menu is there and has the keyboard. The desktop's scale is set before.
    void start();
    // Chooses a button of the main menu, counted from 1.
    void choose(int button, int clicks = 1);
    void begin(GameMode mode, int clicks = 1);  // comes back when the board is there
    void waitForBoard(GameMode mode);
    void clickEndGame();
    void waitForExit();  // with status 0

    WindowOnScreen window() const { return window_; }
    pid_t process() const { return process_; }
    Surface look() { return desktop_.look(window_); }
    // A cell, counted from 0, in the program's pixels.
    Rect cellAt(int column, int row) const;
    // The letters of the board as it is seen, '?' for cells that cannot be read.
    std::string readBoard();

 private:
    Desktop& desktop_;
    std::vector<std::string> command_;
    std::array<Surface, tiles::count> tiles_;
    pid_t process_ = 0;
    WindowOnScreen window_ = 0;
    GameMode mode_ = GameMode::Training;
};

}  // namespace quabble
