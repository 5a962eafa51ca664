#include <gtest/gtest.h>

#include "machine.hpp"

namespace quabble {
namespace {

using namespace std::chrono_literals;

constexpr Colour ringColour{255, 255, 255};  // which nothing else has

// Someone who has no mouse, and goes by the ring.
struct KeyboardMachine : Machine {
    using Machine::Machine;

    // The place that is ringed; an empty one without a ring.
    Rect ring() {
        const Surface& seen = user.top().picture;
        Rect ring{seen.width(), seen.height(), 0, 0};
        for (std::int32_t y = 0; y < seen.height(); ++y) {
            const auto row = seen.row(y);
            const auto first = std::ranges::find(row, pixelOf(ringColour));
            if (first == row.end())
                continue;
            const auto last = std::find(row.rbegin(), row.rend(), pixelOf(ringColour));
            ring = {std::min(ring.left, static_cast<std::int32_t>(first - row.begin())),
                    std::min(ring.top, y), std::max(ring.right, static_cast<std::int32_t>(row.rend() - last)),
                    y + 1};
        }
        return ring;
    }

    // Goes across first, then up or down, until the ring holds the point.
    void walkTo(std::int32_t x, std::int32_t y) {
        if (ring().isEmpty())
            user.edit(EditCommand::Up);
        int steps = 0;
        for (Rect at = ring(); !at.contains(x, y); at = ring()) {
            ASSERT_LT(++steps, 40) << "on the way to " << x << ", " << y;
            if (x < at.left)
                user.edit(EditCommand::Left);
            else if (x >= at.right)
                user.edit(EditCommand::Right);
            else
                user.edit(y < at.top ? EditCommand::Up : EditCommand::Down);
        }
    }
    void clickBy(std::int32_t x, std::int32_t y) {
        walkTo(x, y);
        user.edit(EditCommand::Click);
    }
};

TEST(Keyboard, StepsFromPlaceToPlace) {
    KeyboardMachine machine;
    machine.clickMenu(3);
    const auto after = [&](const char* keys) {
        for (const char* key = keys; *key != '\0'; ++key)
            machine.user.edit(*key == 'L'   ? EditCommand::Left
                              : *key == 'R' ? EditCommand::Right
                              : *key == 'U' ? EditCommand::Up
                                            : EditCommand::Down);
        return machine.ring();
    };
    const Rect pause = Rect::ofSize(25, 370, 140, 30), endGame = Rect::ofSize(25, 450, 140, 30);
    const Rect strip = Rect::ofSize(232, 504, 336, 28);
    EXPECT_TRUE(after("").isEmpty());
    machine.user.movePointer(330, 110);
    EXPECT_EQ(after("L"), machine.cell(4, 3)) << "the first key shows where the pointer is";
    EXPECT_EQ(after("RRD"), machine.cell(6, 4));
    EXPECT_EQ(after("UUUUL"), machine.cell(5, 1)) << "there is nothing above the board";
    EXPECT_EQ(after("LLLLL"), pause);
    EXPECT_EQ(after("R"), machine.cell(1, 1)) << "where it came from";
    EXPECT_EQ(after("RRDDDDDDDDDDDDDDDD"), strip);
    EXPECT_EQ(after("U"), machine.cell(3, 16));
    EXPECT_EQ(after("DL"), endGame);
    EXPECT_EQ(after("DUUUUR"), machine.cell(1, 13)) << "beside the button";
    EXPECT_EQ(after("RRRRRRRRRRRRRRRRR"), machine.cell(12, 13));
}

TEST(Keyboard, TheRingGoesWhenTheMouseIsUsedAndNotBefore) {
    KeyboardMachine machine;
    machine.user.movePointer(95, 100);
    const Surface plain = machine.picture();
    machine.user.edit(EditCommand::Click);
    EXPECT_TRUE(machine.game.mainMenuActive) << "nobody clicks where no ring was seen";
    EXPECT_EQ(machine.ring(), Rect::ofSize(225, 105, 225, 30));
    machine.user.movePointer(95, 100);
    EXPECT_FALSE(machine.ring().isEmpty()) << "the mouse has not moved";
    machine.user.movePointer(96, 100);
    machine.user.movePointer(337, 120);
    EXPECT_TRUE(machine.ring().isEmpty());
    machine.user.edit(EditCommand::Down);
    machine.user.click(20, 20);
    EXPECT_TRUE(machine.ring().isEmpty());
    machine.user.press('q');
    machine.user.edit(EditCommand::Down);
    EXPECT_TRUE(machine.ring().isEmpty()) << "in a minimised window";
}

TEST(Keyboard, EndsAPauseAndNothingElseOfIt) {
    KeyboardMachine machine;
    machine.start(1, "....11");
    machine.clickBy(95, 305);  // Pause
    ASSERT_TRUE(machine.isPaused());
    EXPECT_EQ(machine.ring(), Rect::ofSize(0, 0, 675, 562));
    machine.user.edit(EditCommand::Click);
    EXPECT_FALSE(machine.isPaused());
    machine.walkTo(machine.cell(5, 16).left + 14, machine.cell(5, 16).top + 14);
    machine.user.press('q');
    machine.user.edit(EditCommand::Click);
    EXPECT_TRUE(machine.isPaused()) << "a hidden game";
    machine.user.restore();
    machine.user.edit(EditCommand::Click);
    EXPECT_FALSE(machine.isPaused());
    EXPECT_EQ(machine.game.stats.score, 0) << "the click only resumed";
    machine.user.edit(EditCommand::Click);
    EXPECT_EQ(machine.game.stats.score, 3);
}

TEST(Keyboard, KeysInMidMoveActAfterTheStepAsTheMouseDoes) {
    KeyboardMachine machine;
    machine.start(3, "....2/11131111");
    const Rect first = machine.cell(2, 16);
    machine.clickBy(first.left + 14, first.top + 14);
    machine.user.wait(100ms);
    for (const EditCommand command : {EditCommand::Right, EditCommand::Right, EditCommand::Click})
        machine.user.edit(command);
    EXPECT_EQ(machine.ring(), first) << "during a pause nothing is delivered";
    machine.user.wait(25ms);
    EXPECT_EQ(machine.ring(), machine.cell(4, 16));
    machine.user.wait(1s);
    EXPECT_EQ(machine.game.stats.score, 6) << "during a move the board takes no clicks";
}

}  // namespace
}  // namespace quabble
