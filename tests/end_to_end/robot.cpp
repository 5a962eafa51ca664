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
constexpr int panelRight = 200;
constexpr auto timeForMoves = 1500ms;  // after a row, so that a move is over when the next one comes

}  // namespace

void Robot::play(GameMode mode, int moves, std::chrono::seconds longest) {
    score_ = blocks_ = largest_ = 0;
    begin(mode);
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
        clickCell(place);
        score_ += size * (size + 1) / 2;
        blocks_ += size;
        largest_ = std::max(largest_, size);
        waitUntil("the score " + std::to_string(score_) + " on the panel", [this] { return showsScore(); });
        if (!hasMouse_)
            leaveBoard();
    }
    if (!hasEnded())
        clickEndGame();
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
    if (hasMouse_)
        desktop_.clickCloseButton(game_.window());
    else
        chooseByKeys(8);
    game_.waitForExit();
}

void Robot::begin(GameMode mode) {
    if (hasMouse_) {
        game_.begin(mode);
        return;
    }
    chooseByKeys(static_cast<int>(mode));
    leaveBoard();
    game_.waitForBoard(mode);
}

void Robot::clickCell(model::Place place) {
    const Rect cell = game_.cellAt(place.first - 1, place.second - 1);
    if (hasMouse_) {
        desktop_.click(game_.window(), cell.left + 14, cell.top + 14);
        return;
    }
    desktop_.press(XK_Right);
    waitUntil("the ring on the board", [&] { return ring(game_.window()).left > panelRight; });
    const int rows = (cell.top - ring(game_.window()).top) / cell.height();
    pressTimes(rows > 0 ? XK_Down : XK_Up, std::abs(rows));
    pressTimes(XK_Right, place.first - 1);
    desktop_.press(XK_Insert);
}

void Robot::clickEndGame() {
    if (hasMouse_) {
        game_.clickEndGame();
        return;
    }
    pressTimes(XK_Down, 2);
    desktop_.press(XK_Menu);
}

void Robot::closeDialog(WindowOnScreen dialog) {
    desktop_.waitForFocus(dialog);
    if (hasMouse_) {
        desktop_.press(XK_Return);
        return;
    }
    pressTimes(XK_Down, 2);  // the first only shows the ring
    pressTimes(XK_Left, 2);
    waitUntil("the ring on a button", [&] { return ring(dialog).top > 0; });
    desktop_.pressWith(XK_Control_L, XK_Return);
}

// From the place where the ring is, or comes with the first key.
void Robot::chooseByKeys(int button) {
    desktop_.waitForFocus(game_.window());
    pressTimes(XK_Up, 9);
    pressTimes(XK_Down, button - 1);
    desktop_.press(XK_Menu);
}

// To the panel, where the ring covers no part of the board.
void Robot::leaveBoard() {
    pressTimes(XK_Left, 12);
    waitUntil("the ring on the panel",
              [&] { return hasEnded() || ring(game_.window()).right <= panelRight; });
}

void Robot::pressTimes(unsigned long keysym, int times) {
    for (int i = 0; i < times; ++i)
        desktop_.press(keysym);
}

// What the pointer's ring is seen around, at scale 1: its upper and lower edges are the only long white
// lines.
Rect Robot::ring(WindowOnScreen window) {
    const Surface seen = desktop_.look(window);
    const std::vector<std::uint32_t> line(10, 0xFFFFFF);
    Rect ring{seen.width(), seen.height(), 0, 0};
    for (std::int32_t y = 0; y < seen.height(); ++y) {
        const auto row = seen.row(y);
        const auto first = std::ranges::search(row, line).begin();
        if (first == row.end())
            continue;
        const auto end = std::find_if(first, row.end(), [](auto pixel) { return pixel != 0xFFFFFF; });
        ring = {static_cast<std::int32_t>(first - row.begin()), std::min(ring.top, y),
                static_cast<std::int32_t>(end - row.begin()), y + 1};
    }
    return ring.isEmpty() ? Rect() : ring;
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
    closeDialog(dialog);
    waitUntil("the dialog's end", [this] { return !hasEnded(); });
}

void Robot::enterName() {
    const WindowOnScreen dialog = desktop_.waitForWindow("Best Score");
    desktop_.waitForFocus(dialog);
    desktop_.type(playerName);
    closeDialog(dialog);
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
    closeDialog(view);
    waitUntil("the view's end", [this] { return !desktop_.hasWindow("Best Scores - Quabble"); });
}

}  // namespace quabble
