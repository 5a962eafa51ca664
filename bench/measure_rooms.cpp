// What the parts of the program cost within one process: measure_rooms FOLDER, where the pictures lie. It
// needs a display.

#include "measure_rooms.hpp"

#include <SDL2/SDL.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <chrono>
#include <cstdlib>
#include <cstring>
#include <ctime>
#include <functional>
#include <thread>
#include <vector>

#include "../tests/support/files.hpp"
#include "engine/game.hpp"
#include "gfx/painters.hpp"
#include "hosts/desktop/sdl_front_end.hpp"
#include "platform/timer.hpp"
#include "platform/window.hpp"
#include "quiet_stage.hpp"
#include "report.hpp"

namespace quabble::bench {
namespace {

using namespace std::chrono_literals;
using Microseconds = std::chrono::duration<double, std::micro>;

constexpr Size windowSize{675, 562};

double microsecondsOf(const std::function<void()>& act, int turns) {
    const auto start = Clock::now();
    for (int i = 0; i < turns; ++i)
        act();
    return Microseconds(Clock::now() - start).count() / turns;
}

// Reports the medians of many short runs, the two of them in turns, with a rest before each.
void compare(const std::string& what, const std::function<void()>& act, const std::function<void()>& limit,
             int turns, Goal goal, milliseconds rest = 0ms) {
    std::vector<double> measured;
    std::vector<double> limits;
    for (int round = 0; round < 101; ++round) {
        std::this_thread::sleep_for(rest);
        measured.push_back(microsecondsOf(act, turns));
        std::this_thread::sleep_for(rest);
        limits.push_back(microsecondsOf(limit, turns));
    }
    report(what, median(measured), median(limits), "us", goal);
}

void measureBoard(const Surface& sheet, Scale scale) {
    Canvas canvas(windowSize, scale);
    const Sprites sprites = spritesOf(sheet, scale);
    const CellBox board{232, 37, sheet_map::tileSize};
    PlayGrid grid;
    grid.recreate(maxGridCols, maxGridRows);
    SeededRandom random(1);
    fillBoard(grid, 1, {GameMode::Timed, 8, 4}, random);
    const auto edge = static_cast<std::size_t>(scale.edge(sheet_map::tileSize));
    const std::size_t bytes = std::size_t{192} * edge * edge * sizeof(std::uint32_t);
    const std::vector<char> from(bytes, 'a');
    std::vector<char> to(bytes);
    compare(
        "drawBoard of 192 cells" + atScale(scale) + " | memcpy of its bytes",
        [&] { drawBoard(canvas, board, sprites, grid); },
        [&] {
            std::memcpy(to.data(), from.data(), bytes);
            asm volatile("" : : "r"(to.data()) : "memory");  // somebody may read it
        },
        20, {.times = scale == Scale() ? 1.5 : 1.3});
}

void measureButton() {
    Canvas canvas(windowSize, Scale());
    const ScreenButton box{.left = 225,
                           .top = 52,
                           .width = 225,
                           .height = 30,
                           .fillBrush = palette::backgroundBrush,
                           .framePen = palette::lightPen,
                           .textColour = palette::panelTextColour,
                           .font = {Typeface::SansBold, 14}};
    compare(
        "drawLabelledBox, framed, 'Training Game' | fill",
        [&] { drawLabelledBox(canvas, box, BoxStyle::Framed, true, 6, "Training Game"); },
        [&] { fillBox(canvas, box); }, 50, {.times = 12});
}

// What is known of each cell of a board, 12 a row.
using Board = std::array<std::int16_t, 192>;

// Numbers the clusters of a board of colours the plain way. Returns how many there are.
int labelClusters(const Board& colours, Board& labels) {
    std::array<int, 192> stack{};
    std::int16_t clusters = 0;
    labels.fill(0);
    for (int start = 0; start < 192; ++start) {
        const std::int16_t colour = colours[static_cast<std::size_t>(start)];
        if (colour == 0 || labels[static_cast<std::size_t>(start)] != 0)
            continue;
        std::size_t top = 0;
        labels[static_cast<std::size_t>(start)] = ++clusters;
        stack[top++] = start;
        while (top > 0) {
            const int cell = stack[--top];
            const auto visit = [&](int next, bool exists) {
                if (!exists || colours[static_cast<std::size_t>(next)] != colour ||
                    labels[static_cast<std::size_t>(next)] != 0)
                    return;
                labels[static_cast<std::size_t>(next)] = clusters;
                stack[top++] = next;
            };
            visit(cell + 1, cell % 12 != 11);
            visit(cell - 1, cell % 12 != 0);
            visit(cell + 12, cell < 180);
            visit(cell - 12, cell >= 12);
        }
    }
    return clusters;
}

// A stage with nothing to see, and a player who clicks one cluster or another on it.
class Player final : public QuietStage {
 public:
    Player() : QuietStage(state_) {}

    // Plays a Training game and keeps its clicks.
    void findMoves() {
        startGame();
        for (SeededRandom chance(1); state_.classicActive;) {
            Board labels{};
            const int clusters = labelClusters(board(), labels);
            const auto wanted = static_cast<std::int16_t>(chance.next() * clusters + 1);
            const auto cell = std::ranges::find(labels, wanted) - labels.begin();
            if (std::ranges::count(labels, wanted) < 2)
                continue;
            moves_.push_back({static_cast<std::int16_t>(cell % 12 * 28 + 14),
                              static_cast<std::int16_t>(cell / 12 * 28 + 14)});
            click(moves_.back());
        }
    }
    void play() {
        startGame();
        for (const auto& move : moves_)
            click(move);
    }
    std::size_t moves() const { return moves_.size(); }

