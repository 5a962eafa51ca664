#pragma once

#include <gtest/gtest.h>

#include <functional>
#include <memory>

#include "machine.hpp"

namespace quabble {

// Someone who does anything at any time, as chance has it, and looks after every act whether all is well.
class Monkey {
 public:
    // A number below the one given, at least 0.
    using Chance = std::function<int(int)>;

    explicit Monkey(Chance chance) : upTo(std::move(chance)) {}

    void actAndCheck() {
        if (!machine_ || machine_->loop.ended()) {
            machine_ = std::make_unique<Machine>(static_cast<std::uint64_t>(upTo(256)));
            gamesEnded_ = 0;
            results_.clear();
        }
        const bool played = machine_->game.isGameActive();
        act();
        const GameState& game = machine_->game;
        gamesEnded_ += played && !game.isGameActive();
        if (machine_->loop.ended())
            return;
        const bool atEnd = !game.isGameActive() && !game.mainMenuActive;
        if (atEnd && machine_->user.top().traits.caption == "Game Statistics")
            results_.insert(machine_->user.topWindow());
        check();
    }

 private:
    void act() {
        Machine& machine = *machine_;
        const WindowId window = machine.app.frmQuabble().id();
        const int choice = upTo(1000);
        if (choice < 300)
            machine.clickCell(1 + upTo(12), 16 - upTo(8));
        else if (choice < 400)
            machine.clickStrip();
        else if (choice < 440)
            machine.game.mainMenuActive ? machine.clickMenu(1 + upTo(3)) : machine.clickPanel(6 + upTo(5));
        else if (choice < 500)
            machine.user.click(static_cast<float>(upTo(700)), static_cast<float>(upTo(600)));
        else if (choice < 600)
            machine.user.movePointer(static_cast<float>(upTo(240)), static_cast<float>(upTo(562)));
        else if (choice < 640)
            machine.user.press(machine.hasDialog() ? keys::enter : keys::tab);
        else if (choice < 690)
            choice < 650 ? machine.frontEnd.minimiseWindow(window) : machine.frontEnd.restoreWindow(window);
        else if (choice == 690)
            machine.user.clickCloseButton();
        else if (choice > 720)
            machine.user.wait(milliseconds(upTo(choice < 800 ? 1500 : 130)));
        else if (machine.game.arcadeActive && isSettled()) {  // near the end of the level
            machine.game.rowsEntered = 43 + 3 * machine.game.stats.level + upTo(2);
            machine.setBoard("..11....S/.222211aS/121112122122");
        }
    }

    // No move is under way: a message to no window would be taken at once.
    bool isSettled() {
        machine_->loop.post({WindowId::none, EventKind::MouseMove});
        const bool idle = machine_->loop.nextDeadline() == machine_->frontEnd.now();
        machine_->loop.wake();
        return idle && !machine_->hasDialog();
    }

    void check() {
        const GameState& game = machine_->game;
        const bool settled = isSettled();
        const int screens = game.mainMenuActive + game.classicActive + game.arcadeActive;
        const bool timed = game.arcadeActive && game.gameMode == GameMode::Timed && !machine_->isPaused();
        const bool mayTick = timed && !machine_->hasDialog();
        EXPECT_TRUE(screens == 1 || (screens == 0 && !settled)) << screens;
        EXPECT_FALSE(settled && game.boolProcessing);
        EXPECT_FALSE(game.mainMenuActive && machine_->isPaused());
        EXPECT_TRUE(machine_->app.frmQuabble().isBlockTimerOn() ? mayTick : !mayTick || !settled);
        EXPECT_EQ(results_.size(), gamesEnded_);
        if (settled && !machine_->isPaused())
            checkPicture(machine_->seenLetters());
    }

    // Right of the menu's buttons only the background is seen, whatever board is beneath.
    void checkPicture(const std::string& seen) {
        const std::string board = lettersOf(machine_->game.grid);
        const bool menu = machine_->game.mainMenuActive;
        EXPECT_EQ(menu ? seen.substr(104, 4) : seen, menu ? "????" : board);
        EXPECT_TRUE(menu || isFlat(machine_->picture(), machine_->cell(1 + upTo(12), 1 + upTo(16))));
        for (std::size_t i = 12; i < board.size() && !menu; ++i)
            EXPECT_FALSE(board[i - 12] != '.' && board[i] == '.') << "hangs in the air: " << board;
    }

    Chance upTo;
    std::unique_ptr<Machine> machine_;
    std::size_t gamesEnded_ = 0;
    std::set<WindowId> results_;
};

}  // namespace quabble
