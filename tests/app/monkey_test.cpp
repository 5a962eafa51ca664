#include <gtest/gtest.h>

#include <cstdlib>
#include <memory>
#include <random>
#include <set>
#include <string>

#include "machine.hpp"

namespace quabble {
namespace {

// Someone who does anything at any time, from a seed.
class Monkey {
 public:
    explicit Monkey(std::uint64_t seed) : random_(seed) { startProgram(); }

    // Does one thing and returns what is wrong after it, nothing if all is well.
    std::string actAndCheck() {
        const bool playedBefore = machine_->game.isGameActive();
        act();
        if (machine_->loop.ended()) {
            startProgram();
            return {};
        }
        const GameState& game = machine_->game;
        gamesEnded_ += playedBefore && !game.isGameActive() ? 1 : 0;
        const bool dialog = machine_->hasDialog() && machine_->user.top().traits.caption == "Game Statistics";
        if (dialog && !game.isGameActive() && !game.mainMenuActive)
            results_.insert(machine_->user.topWindow());
        return whatIsWrong();
    }

    std::string lastAct() const { return lastAct_; }

 private:
    void startProgram() {
        gamesEnded_ = 0;
        results_.clear();
        machine_ = std::make_unique<Machine>(random_());
    }

    int upTo(int limit) { return static_cast<int>(random_() % static_cast<unsigned>(limit)); }

    void act() {
        Machine& machine = *machine_;
        const GameState& game = machine.game;
        const int choice = upTo(1000);
        lastAct_ = std::to_string(choice);
        if (choice < 300) {
            machine.clickCell(1 + upTo(12), 16 - upTo(8));
        } else if (choice < 400) {
            machine.clickStrip();
        } else if (choice < 440) {
            const int button = upTo(20) == 0 ? 1 + upTo(10) : 6 + upTo(5);
            game.mainMenuActive ? machine.clickMenu(1 + button % 3) : machine.clickPanel(button);
        } else if (choice < 500) {
            machine.user.click(static_cast<float>(upTo(700)), static_cast<float>(upTo(600)));
        } else if (choice < 600) {
            machine.user.movePointer(static_cast<float>(upTo(240)), static_cast<float>(upTo(562)));
        } else if (choice < 640) {
            machine.user.press(machine.hasDialog() ? keys::enter : static_cast<std::int16_t>(upTo(128)));
        } else if (choice < 650) {
            machine.frontEnd.minimiseWindow(machine.app.frmQuabble().id());
            machine.loop.wake();
        } else if (choice < 690) {
            machine.frontEnd.restoreWindow(machine.app.frmQuabble().id());
            machine.loop.wake();
        } else if (choice < 691) {
            machine.user.clickCloseButton();
        } else if (choice < 720) {
            prepare();
        } else {
            machine.user.wait(milliseconds(upTo(4) == 0 ? upTo(1500) : upTo(130)));
        }
    }

    // Brings the end of a level near, with room for more rows.
    void prepare() {
        GameState& game = machine_->game;
        if (!game.arcadeActive || !isSettled())
            return;
        game.rowsEntered = machine_->app.levelTable[game.stats.level].rowsToComplete - 1 - upTo(2);
        machine_->setBoard("..11....#... .222211a#... 121112122122");
    }

    // Nothing is under way and no dialog is open.
    bool isSettled() { return !machine_->hasDialog() && machine_->isIdle(); }

    std::string whatIsWrong() {
        const GameState& game = machine_->game;
        const MainWindow& window = machine_->app.frmQuabble();
        const bool settled = isSettled();
        const int screens =
            (game.mainMenuActive ? 1 : 0) + (game.classicActive ? 1 : 0) + (game.arcadeActive ? 1 : 0);
        const bool timedGame = game.arcadeActive && game.gameMode == GameMode::Timed;
        if (screens > 1 || (settled && screens == 0))
            return "screens at once: " + std::to_string(screens);
        if (settled && game.boolProcessing)
            return "boolProcessing is set although no move is under way";
        if (game.mainMenuActive && window.isPaused())
            return "paused on the menu";
        if (window.isBlockTimerOn() && (!timedGame || window.isPaused() || machine_->hasDialog()))
            return "the block timer is on";
        if (settled && timedGame && !window.isPaused() && !window.isBlockTimerOn())
            return "the block timer is off in a running Timed game";
        if (static_cast<int>(results_.size()) != gamesEnded_)
            return "games " + std::to_string(gamesEnded_) + ", results " + std::to_string(results_.size());
        if (!settled)
            return {};
        return game.mainMenuActive ? whatIsWrongOnTheMenu() : whatIsWrongOnTheBoard();
    }

    // The menu covers the board; right of its buttons only the background is seen.
    std::string whatIsWrongOnTheMenu() {
        const std::string seen = machine_->seenRows(16);
        for (std::size_t row = 0; row < 16; ++row) {
            if (seen.substr(13 * row + 8, 4) != "????")
                return "something is drawn over the menu: " + seen;
        }
        return {};
    }

    std::string whatIsWrongOnTheBoard() {
        std::string board;
        machine_->game.grid.forEachCell([&](CellPosition place, const GridCell& cell) {
            board += place.column == 1 && place.row > 1 ? " " : "";
            board += tileLetters[static_cast<std::size_t>(cell.tile)];
        });
        for (std::size_t i = 0; i + 13 < board.size(); ++i) {
            if (board[i] != '.' && board[i + 13] == '.')
                return "a block hangs in the air: " + board;
        }
        if (machine_->app.frmQuabble().isPaused())
            return {};
        if (const std::string seen = machine_->seenRows(16); seen != board)
            return "seen: " + seen + "\nplayed: " + board;
        const auto place =
            CellPosition{static_cast<std::int16_t>(1 + upTo(12)), static_cast<std::int16_t>(1 + upTo(16))};
        return machine_->isWrittenOn(place.column, place.row) ? "points are left on the board" : "";
    }

    std::mt19937_64 random_;
    std::unique_ptr<Machine> machine_;
    std::string lastAct_;
    int gamesEnded_ = 0;
    std::set<WindowId> results_;
};

TEST(Monkey, FindsNothingWrong) {
    const char* wished = std::getenv("QUABBLE_MONKEY_EVENTS");
    const long events = wished == nullptr ? 20'000 : std::strtol(wished, nullptr, 10);
    constexpr std::uint64_t seeds = 4;
    for (std::uint64_t seed = 1; seed <= seeds; ++seed) {
        Monkey monkey(seed);
        for (long event = 1; event <= events / static_cast<long>(seeds); ++event) {
            const std::string wrong = monkey.actAndCheck();
            ASSERT_EQ(wrong, "") << "seed " << seed << ", event " << event << ", act " << monkey.lastAct();
        }
    }
}

}  // namespace
}  // namespace quabble
