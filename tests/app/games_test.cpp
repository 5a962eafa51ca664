#include <gtest/gtest.h>

#include <functional>

#include "machine.hpp"

namespace quabble {
namespace {

using namespace std::chrono_literals;

// The cluster of ones at (5, 16) empties column 5 and lets column 6 fall; the fours stay, if there are any.
constexpr const char* lastCluster = ".....2/.....1/...3113";
constexpr const char* cluster = ".....2.4/.....1.4/...31134";
constexpr const char* afterMove = ".......4/.......4/....3234";
struct MachineInAMove : Machine {
    MachineInAMove(int mode, milliseconds at, const char* rows = cluster) {
        start(mode, rows);
        clickCell(5, 16);
        user.wait(at);
    }
};

TEST(MainMenu, HighlightsTheButtonUnderThePointer) {
    Machine machine;
    const auto isFramed = [&](int top) { return machine.picture().at(225, top) == palette::highlightColour; };
    constexpr float points[][2] = {{225, 60}, {226, 60}, {450, 60}, {449.5F, 60}, {300, 52},
                                   {300, 53}, {300, 82}, {300, 81}, {300, 95},    {300, 60}};
    for (std::size_t i = 0; i < 10; ++i) {  // outside and inside by turns
        machine.user.movePointer(points[i][0], points[i][1]);
        EXPECT_EQ(isFramed(52), i % 2 == 1) << i;
    }
    const int presented = machine.shown().timesShown;
    machine.pointAtMenu(2);
    machine.user.movePointer(330, 120);
    EXPECT_TRUE(isFramed(105));
    EXPECT_FALSE(isFramed(52));
    EXPECT_EQ(machine.shown().timesShown, presented + 2);
    machine.clickMenu(2);
    machine.clickPanel(10);
    machine.closeDialog();
    machine.pointAtMenu(2);
    EXPECT_FALSE(isFramed(105)) << "after a game the button still counts as highlighted";
    machine.pointAtMenu(8);
    machine.pointAtMenu(2);
    machine.user.press('q');
    EXPECT_TRUE(isFramed(105));
    EXPECT_TRUE(machine.shown().minimised);
    EXPECT_FALSE(machine.isPaused()) << "the menu only hides";
}

TEST(Pointer, IsAHandOverWhatCanBeClicked) {
    Machine machine;
    const auto isHandAt = [&](float x, float y) {
        machine.user.movePointer(x, y);
        return machine.user.top().pointer == PointerShape::Hand;
    };
    EXPECT_TRUE(isHandAt(337, 67)) << "Training Game";
    EXPECT_FALSE(isHandAt(337, 95)) << "between two buttons";
    machine.pointAtMenu(4);
    machine.clickMenu(4);
    EXPECT_EQ(machine.shown().pointer, PointerShape::Arrow) << "below a dialog";
    EXPECT_TRUE(isHandAt(100, 420)) << "the button that closes the scores";
    EXPECT_FALSE(isHandAt(100, 200));
    machine.closeDialog();
    EXPECT_EQ(machine.shown().pointer, PointerShape::Hand) << "again above the menu";

    machine.pointAtMenu(3);
    machine.clickMenu(3);
    EXPECT_EQ(machine.shown().pointer, PointerShape::Arrow) << "a board came where the menu was";
    EXPECT_FALSE(isHandAt(95, 190)) << "a value";
    EXPECT_TRUE(isHandAt(95, 425)) << "Help";
    EXPECT_TRUE(isHandAt(400, 515)) << "the waiting row";
    machine.clickPanel(8);
    EXPECT_TRUE(isHandAt(10, 10)) << "the pause notice";
    machine.user.click(10, 10);
    EXPECT_EQ(machine.shown().pointer, PointerShape::Arrow);

    machine.clickPanel(10);
    EXPECT_FALSE(isHandAt(200, 100));
    EXPECT_TRUE(isHandAt(230, 215)) << "OK";
}

TEST(Program, EndsWheneverItIsAskedTo) {
    for (milliseconds at = 0ms; at <= 500ms; at += 25ms) {
        MachineInAMove closed(1, at);
        closed.user.clickCloseButton();
        closed.user.wait(1s);  // which a pause of the move does not notice before it is over
        EXPECT_TRUE(closed.program.ended()) << at.count();
        MachineInAMove told(1, at);
        told.program.requestEnd();
        EXPECT_TRUE(told.program.ended()) << at.count();
    }
    MachineInAMove atResult(1, 500ms, lastCluster);
    ASSERT_TRUE(atResult.hasDialog());
    atResult.program.requestEnd();
    EXPECT_TRUE(atResult.program.ended());
}

TEST(Program, IsNotClosedBehindADialog) {
    MachineInAMove machine(1, 500ms, lastCluster);
    machine.program.post({machine.program.frmQuabble().id(), EventKind::CloseButton});
    machine.program.wake();
    EXPECT_TRUE(machine.hasDialog());
    EXPECT_FALSE(machine.program.ended());
    machine.user.clickCloseButton();
    machine.clickMenu(8);
    EXPECT_TRUE(machine.program.ended()) << "Exit";
    EXPECT_TRUE(machine.frontEnd.windows().empty());
}

TEST(Pause, CoversEverythingUntilAClickThatDoesNothingElse) {
    struct Way {
        const char* name;
        std::function<void(Machine&)> pause;
        bool minimises;
    };
    const Way ways[] = {{"the panel's button", [](Machine& machine) { machine.clickPanel(6); }, false},
                        {"a key", [](Machine& machine) { machine.user.press('q'); }, true},
                        {"the window's frame", [](Machine& machine) { machine.user.minimise(); }, true}};
    for (const Way& way : ways) {
        SCOPED_TRACE(way.name);
        MachineInAMove machine(1, 100ms);
        way.pause(machine);
        machine.user.wait(1s);
        EXPECT_EQ(machine.shown().minimised, way.minimises);
        EXPECT_EQ(machine.picture().at(674, 561), palette::pauseBackground);
        EXPECT_TRUE(isFlat(machine.picture(), {0, 0, 675, 250}));
        machine.user.press('q');
        machine.user.restore();
        machine.user.press('q');
        EXPECT_FALSE(machine.shown().minimised) << "a paused game does not hide";
        const Surface beneath = machine.program.frmQuabble().canvas().picture();
        machine.user.movePointer(95, 385);
        machine.clickPanel(8);
        EXPECT_FALSE(machine.isPaused());
        EXPECT_FALSE(machine.hasDialog());
        EXPECT_TRUE(machine.picture() == beneath);
        EXPECT_EQ(machine.seenBoard(), afterMove) << "a move goes on behind the notice";
    }
}

TEST(TimedGame, GoesOnAfterAMoveAndAPauseWhereItStopped) {
    Machine machine;
    machine.start(2, cluster);
    machine.user.wait(200ms);
    machine.clickCell(5, 16);  // the tick at 250 ms does not count
    machine.user.wait(800ms);
    machine.clickPanel(8);
    machine.user.wait(10s);
    machine.clickStrip();
    machine.user.wait(250ms);
    EXPECT_EQ(machine.game.tickCount, 4);
    EXPECT_EQ(machine.game.rowsEntered, 0) << "the click only resumed";
}

TEST(TimedGame, BeginsItsFirstRowAnewAfterAGameThatEndedInMidRow) {
    Machine machine;
    machine.clickMenu(2);
    machine.user.wait(7 * 250ms);
    machine.clickPanel(10);
    machine.closeDialog();
    machine.clickMenu(2);
    EXPECT_EQ(machine.game.tickCount, 0);
    machine.user.wait(12 * 250ms - 1ms);
    EXPECT_EQ(machine.game.rowsEntered, 0);
    machine.user.wait(1ms);
    EXPECT_EQ(machine.game.rowsEntered, 1);
}

}  // namespace
}  // namespace quabble
