#include "running_game.hpp"

#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <filesystem>
#include <thread>
#include <utility>

#include "../engine/board_notation.hpp"
#include "../support/files.hpp"
#include "draw/large_picture.hpp"
#include "gfx/palette.hpp"

namespace quabble {
namespace {

using namespace std::chrono_literals;

constexpr int cellSize = 28;
constexpr int boardLeft = 232;

}  // namespace

RunningGame::RunningGame(Desktop& desktop, std::vector<std::string> command)
    : desktop_(desktop), command_(std::move(command)) {}

void RunningGame::start() {
    const std::filesystem::path folder = std::filesystem::path(command_.back()).parent_path();
    if (desktop_.scale() == Scale()) {
        tiles_ = spritesOf(readPicture(folder / "ALLPICDATA.BMP"), Scale()).tiles;
    } else {
        const std::string file = bytesOf(folder / "ALLPICDATA.BIG");
        auto large = LargePicture::of(std::as_bytes(std::span(file)));
        tiles_ = spritesOf(*large, desktop_.scale()).tiles;
    }
    process_ = fork();
    if (process_ == 0) {
        std::vector<char*> arguments;
        for (std::string& word : command_)
            arguments.push_back(word.data());
        arguments.push_back(nullptr);
        execvp(arguments[0], arguments.data());
        _exit(127);
    }
    window_ = desktop_.waitForWindow("Quabble  Ver 1.0");
    const auto hasPicture = [this] { return look().at(2, 2) == palette::backgroundColour; };
    if (command_.front() == "wine")  // which puts a window on the screen before what is painted on it
        waitUntil("a picture", hasPicture);
    else
        require(hasPicture(), "a picture from the first");
    desktop_.waitForFocus(window_);
    std::this_thread::sleep_for(500ms);
}

void RunningGame::choose(int button, int clicks) {
    desktop_.click(window_, 337, 15 + button * 52 + 2, clicks);
}

void RunningGame::begin(GameMode mode, int clicks) {
    choose(static_cast<int>(mode), clicks);
    waitForBoard(mode);
}

void RunningGame::waitForBoard(GameMode mode) {
    mode_ = mode;
    waitUntil("a board", [this] { return readBoard().find('?') == std::string::npos; });
}

void RunningGame::clickEndGame() {
    desktop_.click(window_, 95, mode_ == GameMode::Training ? 385 : 465);
}

void RunningGame::waitForExit() {
    int status = -1;
    waitUntil("the program's end", [&] { return waitpid(process_, &status, WNOHANG) == process_; });
    require(WIFEXITED(status) && WEXITSTATUS(status) == 0, "exit status 0");
}

Rect RunningGame::cellAt(int column, int row) const {
    const int top = mode_ == GameMode::Training ? 37 : 31;
    return Rect::ofSize(boardLeft + column * cellSize, top + row * cellSize, cellSize, cellSize);
}

std::string RunningGame::readBoard() {
    const Surface window = look();
    std::string letters;
    for (int i = 0; i < 192; ++i) {
        const Surface seen = partOf(window, desktop_.scale().device(cellAt(i % 12, i / 12)));
        const auto tile = std::ranges::find(tiles_, seen) - tiles_.begin();
        letters += tile < std::ssize(tiles_) ? tileLetters[static_cast<std::size_t>(tile)] : '?';
    }
    return letters;
}

}  // namespace quabble