    // The colours of a new board, or of what is left of it.
    Board board() const {
        Board colours{};
        state_.grid.forEachCell([&](CellPosition place, const GridCell& cell) {
            colours[static_cast<std::size_t>(place.row * 12 + place.column - 13)] = cell.colour;
        });
        return colours;
    }
    void startGame() {
        random_ = SeededRandom(1);
        state_.gameMode = GameMode::Training;
        state_.scoreTableIndex = 1;
        game_.startStandardGame();
    }

 private:
    struct Click {
        std::int16_t x = 0;
        std::int16_t y = 0;
    };
    void click(Click at) {
        Task<> task = game_.gameBoardClick(at.x, at.y);
        task.start();
    }

    GameState state_;
    SeededRandom random_{1};
    HighScores highScores_;
    LevelTable levels_;
    Game game_{state_, highScores_, levels_, random_, *this};
    std::vector<Click> moves_;
};

void measureTraining() {
    Player player;
    player.findMoves();
    const std::size_t moves = player.moves();
    const std::string what = "a Training game of " + std::to_string(moves) + " moves | a labelling a move";
    player.startGame();
    const Board board = player.board();
    compare(
        what.c_str(), [&] { player.play(); },
        [&] {
            for (std::size_t i = 0; i < moves; ++i) {
                Board labels;
                volatile int clusters = labelClusters(board, labels);
                static_cast<void>(clusters);
            }
        },
        5, {.times = 4});
}

// A window of the main one's size that ticks, shows itself at every tick, and ends with the last.
class TickingWindow final : public Window {
 public:
    TickingWindow(MessageLoop& messageLoop, milliseconds period)
        : Window(messageLoop), period_(period), timer_(messageLoop, [this] { return tick(); }) {
        setClientSize(windowSize);
        setBorderless();
        canvas().fill(canvas().bounds(), palette::backgroundColour);
        timer_.setInterval(period);
    }
    void startTicking(int ticks) {
        ticks_ = ticks;
        timer_.setEnabled(true);
    }
    std::vector<double> late;  // microseconds

 private:
    Task<> tick() {
        late.push_back(Microseconds(Clock::now() - (timer_.nextDue() - period_)).count());
        refresh();
        if (--ticks_ == 0)
            loop().end();
        co_return;
    }

    milliseconds period_;
    Timer timer_;
    int ticks_ = 0;
};

void measureRefresh(TickingWindow& window) {
    SDL_Window* native = SDL_GetWindowFromID(1);  // the process's first
    SDL_GetWindowSurface(native);
    compare(
        "whole refresh | SDL_UpdateWindowSurface", [&] { window.refresh(); },
        [&] { SDL_UpdateWindowSurface(native); }, 5, {.times = 1.1},
        5ms);  // for the server to finish
}

// The host's own timer, asked for a period so many times: how late it is, in microseconds.
std::vector<double> hostTimer(milliseconds period, int ticks) {
    std::vector<double> late;
    auto due = Clock::now();
    for (int i = 0; i < ticks; ++i) {
        due += period;
        const auto time = due.time_since_epoch().count();
        const timespec end{time / 1'000'000'000, time % 1'000'000'000};
        clock_nanosleep(CLOCK_MONOTONIC, TIMER_ABSTIME, &end, nullptr);
        late.push_back(Microseconds(Clock::now() - due).count());
    }
    return late;
}

void measureTimer(MessageLoop& loop, TickingWindow& window, milliseconds period) {
    constexpr int ticks = 200;
    constexpr double worst = 0.99;
    std::vector<double> host;
    std::thread watch([&] { host = hostTimer(period, ticks); });
    std::this_thread::sleep_for(period / 2);  // so that they do not come in each other's way
    window.startTicking(ticks);
    Task<> program = loop.run();
    program.start();
    const DesktopWait wait;
    while (!loop.ended()) {
        wait.sleep(SDL_GetWindowFromID(1), *loop.nextDeadline() - Clock::now());
        SDL_FlushEvents(SDL_FIRSTEVENT, SDL_LASTEVENT);
        loop.wake();
    }
    watch.join();
    report("lateness of 200 ticks, 99th percentile | the host's timer", quantile(window.late, worst) / 1000,
           quantile(host, worst) / 1000, "ms", {.more = 2});
}

}  // namespace
}  // namespace quabble::bench

int main(int argc, char** argv) {
    using namespace quabble;
    std::string problem;
    const auto frontEnd = argc == 2 ? SdlFrontEnd::open(problem) : nullptr;
    if (!frontEnd)
        return EXIT_FAILURE;
    const Surface sheet = readPicture(std::string(argv[1]) + "/ALLPICDATA.BMP");
    for (const int scale : {1, 2, 3})
        bench::measureBoard(sheet, Scale::ofQuarters(4 * scale));
    bench::measureButton();
    bench::measureTraining();
    bench::measureHeap(argv[1]);
    constexpr milliseconds shortestTick{100};  // that of the last level
    MessageLoop loop(*frontEnd);
    bench::TickingWindow window(loop, shortestTick);
    window.show();
    bench::measureRefresh(window);
    bench::measureTimer(loop, window, shortestTick);
    return EXIT_SUCCESS;
}
