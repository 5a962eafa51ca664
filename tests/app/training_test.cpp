#include <gtest/gtest.h>

#include <chrono>
#include <string>

#include "gfx/palette.hpp"
#include "machine.hpp"

namespace quabble {
namespace {

using namespace std::chrono_literals;

// The cluster of ones at (5, 16) empties column 5, lets column 6 fall and leaves the fours to play.
constexpr const char* beforeMove = ".....2.4.... .....1.4.... ...31134....";
constexpr const char* afterMove = ".......4.... .......4.... ....3234....";

bool isFramed(Machine& machine, std::int32_t left, std::int32_t top) {
    return machine.mainPicture().at(left, top) == palette::highlightColour;
}

TEST(MainMenu, HighlightsTheButtonThatThePointerIsStrictlyInside) {
    struct Case {
        const char* name;
        float x, y;
        bool inside;
    };
    constexpr Case cases[] = {
        {"left edge", 225, 60, false},       {"right of it", 226, 60, true},
        {"right edge", 450, 60, false},      {"left of it", 449.5F, 60, true},
        {"top edge", 300, 52, false},        {"below it", 300, 53, true},
        {"bottom edge", 300, 82, false},     {"above it", 300, 81, true},
        {"between buttons", 300, 95, false}, {"where a board will be", 500, 400, false}};
    Machine machine;
    for (const Case& edge : cases) {
        SCOPED_TRACE(edge.name);
        machine.user.movePointer(edge.x, edge.y);
        EXPECT_EQ(isFramed(machine, 225, 52), edge.inside);
        EXPECT_EQ(isFramed(machine, 449, 81), edge.inside);
        if (!edge.inside)
            machine.user.click(edge.x, edge.y);
        EXPECT_TRUE(machine.game.mainMenuActive);
        machine.user.movePointer(0, 0);
    }
}

TEST(MainMenu, HighlightFollowsThePointerAndOutlivesAGame) {
    Machine machine;
    machine.pointAtMenu(2);
    const int presented = machine.mainWindow().timesShown;
    machine.pointAtMenu(1);
    EXPECT_EQ(machine.mainWindow().timesShown, presented + 2);
    EXPECT_TRUE(isFramed(machine, 225, 52));
    EXPECT_FALSE(isFramed(machine, 225, 105));
    machine.user.movePointer(330, 60);
    EXPECT_EQ(machine.mainWindow().timesShown, presented + 2) << "moving within a button draws nothing";

    machine.clickMenu(1);
    machine.clickPanel(8);
    machine.closeDialog();
    machine.pointAtMenu(1);
    EXPECT_FALSE(isFramed(machine, 225, 52)) << "the button still counts as highlighted";
    machine.pointAtMenu(8);
    machine.pointAtMenu(1);
    EXPECT_TRUE(isFramed(machine, 225, 52));
}

TEST(SidePanel, OnlyButtonsReactAndComeBackWithTheMenusShadow) {
    Machine machine;
    machine.clickMenu(1);
    const Surface fresh = machine.mainPicture();
    for (const float y : {65.F, 145.F, 175.F, 225.F, 255.F}) {
        machine.user.movePointer(95, y);
        machine.user.click(95, y);
        EXPECT_EQ(bytesOf(machine.mainPicture()), bytesOf(fresh)) << "label or value box at " << y;
    }
    machine.user.movePointer(95, 305);
    EXPECT_TRUE(isFramed(machine, 25, 290));
    machine.user.movePointer(0, 0);
    const Surface left = machine.mainPicture();
    EXPECT_NE(bytesOf(left), bytesOf(fresh)) << "drawn back with a smaller shadow";
    machine.user.movePointer(95, 305);
    machine.user.movePointer(0, 0);
    EXPECT_EQ(bytesOf(machine.mainPicture()), bytesOf(left));
}

TEST(TrainingGame, ShowsAMoveStepByStepAndEndsAfterTheLastOne) {
    Machine machine;
    machine.start(1, ".....2...... .....1...... ...3113.....");
    struct Moment {
        milliseconds at;
        const char* rows;
        bool points;
    };
    constexpr Moment moments[] = {{0ms, ".....2...... ............ ...3..3.....", true},
                                  {249ms, ".....2...... ............ ...3..3.....", true},
                                  {250ms, "............ ............ ...3.23.....", true},
                                  {499ms, "............ ............ ...3.23.....", true},
                                  {500ms, "............ ............ ....323.....", false}};
    const TimePoint start = machine.frontEnd.now();
    machine.clickCell(5, 16);
    for (const Moment& moment : moments) {
        SCOPED_TRACE(moment.at.count());
        EXPECT_FALSE(machine.hasDialog());
        machine.user.wait(
            std::chrono::duration_cast<milliseconds>(start + moment.at - machine.frontEnd.now()));
        EXPECT_EQ(machine.seenRows(3), moment.rows);
        EXPECT_EQ(machine.isWrittenOn(5, 16), moment.points);
    }
    EXPECT_EQ(machine.game.stats.score, 6);
    EXPECT_TRUE(machine.hasDialog()) << "no move is left";
    machine.user.wait(1h);
    machine.closeDialog();
    EXPECT_TRUE(machine.game.mainMenuActive);

    machine.clickMenu(1);
    EXPECT_EQ(machine.game.stats.score + machine.game.stats.blocksCleared + machine.game.stats.largestCluster,
              0);
    EXPECT_EQ(machine.seenRows(16).find_first_not_of("123 "), std::string::npos)
        << "a full board of 3 colours";
}

TEST(Moves, DropTheClicksOnTheBoardThatComeMeanwhile) {
    struct Case {
        const char* name;
        int mode;
        milliseconds at;
    };
    constexpr Case cases[] = {{"classic, before the fall", 1, 100ms},
                              {"classic, before the columns close", 1, 400ms},
                              {"arcade, before the fall", 2, 50ms},
                              {"arcade, before the columns close", 2, 200ms}};
    for (const Case& click : cases) {
        SCOPED_TRACE(click.name);
        Machine machine;
        machine.start(click.mode, beforeMove);
        machine.clickCell(5, 16);
        machine.user.wait(click.at);
        machine.clickCell(8, 16);
        machine.user.wait(1s);
        EXPECT_EQ(machine.seenRows(3), afterMove);
        EXPECT_EQ(machine.game.stats.score, 6);
    }
}

TEST(Moves, LetEndGameActOnceWhenTheyAreDone) {
    for (const int mode : {1, 2, 3}) {
        const milliseconds end = mode == 1 ? 500ms : 250ms;
        for (milliseconds at = 0ms; at < end; at += 25ms) {
            SCOPED_TRACE(testing::Message() << "mode " << mode << " after " << at.count() << " ms");
            Machine machine;
            machine.start(mode, beforeMove);
            machine.clickCell(5, 16);
            machine.user.wait(at);
            machine.clickPanel(mode == 1 ? 8 : 10);
            machine.clickPanel(mode == 1 ? 8 : 10);
            machine.user.wait(end - at - 1ms);
            EXPECT_FALSE(machine.hasDialog());
            machine.user.wait(1ms);
            EXPECT_TRUE(machine.hasDialog());
            EXPECT_EQ(machine.seenRows(3), afterMove);
            machine.closeDialog();
            EXPECT_FALSE(machine.hasDialog());
            const Surface menu = machine.mainPicture();
            machine.clickCell(8, 16);
            machine.user.wait(10s);
            EXPECT_TRUE(machine.game.mainMenuActive);
            EXPECT_EQ(bytesOf(machine.mainPicture()), bytesOf(menu)) << "nothing draws over the menu";
        }
    }
}

TEST(Program, EndsWheneverItIsAskedTo) {
    for (milliseconds at = 0ms; at <= 500ms; at += 25ms) {
        SCOPED_TRACE(at.count());
        for (const bool byCloseButton : {true, false}) {
            Machine machine;
            machine.start(1, beforeMove);
            machine.clickCell(5, 16);
            machine.user.wait(at);
            if (byCloseButton)
                machine.user.clickCloseButton();
            else
                machine.loop.requestEnd();
            EXPECT_TRUE(byCloseButton || machine.loop.ended());
            machine.user.wait(1s);
            EXPECT_TRUE(machine.loop.ended());
            EXPECT_TRUE(machine.frontEnd.windows().empty());
        }
    }
    Machine machine;
    machine.clickMenu(8);
    EXPECT_TRUE(machine.loop.ended());
}

TEST(Program, WaitsWithClosingUntilADialogIsClosedUnlessTheDesktopEndsIt) {
    Machine machine;
    machine.clickMenu(1);
    machine.clickPanel(8);
    const WindowId dialog = machine.user.topWindow();
    machine.loop.post({machine.app.frmQuabble().id(), EventKind::CloseButton});
    machine.loop.wake();
    EXPECT_FALSE(machine.loop.ended());
    EXPECT_EQ(machine.user.topWindow(), dialog);
    machine.user.clickCloseButton();
    EXPECT_TRUE(machine.game.mainMenuActive) << "closing the dialog by its frame is closing it";
    machine.clickMenu(2);
    machine.clickPanel(10);
    machine.loop.requestEnd();
    EXPECT_TRUE(machine.loop.ended());
    EXPECT_FALSE(machine.frontEnd.windows().contains(machine.app.frmQuabble().id()));
}

TEST(Pause, CoversEverythingUntilAClickThatDoesNothingElse) {
    struct Case {
        const char* name;
        void (*pause)(Machine&);
        bool minimises;
    };
    constexpr Case cases[] = {{"button", [](Machine& machine) { machine.clickPanel(6); }, false},
                              {"key", [](Machine& machine) { machine.user.press('q'); }, true},
                              {"frame", [](Machine& machine) { machine.user.minimise(); }, true}};
    for (const Case& way : cases) {
        for (const milliseconds at : {0ms, 100ms, 1000ms}) {
            SCOPED_TRACE(testing::Message() << way.name << " after " << at.count() << " ms");
            Machine machine;
            machine.start(1, beforeMove);
            machine.clickCell(5, 16);
            machine.user.wait(at);
            way.pause(machine);
            machine.user.wait(1s);
            EXPECT_TRUE(machine.app.frmQuabble().isPaused());
            EXPECT_EQ(machine.mainWindow().minimised, way.minimises);
            for (const Point corner :
                 {Point{0, 0}, Point{674, 0}, Point{0, 561}, Point{674, 561}, Point{300, 400}})
                EXPECT_EQ(machine.mainPicture().at(corner.x, corner.y), palette::pauseBackground);

            if (way.minimises) {
                machine.user.press('q');
                machine.user.restore();
            }
            machine.user.press('q');
            EXPECT_FALSE(machine.mainWindow().minimised) << "a paused game does not hide";
            const Surface beneath = machine.app.frmQuabble().canvas().picture;
            machine.user.movePointer(95, 385);
            machine.clickPanel(8);
            EXPECT_FALSE(machine.app.frmQuabble().isPaused());
            EXPECT_FALSE(machine.hasDialog());
            EXPECT_EQ(bytesOf(machine.mainPicture()), bytesOf(beneath));
            EXPECT_EQ(machine.seenRows(3), afterMove) << "the move went on behind the notice";
        }
    }
    Machine machine;
    machine.user.press('q');
    EXPECT_TRUE(machine.mainWindow().minimised);
    EXPECT_FALSE(machine.app.frmQuabble().isPaused());
}

}  // namespace
}  // namespace quabble
