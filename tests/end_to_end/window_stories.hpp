#pragma once

#include <string>
#include <vector>

#include "desktop.hpp"
#include "engine/game_state.hpp"
#include "running_game.hpp"

namespace quabble {

// What desktops and hasty people do to the windows of a running game.
class WindowStories {
 public:
    // The command that starts the program, which comes back when the main menu is there.
    explicit WindowStories(std::vector<std::string> command) : game_(desktop_, std::move(command)) {
        game_.start();
    }

    void aMinimisedGameStaysAwayAndComesBackPaused(GameMode mode);
    void aKeyInMidMoveHidesTheGame();
    void theKeyboardComesBackFromAnotherWorkspace();
    void aDialogKeepsTheKeyboard();
    void enterClosesOneDialogAPress();
    void aDoubleClickBeginsATrainingGameAndNoMore();
    void aDestroyedDialogWasClosedAndADestroyedMainWindowEndsTheProgram();
    void aRestoredWindowHasItsPictureAtOnce();
    void anOfferToDropSomethingUnknownDoesNoHarm();
    void close();

    Desktop& desktop() { return desktop_; }
    RunningGame& game() { return game_; }
    void beginMove();

 private:
    bool isPaused();
    void checkItStaysAway();
    void resume();
    void checkTheKeyboardIsAlive();
    void leaveGame();
    void closeDialog(const std::string& caption);

    Desktop desktop_;
    RunningGame game_;
};

}  // namespace quabble
