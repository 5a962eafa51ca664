#include "window_stories.hpp"

#include <X11/keysym.h>

#include <chrono>
#include <csignal>
#include <cstdlib>
#include <filesystem>
#include <string>
#include <thread>

#include "../support/files.hpp"
#include "desktop.hpp"
#include "gfx/palette.hpp"
#include "player.hpp"

namespace quabble {
namespace {

using namespace std::chrono_literals;

}  // namespace

void WindowStories::aMinimisedGameStaysAwayAndComesBackPaused(GameMode mode) {
    game_.begin(mode);
    for (int time = 0; time < 2; ++time) {
        desktop_.minimise(game_.window());
        checkItStaysAway();
        desktop_.restore(game_.window());
        resume();
    }
    checkTheKeyboardIsAlive();
    leaveGame();
}

void WindowStories::aKeyInMidMoveHidesTheGame() {
    game_.begin(GameMode::Strategy);
    beginMove();
    desktop_.press(XK_p);
    waitUntil("the window's leaving", [&] { return !desktop_.isVisible(game_.window()); });
    checkItStaysAway();
    desktop_.restore(game_.window());
    resume();
    leaveGame();
    closeDialog("Best Score");
    closeDialog("Best Scores - Quabble");
}

void WindowStories::theKeyboardComesBackFromAnotherWorkspace() {
    game_.begin(GameMode::Strategy);
    desktop_.showWorkspace(1);
    std::this_thread::sleep_for(1s);
    desktop_.showWorkspace(0);
    waitUntil("the window's return", [&] { return desktop_.isVisible(game_.window()); });
    resume();
    checkTheKeyboardIsAlive();
    leaveGame();
}

void WindowStories::aDialogKeepsTheKeyboard() {
    const std::string caption = "Best Scores - Quabble";
    game_.choose(4);
    desktop_.waitForFocus(desktop_.waitForWindow(caption));
    desktop_.click(game_.window(), 20, 280);  // which lies behind it
    closeDialog(caption);
    game_.choose(4);
    desktop_.waitForFocus(desktop_.waitForWindow(caption));
    desktop_.minimise(game_.window());
    desktop_.restore(game_.window());
    closeDialog(caption);
}

void WindowStories::enterClosesOneDialogAPress() {
    for (const auto held : {0ms, 80ms, 1500ms}) {
        game_.begin(GameMode::Strategy);
        beginMove();
        game_.clickEndGame();
        closeDialog("Game Statistics");
        desktop_.waitForFocus(desktop_.waitForWindow("Best Score"));
        desktop_.press(XK_Return, held);
        const WindowOnScreen table = desktop_.waitForWindow("Best Scores - Quabble");
        require(desktop_.isVisible(table), "the table outlives the key that brought it");
        closeDialog("Best Scores - Quabble");
    }
}

void WindowStories::aDoubleClickBeginsATrainingGameAndNoMore() {
    for (int time = 0; time < 4; ++time) {
        game_.begin(GameMode::Training, 2);
        std::this_thread::sleep_for(1s);
        require(game_.readBoard().find('.') == std::string::npos, "a full board");
        leaveGame();
    }
}

void WindowStories::aDestroyedDialogWasClosedAndADestroyedMainWindowEndsTheProgram() {
    game_.begin(GameMode::Strategy);
    beginMove();
    game_.clickEndGame();
    desktop_.destroy(desktop_.waitForWindow("Game Statistics"));
    desktop_.waitForFocus(desktop_.waitForWindow("Best Score"));
    desktop_.type("survivor");
    closeDialog("Best Score");
    desktop_.waitForWindow("Best Scores - Quabble");
    desktop_.destroy(game_.window());
    game_.waitForExit();
    const std::filesystem::path kept(std::getenv("XDG_DATA_HOME"));
    require(bytesOf(kept / "quabble/registry.db").find("survivor") != std::string::npos, "kept settings");
}

void WindowStories::aRestoredWindowHasItsPictureAtOnce() {
    std::this_thread::sleep_for(500ms);  // until the pointer has lit up what it rests on
    const Surface before = game_.look();
    desktop_.minimise(game_.window());
    kill(game_.process(), SIGSTOP);
    desktop_.restore(game_.window());
    waitUntil("a picture that the program need not draw again", [&] { return game_.look() == before; });
    kill(game_.process(), SIGCONT);
}

void WindowStories::anOfferToDropSomethingUnknownDoesNoHarm() {
    desktop_.offerUnknownDrop(game_.window());
    game_.begin(GameMode::Training);
    leaveGame();
}

void WindowStories::close() {
    desktop_.clickCloseButton(game_.window());
    game_.waitForExit();
}

void WindowStories::beginMove() {
    const std::string before = game_.readBoard();
    const Choice best = choose(model::read(before));
    require(best.size > 2, "a cluster to click");
    const Rect cell = game_.cellAt(best.place.first - 1, best.place.second - 1);
    desktop_.click(game_.window(), cell.left + 14, cell.top + 14);
    waitUntil("the move's beginning", [&] { return game_.readBoard() != before; });
}

bool WindowStories::isPaused() {
    return game_.look().at(2, 2) == palette::pauseBackground;
}

void WindowStories::checkItStaysAway() {
    const auto end = std::chrono::steady_clock::now() + 1500ms;
    while (std::chrono::steady_clock::now() < end) {
        require(!desktop_.isVisible(game_.window()), "a minimised window stays away");
        std::this_thread::sleep_for(10ms);
    }
}

void WindowStories::resume() {
    waitUntil("the pause notice", [&] { return isPaused(); });
    desktop_.click(game_.window(), 400, 535);
    waitUntil("the game's going on", [&] { return !isPaused(); });
}

// A key hides the game and pauses it.
void WindowStories::checkTheKeyboardIsAlive() {
    desktop_.waitForFocus(game_.window());
    desktop_.press(XK_p);
    waitUntil("the window's leaving", [&] { return !desktop_.isVisible(game_.window()); });
    desktop_.restore(game_.window());
    resume();
}

void WindowStories::leaveGame() {
    game_.clickEndGame();
    closeDialog("Game Statistics");
}

void WindowStories::closeDialog(const std::string& caption) {
    desktop_.waitForFocus(desktop_.waitForWindow(caption));
    desktop_.press(XK_Return);
    waitUntil("the end of " + caption, [&] { return !desktop_.hasWindow(caption); });
}

}  // namespace quabble
