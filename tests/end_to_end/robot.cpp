// Plays the real program in a real window: robot PROGRAM. It reads the board from the screen, clicks with a
// real pointer, keeps its own count of the score and compares the panel and the result dialog with it.

#include <X11/keysym.h>
#include <sqlite3.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <string>
#include <thread>
#include <utility>

#include "desktop.hpp"
#include "gfx/painters.hpp"
#include "gfx/result_dialog.hpp"
#include "gfx/sprite_sheet.hpp"
#include "player.hpp"

namespace quabble {
namespace {

using namespace std::chrono_literals;

constexpr int cellSize = 28;
constexpr int boardLeft = 232;
constexpr const char* mainCaption = "Quabble  Ver 1.0";
constexpr const char* playerName = "robot";

bool isSame(const Surface& seen, const Rect& area, const Surface& expected, Point from) {
    Surface cut(area.width(), area.height());
    cut.copy(cut.bounds(), seen, {area.left, area.top});
    for (int y = 0; y < cut.height(); ++y) {
        for (int x = 0; x < cut.width(); ++x) {
            if (cut.at(x, y) != expected.at(from.x + x, from.y + y))
                return false;
        }
    }
    return true;
}

class Robot {
 public:
    explicit Robot(std::string program)
        : program_(std::move(program)),
          sheet_(loadGraphics(std::filesystem::path(program_).parent_path().string() + "/").spriteSheet) {}

    void startProgram() {
        child_ = fork();
        if (child_ == 0) {
            execl(program_.c_str(), program_.c_str(), nullptr);
            _exit(127);
        }
        main_ = desktop_.waitForWindow(mainCaption);
        desktop_.waitForFocus(main_);
        std::this_thread::sleep_for(500ms);
    }

    // Plays one game and leaves it at `moves` moves, or when it has ended by itself.
    void play(GameMode mode, int moves) {
        score_ = blocks_ = largest_ = 0;
        desktop_.click(main_, 337, 15 + static_cast<int>(mode) * 52 + 2);
        const bool training = mode == GameMode::Training;
        boardTop_ = training ? 37 : 31;
        int made = 0;
        for (; made < moves; ++made) {
            if (mode == GameMode::Timed)
                waitForRow();
            const SeenBoard board = settledBoard();
            const auto choice = choose(board, training ? 2 : 3);
            if (hasEnded() || !choice)
                break;
            desktop_.click(main_, boardLeft + choice->column * cellSize + 14,
                           boardTop_ + choice->row * cellSize + 14);
            score_ += choice->size * (choice->size + 1) / 2;
            blocks_ += choice->size;
            largest_ = std::max(largest_, choice->size);
            waitUntil("the score " + std::to_string(score_) + " on the panel",
                      [this] { return showsScore(); });
        }
        if (!hasEnded())
            desktop_.click(main_, 95, training ? 385 : 465);
        checkResult(mode);
        enterName();
        checkBestEntry();
        std::printf("mode %d: %d moves, %d points, as counted\n", static_cast<int>(mode), made, score_);
    }

    // The score of the last game stands at the top of its mode's table, opened from the main menu.
    void checkTable(GameMode mode) {
        desktop_.click(main_, 337, 15 + (static_cast<int>(mode) + 3) * 52 + 2);
        checkBestEntry();
    }

    // The same, in the file that it is kept in.
    void checkStore(GameMode mode) {
        const std::string path = std::string(std::getenv("XDG_DATA_HOME")) + "/quabble/registry.db";
        sqlite3* store = nullptr;
        require(sqlite3_open_v2(path.c_str(), &store, SQLITE_OPEN_READONLY, nullptr) == SQLITE_OK, path);
        const std::string table = std::to_string(static_cast<int>(mode)) + "STATS";
        const std::string query =
            "SELECT hex(data) FROM entries WHERE name IN ('" + table + "', '" + table + "1')";
        std::string found;
        const auto collect = [](void* all, int, char** row, char**) {
            *static_cast<std::string*>(all) += std::string(row[0]) + " ";
            return 0;
        };
        sqlite3_exec(store, query.c_str(), collect, &found, nullptr);
        sqlite3_close(store);
        char expectedScore[9];
        std::snprintf(expectedScore, sizeof expectedScore, "%02X%02X0000", score_ & 0xFF, score_ >> 8);
        require(found.find(expectedScore) != std::string::npos, "the stored score, in " + found);
        require(found.find("726F626F7400 ") != std::string::npos, "the stored name, in " + found);
    }

    void closeAndCheckExit() {
        desktop_.clickCloseButton(main_);
        int status = -1;
        waitUntil("the program's end", [&] { return waitpid(child_, &status, WNOHANG) == child_; });
        require(WIFEXITED(status) && WEXITSTATUS(status) == 0, "exit status 0");
    }

 private:
    bool hasEnded() { return desktop_.hasWindow("Game Statistics"); }

