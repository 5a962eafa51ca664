#include <gtest/gtest.h>

#include <algorithm>
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

TEST(TrainingGame, ShowsAMoveStepByStepAndEndsAfterTheLastOne) {
    MachineInAMove machine(1, 0ms, lastCluster);
    using Moment = std::tuple<milliseconds, const char*, bool>;
    for (const auto& [later, rows, points] :
         {Moment{0, ".....2//...3..3", true}, Moment{249, ".....2//...3..3", true},
          Moment{1, "...3.23", true}, Moment{249, "...3.23", true}, Moment{1, "....323", false}}) {
        EXPECT_FALSE(machine.hasDialog());
        machine.user.wait(later);
        EXPECT_EQ(machine.seenBoard(), rows);
        EXPECT_NE(isFlat(machine.picture(), machine.cell(5, 16)), points) << rows;
    }
    const GameStats& stats = machine.game.stats;
    EXPECT_TRUE(machine.hasDialog());
    EXPECT_EQ(stats.score, 6);
    EXPECT_EQ(stats.blocksCleared, 3);
    machine.closeDialog();
    machine.clickMenu(1);
    EXPECT_EQ(stats.score + stats.blocksCleared + stats.largestCluster, 0)
        << "a second game starts at nothing";
}

TEST(Moves, LetEndGameActOnceWhenTheyAreDone) {
    for (const auto& [mode, button, end] : {std::tuple{1, 8, 500ms}, {2, 10, 250ms}, {3, 10, 250ms}}) {
        for (milliseconds at = 0ms; at < end; at += 25ms) {
            SCOPED_TRACE(testing::Message() << "mode " << mode << " after " << at.count() << " ms");
            MachineInAMove machine(mode, at);
            machine.clickPanel(button);
            machine.clickPanel(button);
            machine.user.wait(end - at - 1ms);
            EXPECT_FALSE(machine.hasDialog());
            machine.user.wait(1ms);
            EXPECT_TRUE(machine.hasDialog());
            EXPECT_EQ(machine.seenBoard(), afterMove);
            machine.closeDialog();
            machine.user.wait(10s);
            EXPECT_TRUE(machine.game.mainMenuActive);
            EXPECT_FALSE(machine.hasDialog());
        }
    }
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

// The waiting row's cells from the right: "+" shows plainly, "-" darkened.
std::string seenStrip(Machine& machine) {
    std::string seen;
    for (std::int32_t i = 11; i >= 0; --i) {
        const Colour tile = tileColour(machine.game.nextRow[static_cast<std::size_t>(i)].tile);
        const Colour pixel = machine.picture().at(259 + 28 * i, 531);
        seen += pixel == tile ? '+' : pixelOf(pixel) == (pixelOf(tile) & pixelOf(maskColour)) ? '-' : '?';
    }
    return seen;
}

TEST(TimedGame, UncoversAndPushesRowsUntilTheLevelIsComplete) {
    Machine machine;
    machine.clickMenu(2);
    const auto isFull = [&](int y) { return machine.picture().at(630, 135 + y) == fullGaugeColour; };
    for (std::size_t row = 1; row <= 48; ++row) {
        for (std::size_t tick = 1; tick <= 12; ++tick) {
            machine.user.wait(249ms);
            EXPECT_EQ(seenStrip(machine), std::string(tick, '+') + std::string(12 - tick, '-')) << row;
            if (tick == 12 && row % 8 == 0)
                machine.setBoard("121212121212");
            machine.user.wait(1ms);
        }
        if (row == 24) {
            EXPECT_TRUE(isFull(119));
            EXPECT_FALSE(isFull(120)) << "120.5 is rounded to the even number";
        }
    }
    EXPECT_TRUE(isFull(240));
    ASSERT_TRUE(machine.hasDialog());
    EXPECT_TRUE(machine.seenBoard().starts_with("121212121212/")) << "the last row has entered";
    machine.user.wait(1h);
    machine.closeDialog();
    EXPECT_EQ(std::ranges::count(machine.seenBoard(), '/'), 4) << "5 rows on level 2";
    machine.user.wait(166ms);
    EXPECT_EQ(machine.game.tickCount, 0);
    EXPECT_FALSE(isFull(0));
    machine.user.wait(1ms);
    EXPECT_EQ(machine.game.tickCount, 1);
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
    EXPECT_EQ(seenStrip(machine), "+-----------");
    machine.user.wait(12 * 250ms - 1ms);
    EXPECT_EQ(machine.game.rowsEntered, 0);
    machine.user.wait(1ms);
    EXPECT_EQ(machine.game.rowsEntered, 1);
}

TEST(StrategyGame, BombExplodesFallsClosesReleasesStonesAndBringsOneRow) {
    Machine machine;
    machine.start(3, "....2/...31Sa14");
    machine.clickCell(7, 16);
    using Moment = std::pair<milliseconds, const char*>;
    for (const auto& [later, rows] :
         {Moment{0, "....2/...3WSWW4"}, Moment{75, "....2/...3XSXX4"}, Moment{75, "....2/...3YSYY4"},
          Moment{75, "....2/...3ZSZZ4"}, Moment{100, "....2/...3.S..4"}, Moment{250, "...32S..4"},
          Moment{249, "...32S..4"}, Moment{1, "...32s4"}, Moment{120, "...32.4"}, Moment{100, "....324"}}) {
        machine.user.wait(later);
        EXPECT_EQ(machine.seenBoard(), rows);
    }
    machine.user.wait(99ms);
    EXPECT_EQ(machine.game.rowsEntered, 0);
    EXPECT_EQ(machine.game.stats.score, 0);
    machine.user.wait(1s);
    EXPECT_EQ(machine.game.rowsEntered, 1);
}

TEST(Dialogs, HaveOneOkButtonAndARingAroundItWhileItHasTheFocus) {
    Machine machine;
    machine.app.highScores.table(1) = {};
    machine.start(1, cluster);
    machine.clickCell(5, 16);
    machine.user.wait(1s);
    machine.clickPanel(8);
    Surface inResult(90, 30);
    inResult.copy(inResult.bounds(), machine.user.top().picture, {186, 204});
    machine.closeDialog();
    for (const Colour around : {palette::backgroundColour, palette::valueColour}) {
        const Surface& picture = machine.user.top().picture;
        Surface inNameEntry(90, 30);
        inNameEntry.copy(inNameEntry.bounds(), picture, {135, 156});
        EXPECT_TRUE(inNameEntry == inResult);
        for (const Point at : {Point{133, 154}, {134, 170}, {180, 187}, {226, 187}})
            EXPECT_EQ(picture.at(at.x, at.y), around) << at.x;
        machine.user.press(keys::tab);
    }
}

}  // namespace
}  // namespace quabble
