// Plays the real program in a real window: robot PROGRAM. It reads the board from the screen, clicks with a
// real pointer, keeps its own count of the score and compares the panel and the result dialog with it.

#include <X11/keysym.h>
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

Surface partOf(const Surface& picture, const Rect& area) {
    Surface part(area.width(), area.height());
    part.copy(part.bounds(), picture, {area.left, area.top});
    return part;
}

class Robot {
 public:
    explicit Robot(std::string program) : program_(std::move(program)) {
        const std::string folder = std::filesystem::path(program_).parent_path().string() + "/";
        const Surface sheet = loadGraphics(folder).spriteSheet;
        for (int tile = 0; tile < tiles::count; ++tile)
            tiles_.push_back(partOf(sheet, Rect::ofSize(cellSize * tile, 0, cellSize, cellSize)));
    }

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
            const auto [place, size] = choose(model::read(settledBoard()));
            if (hasEnded() || size < (training ? 2 : 3))
                break;
            const Rect cell = cellAt(place.first - 1, place.second - 1);
            desktop_.click(main_, cell.left + 14, cell.top + 14);
            score_ += size * (size + 1) / 2;
            blocks_ += size;
            largest_ = std::max(largest_, size);
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

    void closeAndCheckExit() {
        desktop_.clickCloseButton(main_);
        int status = -1;
        waitUntil("the program's end", [&] { return waitpid(child_, &status, WNOHANG) == child_; });
        require(WIFEXITED(status) && WEXITSTATUS(status) == 0, "exit status 0");
    }

 private:
    bool hasEnded() { return desktop_.hasWindow("Game Statistics"); }

    // The letters of the board as soon as it has stopped changing and every cell can be read, or as they are
    // when the game has ended.
    std::string settledBoard() {
        std::string last;
        auto since = std::chrono::steady_clock::now();
        waitUntil("a board at rest", [&] {
            const std::string seen = readBoard();
            if (seen != std::exchange(last, seen) || seen.find_first_of("?sWXYZ") != std::string::npos)
                since = std::chrono::steady_clock::now();
            return hasEnded() || std::chrono::steady_clock::now() - since > 600ms;
        });
        return last;
    }

    // Until the timer has pushed a row: then there is time for a move before the next one.
    void waitForRow() {
        const std::string before = settledBoard();
        waitUntil("a row from below", [&] { return readBoard() != before; });
    }

    Rect cellAt(int column, int row) const {
        return Rect::ofSize(boardLeft + column * cellSize, boardTop_ + row * cellSize, cellSize, cellSize);
    }

    std::string readBoard() {
        const Surface window = desktop_.look(main_);
        std::string letters;
        for (int i = 0; i < 192; ++i) {
            const Surface seen = partOf(window, cellAt(i % 12, i / 12));
            const auto tile = std::ranges::find(tiles_, seen) - tiles_.begin();
            letters += tile < std::ssize(tiles_) ? tileLetters[static_cast<std::size_t>(tile)] : '?';
        }
        return letters;
    }

    bool showsScore() {
        Canvas expected{Surface(140, 30), {Typeface::SansBold, 14, false}};
        drawLabelledBox({.surface = &expected,
                         .width = 140,
                         .height = 30,
                         .fillBrush = palette::backgroundBrush,
                         .textColour = palette::valueColour},
                        BoxStyle::Plain, false, 2, std::to_string(score_));
        return partOf(desktop_.look(main_), Rect::ofSize(25, 240, 140, 30)) == expected.picture;
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
            return partOf(desktop_.look(dialog), text.rect()) == partOf(expected.picture, text.rect());
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
        const Rect seen{45, 45, 450, 90};
        waitUntil("the best score and its name",
                  [&] { return partOf(desktop_.look(view), seen) == partOf(expected.picture, seen); });
        desktop_.waitForFocus(view);
        std::this_thread::sleep_for(1s);  // a person reads it; sooner, Enter would count as still held
        desktop_.press(XK_Return);
        waitUntil("the view's end", [this] { return !desktop_.hasWindow("Best Scores - Quabble"); });
    }

    Desktop desktop_;
    std::string program_;
    std::vector<Surface> tiles_;
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
    robot.startProgram();
    robot.checkTable(quabble::GameMode::Timed);
    robot.closeAndCheckExit();
    return 0;
}