    // The board as soon as it has stopped changing and every cell can be read, or as it is when the game has
    // ended.
    SeenBoard settledBoard() {
        SeenBoard last{};
        auto since = std::chrono::steady_clock::now();
        waitUntil("a board at rest", [&] {
            const SeenBoard seen = readBoard();
            if (seen != last || !isReadable(seen)) {
                last = seen;
                since = std::chrono::steady_clock::now();
            }
            return hasEnded() || std::chrono::steady_clock::now() - since > 600ms;
        });
        return last;
    }

    // Until the timer has pushed a row: then there is time for a move before the next one.
    void waitForRow() {
        const SeenBoard before = settledBoard();
        waitUntil("a row from below", [&] { return readBoard() != before; });
    }

    static bool isReadable(const SeenBoard& board) {
        for (const auto& row : board) {
            for (const int tile : row) {
                if (tile < 0 || tile > 9)
                    return false;
            }
        }
        return true;
    }

    SeenBoard readBoard() {
        const Surface seen = desktop_.look(main_);
        SeenBoard board{};
        for (int row = 0; row < 16; ++row) {
            for (int column = 0; column < 12; ++column) {
                const Rect cell = Rect::ofSize(boardLeft + column * cellSize, boardTop_ + row * cellSize,
                                               cellSize, cellSize);
                int tile = 13;
                while (tile >= 0 && !isSame(seen, cell, sheet_, {tile * cellSize, 0}))
                    --tile;
                board[static_cast<std::size_t>(row)][static_cast<std::size_t>(column)] = tile;
            }
        }
        return board;
    }

    bool showsScore() {
        Canvas expected{Surface(140, 30), {Typeface::SansBold, 14, false}};
        drawLabelledBox({.surface = &expected,
                         .width = 140,
                         .height = 30,
                         .fillBrush = palette::backgroundBrush,
                         .textColour = palette::valueColour},
                        BoxStyle::Plain, false, 2, std::to_string(score_));
        return isSame(desktop_.look(main_), Rect::ofSize(25, 240, 140, 30), expected.picture, {0, 0});
    }

    void checkResult(GameMode mode) {
        const WindowOnScreen dialog = desktop_.waitForWindow("Game Statistics");
        GameState counted;
        counted.gameMode = mode;
        counted.stats = {.score = score_, .blocksCleared = blocks_, .largestCluster = largest_, .level = 1};
        Canvas expected{Surface(457, 265), {Typeface::Sans, 12, false}};
        const ScreenButton text{.surface = &expected,
                                .left = 45,
                                .top = 45,
                                .width = 373,
                                .height = 114,
                                .textColour = palette::panelTextColour};
        drawShadowText(text, 2, resultText(counted, false), text_format::centre);
        waitUntil("the result as counted", [&] {
            return isSame(desktop_.look(dialog), text.rect(), expected.picture, {text.left, text.top});
        });
        desktop_.waitForFocus(dialog);
        desktop_.press(XK_Return);
        waitUntil("the dialog's end", [this] { return !hasEnded(); });
    }

    void enterName() {
        desktop_.waitForFocus(desktop_.waitForWindow("Best Score"));
        desktop_.type(playerName);
        desktop_.press(XK_Return);
    }

    void checkBestEntry() {
        const WindowOnScreen view = desktop_.waitForWindow("Best Scores - Quabble");
        Canvas expected{Surface(473, 473), {Typeface::SerifBold, 14.25, false}};
        expected.picture.fill(expected.picture.bounds(), palette::backgroundColour);
        ScreenButton box{.surface = &expected,
                         .left = 45,
                         .top = 45,
                         .width = 270,
                         .height = 45,
                         .textColour = palette::highlightColour};
        drawShadowText(box, 1, playerName, defaultTextFormat);
        box.left = 360;
        drawShadowText(box, 1, std::to_string(score_), defaultTextFormat);
        waitUntil("the best score and its name",
                  [&] { return isSame(desktop_.look(view), {45, 45, 450, 90}, expected.picture, {45, 45}); });
        desktop_.waitForFocus(view);
        std::this_thread::sleep_for(1s);  // a person reads it; sooner, Enter would count as still held
        desktop_.press(XK_Return);
        waitUntil("the view's end", [this] { return !desktop_.hasWindow("Best Scores - Quabble"); });
    }

    Desktop desktop_;
    std::string program_;
    Surface sheet_;
    pid_t child_ = 0;
    WindowOnScreen main_ = 0;
    int boardTop_ = 0;
    int score_ = 0;
    int blocks_ = 0;
    int largest_ = 0;
};

}  // namespace
}  // namespace quabble

int main(int argc, char** argv) {
    quabble::require(argc == 2, "usage: robot PROGRAM");
    quabble::Robot robot(argv[1]);
    robot.startProgram();
    robot.play(quabble::GameMode::Training, 1000);
    robot.play(quabble::GameMode::Strategy, 12);
    robot.play(quabble::GameMode::Timed, 4);
    robot.closeAndCheckExit();
    robot.checkStore(quabble::GameMode::Timed);
    robot.startProgram();
    robot.checkTable(quabble::GameMode::Timed);
    robot.closeAndCheckExit();
    return 0;
}
