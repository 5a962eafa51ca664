#include "robot.hpp"

#include <X11/keysym.h>

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <thread>
#include <utility>

#include "gfx/painters.hpp"
#include "gfx/result_dialog.hpp"
#include "player.hpp"

namespace quabble {
namespace {

using namespace std::chrono_literals;

using Clock = std::chrono::steady_clock;

constexpr const char* playerName = "robot";
constexpr auto timeForMoves = 1500ms;  // after a row, so that a move is over when the next one comes

}  // namespace

void Robot::play(GameMode mode, int moves, std::chrono::seconds longest) {
    score_ = blocks_ = largest_ = 0;
    game_.begin(mode);
    const bool training = mode == GameMode::Training;
    const auto start = Clock::now();
    Clock::time_point row;  // when the latest came
    int made = 0;
    for (; made < moves && Clock::now() - start < longest; ++made) {
        if (mode == GameMode::Timed && Clock::now() - row > timeForMoves) {
            waitForRow();
            row = Clock::now();
        }
        const auto [place, size] = choose(model::read(settledBoard()));
        const bool hasMove = size >= (training ? 2 : 3);
        if (hasEnded() || (!hasMove && mode != GameMode::Timed))
            break;
        if (!hasMove)
            continue;  // the next row may bring one
        const Rect cell = game_.cellAt(place.first - 1, place.second - 1);
        desktop_.click(game_.window(), cell.left + 14, cell.top + 14);
        score_ += size * (size + 1) / 2;
        blocks_ += size;
        largest_ = std::max(largest_, size);
        waitUntil("the score " + std::to_string(score_) + " on the panel", [this] { return showsScore(); });
    }
    if (!hasEnded())
        game_.clickEndGame();
    checkResult(mode);
    enterName();
    checkBestEntry();
    std::printf("mode %d: %d moves, %d points, as counted\n", static_cast<int>(mode), made, score_);
}

void Robot::checkTable(GameMode mode) {
    game_.choose(static_cast<int>(mode) + 3);
    checkBestEntry();
}

void Robot::closeAndCheckExit() {
    desktop_.clickCloseButton(game_.window());
    game_.waitForExit();
}

// The letters of the board as soon as it has stopped changing and every cell can be read, or as they are
// when the game has ended.
std::string Robot::settledBoard() {
    std::string last;
    auto since = std::chrono::steady_clock::now();
    waitUntil("a board at rest", [&] {
        const std::string seen = game_.readBoard();
        if (seen != std::exchange(last, seen) || seen.find_first_of("?sWXYZ") != std::string::npos)
            since = std::chrono::steady_clock::now();
        return hasEnded() || std::chrono::steady_clock::now() - since > 600ms;
    });
    return last;
}

// Until the timer has pushed a row: then there is time for a move before the next one.
void Robot::waitForRow() {
    const std::string before = settledBoard();
    waitUntil("a row from below", [&] { return game_.readBoard() != before; });
}

bool Robot::showsScore() {
    Canvas expected({675, 562}, desktop_.scale());
    const ScreenButton box{.left = 25,
                           .top = 240,
                           .width = 140,
                           .height = 30,
                           .fillBrush = palette::backgroundBrush,
                           .textColour = palette::valueColour,
                           .font = {Typeface::SansBold, 14}};
    drawLabelledBox(expected, box, BoxStyle::Plain, false, 2, std::to_string(score_));
    return isSeen(game_.window(), expected, box.rect());
}

// Whether a part of a window, in the program's pixels, is as it was drawn.
bool Robot::isSeen(WindowOnScreen window, const Canvas& drawn, const Rect& part) {
    const Rect seen = desktop_.scale().device(part);
    return partOf(desktop_.look(window), seen) == partOf(drawn.picture(), seen);
}

void Robot::checkResult(GameMode mode) {
    const WindowOnScreen dialog = desktop_.waitForWindow("Game Statistics");
    GameState counted;
    counted.gameMode = mode;
    counted.stats = {.score = score_, .blocksCleared = blocks_, .largestCluster = largest_, .level = 1};
    Canvas expected({457, 265}, desktop_.scale());
    const ScreenButton text{.left = 45,
                            .top = 45,
                            .width = 373,
                            .height = 114,
                            .textColour = palette::panelTextColour,
                            .font = {Typeface::Sans, 12}};
    drawShadowText(expected, text, 2, resultText(counted, false), text_format::centre);
    waitUntil("the result as counted", [&] { return isSeen(dialog, expected, text.rect()); });
    desktop_.waitForFocus(dialog);
    desktop_.press(XK_Return);
    waitUntil("the dialog's end", [this] { return !hasEnded(); });
}

void Robot::enterName() {
    desktop_.waitForFocus(desktop_.waitForWindow("Best Score"));
    desktop_.type(playerName);
    desktop_.press(XK_Return);
}

void Robot::checkBestEntry() {
    const WindowOnScreen view = desktop_.waitForWindow("Best Scores - Quabble");
    Canvas expected({473, 473}, desktop_.scale());
    expected.fill(expected.bounds(), palette::backgroundColour);
    ScreenButton box{.left = 45,
                     .top = 45,
                     .width = 270,
                     .height = 45,
                     .textColour = palette::highlightColour,
                     .font = {Typeface::SerifBold, 14.25}};
    drawShadowText(expected, box, 1, playerName, defaultTextFormat);
    box.left = 360;
    drawShadowText(expected, box, 1, std::to_string(score_), defaultTextFormat);
    waitUntil("the best score and its name", [&] { return isSeen(view, expected, {45, 45, 450, 90}); });
    desktop_.waitForFocus(view);
    desktop_.press(XK_Return);
    waitUntil("the view's end", [this] { return !desktop_.hasWindow("Best Scores - Quabble"); });
}

}  // namespace quabble
