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

    // What else is to be well after every act.
    using Check = std::function<void(Machine&)>;

    explicit Monkey(
        Chance chance, Check alsoCheck = [](Machine&) {})
        : upTo(std::move(chance)), alsoCheck_(std::move(alsoCheck)) {}

    // It goes to the end of levels by a way that no player has, and that no record tells of.
    void skipRows() { skipsRows_ = true; }

    // Whether the next act begins on a machine of its own.
    bool beginsAnew() const { return !machine_ || machine_->program.ended(); }
    std::string record() const { return recordOf(machine_->program); }

    void actAndCheck() {
        if (beginsAnew()) {
            machine_ = std::make_unique<Machine>(static_cast<std::uint64_t>(upTo(256)));
            gamesEnded_ = 0;
            results_.clear();
        }
        const bool played = machine_->game.isGameActive();
        act();
        const GameState& game = machine_->game;
        gamesEnded_ += played && !game.isGameActive();
        if (machine_->program.ended())
            return;
        const bool atEnd = !game.isGameActive() && !game.mainMenuActive;
        if (atEnd && machine_->user.top().traits.caption == "Game Statistics")
            results_.insert(machine_->user.topWindow());
        check();
    }

 private:
    void act() {
        const int choice = upTo(1000);
        if (choice < 300)
            machine_->clickCell(1 + upTo(12), 16 - upTo(8));
        else if (choice < 400)
            machine_->clickStrip();
        else if (choice < 440)
            clickButton();
        else if (choice < 500)
            machine_->user.click(static_cast<float>(upTo(700)), static_cast<float>(upTo(600)));
        else if (choice < 530)
            walk();
        else if (choice < 600)
            machine_->user.movePointer(static_cast<float>(upTo(240)), static_cast<float>(upTo(562)));
        else if (choice < 640)
            machine_->user.press(machine_->hasDialog() ? keys::enter : keys::tab);
        else if (choice < 650)
            machine_->frontEnd.minimiseWindow(machine_->program.frmQuabble().id());
        else if (choice < 690)
            machine_->frontEnd.restoreWindow(machine_->program.frmQuabble().id());
        else if (choice == 690)
            machine_->user.clickCloseButton();
        else if (choice <= 720)
            skipToLastRows();
        else if (choice < 800)
            machine_->user.wait(milliseconds(upTo(1500)));
        else
            machine_->user.wait(milliseconds(upTo(130)));
    }

    void clickButton() {
        if (machine_->game.mainMenuActive)
            machine_->clickMenu(1 + upTo(3));
        else
            machine_->clickPanel(6 + upTo(5));
    }

    void walk() {
        constexpr EditCommand arrows[] = {EditCommand::Left, EditCommand::Right, EditCommand::Up,
                                          EditCommand::Down};
        for (int i = upTo(20); i >= 0; --i)
            machine_->user.edit(arrows[upTo(4)]);
        machine_->user.edit(EditCommand::Click);
        hasWalked_ = true;
    }

    // The ring goes; the mouse comes to another place each time.
    void takeMouse() {
        mouseX_ = mouseX_ == 0 ? 1 : 0;
        machine_->user.movePointer(mouseX_, 0);
        hasWalked_ = false;
    }

    // Goes near the end of the level, on a board with something of everything.
    void skipToLastRows() {
        if (!skipsRows_ || !machine_->game.arcadeActive || !isSettled())
            return;
        machine_->game.rowsEntered = 43 + 3 * machine_->game.stats.level + upTo(2);
        machine_->setBoard("..11....S/.222211aS/121112122122");
    }

    // No move is under way: a message to no window would be taken at once.
    bool isSettled() {
        machine_->program.post({WindowId::none, EventKind::MouseMove});
        const bool idle = machine_->program.nextDeadline() == machine_->frontEnd.now();
        machine_->program.wake();
        return idle && !machine_->hasDialog();
    }

    void check() {
        const GameState& game = machine_->game;
        const bool settled = isSettled();
        const bool paused = machine_->isPaused();
        const bool isTimed = game.arcadeActive && game.gameMode == GameMode::Timed;
        const bool mayTick = isTimed && !paused && !machine_->hasDialog();
        const bool ticks = machine_->program.frmQuabble().isBlockTimerOn();
        const int screens = game.mainMenuActive + game.classicActive + game.arcadeActive;
        EXPECT_LE(screens, 1);
        if (!mayTick) {
            EXPECT_FALSE(ticks);
        }
        if (game.mainMenuActive) {
            EXPECT_FALSE(paused);
        }
        EXPECT_EQ(results_.size(), gamesEnded_);
        alsoCheck_(*machine_);
        if (upTo(100) == 99)
            checkPainting();
        if (!settled)
            return;
        EXPECT_EQ(screens, 1);
        EXPECT_EQ(ticks, mayTick);
        EXPECT_FALSE(game.boolProcessing);
        if (paused)
            return;
        if (hasWalked_)
            takeMouse();
        if (game.mainMenuActive)
            checkMenu();
        else
            checkBoard();
    }

    // A window that is painted whole, as at another scale and back, shows what it has shown.
    void checkPainting() {
        const auto before = machine_->frontEnd.windows();
        for (const Scale scale : {Scale::ofQuarters(6), Scale()}) {
            machine_->frontEnd.rescale(scale);
            machine_->program.wake();
        }
        for (const auto& [window, shown] : machine_->frontEnd.windows())
            EXPECT_TRUE(shown.picture == before.at(window).picture) << shown.traits.caption;
    }

    // Right of the menu's buttons only the background is seen, whatever board is beneath.
    void checkMenu() { EXPECT_EQ(machine_->seenLetters().substr(104, 4), "????"); }

    void checkBoard() {
        const std::string board = lettersOf(machine_->game.grid);
        EXPECT_EQ(machine_->seenLetters(), board);
        EXPECT_TRUE(isFlat(machine_->picture(), machine_->cell(1 + upTo(12), 1 + upTo(16))));
        for (std::size_t i = 12; i < board.size(); ++i) {
            if (board[i] == '.') {
                EXPECT_EQ(board[i - 12], '.') << "hangs in the air: " << board;
            }
        }
    }

    Chance upTo;
    Check alsoCheck_;
    bool skipsRows_ = false;
    std::unique_ptr<Machine> machine_;
    std::size_t gamesEnded_ = 0;
    std::set<WindowId> results_;
    bool hasWalked_ = false;
    float mouseX_ = 0;
};

}  // namespace quabble
