#pragma once

#include <chrono>
#include <string>
#include <vector>

#include "desktop.hpp"
#include "draw/canvas.hpp"
#include "engine/game_state.hpp"
#include "player.hpp"
#include "running_game.hpp"

namespace quabble {

// Plays the real program in a real window. It reads the board from the screen, clicks with a real pointer or
// with keys alone, keeps its own count of the score and compares the panel and the result dialog with it.
class Robot {
 public:
    enum class Hand { Mouse, Keys };

    // The command that starts the program.
    explicit Robot(std::vector<std::string> command, Hand hand = Hand::Mouse)
        : game_(desktop_, std::move(command)), hasMouse_(hand == Hand::Mouse) {}

    Desktop& desktop() { return desktop_; }
    RunningGame& game() { return game_; }
    void startProgram() { game_.start(); }

    // Plays one game and leaves it at `moves` moves, after a time, or when it has ended by itself.
    void play(GameMode mode, int moves, std::chrono::seconds longest = std::chrono::hours(1));

    // The score of the last game stands at the top of its mode's table, opened from the main menu.
    void checkTable(GameMode mode);

    void closeAndCheckExit();

 private:
    void begin(GameMode mode);
    void clickCell(model::Place place);
    void clickEndGame();
    void closeDialog(WindowOnScreen dialog);
    void chooseByKeys(int button);
    void leaveBoard();
    void pressTimes(unsigned long keysym, int times);
    Rect ring(WindowOnScreen window);
    bool hasEnded() { return desktop_.hasWindow("Game Statistics"); }
    std::string settledBoard();
    void waitForRow();
    bool showsScore();
    bool isSeen(WindowOnScreen window, const Canvas& drawn, const Rect& part);
    void checkResult(GameMode mode);
    void enterName();
    void checkBestEntry();

    Desktop desktop_;
    RunningGame game_;
    bool hasMouse_;
    int score_ = 0;
    int blocks_ = 0;
    int largest_ = 0;
};

}  // namespace quabble
