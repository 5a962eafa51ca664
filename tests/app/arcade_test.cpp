#include <gtest/gtest.h>

#include <chrono>
#include <map>
#include <string>

#include "gfx/palette.hpp"
#include "machine.hpp"

namespace quabble {
namespace {

using namespace std::chrono_literals;

// How many of the waiting row's cells show plainly; -1 when they are not the rightmost ones.
int revealedCells(Machine& machine) {
    int revealed = 0;
    for (std::int32_t i = 11; i >= 0; --i) {
        const Colour tile = sheet::tile(machine.game.nextRow[static_cast<std::size_t>(i)].tile);
        const Colour darkened = colourOf(pixelOf(tile) & pixelOf(sheet::mask));
        const Colour seen = machine.mainPicture().at(232 + 28 * i + 27, 504 + 27);
        if (seen == tile && revealed == 11 - i)
            ++revealed;
        else if (seen != darkened)
            return -1;
    }
    return revealed;
}

int filledGaugeRows(Machine& machine) {
    int filled = 0;
    while (filled < 241 && machine.mainPicture().at(630, 135 + filled) == sheet::fullGauge)
        ++filled;
    return filled;
}

bool showsText(const Surface& picture, const Rect& area) {
    for (std::int32_t y = area.top; y < area.bottom; ++y) {
        for (std::int32_t x = area.left; x < area.right; ++x) {
            if (picture.at(x, y) == palette::panelTextColour)
                return true;
        }
    }
    return false;
}

TEST(TimedGame, UncoversAndPushesRowsUntilTheLevelIsComplete) {
    Machine machine;
    machine.clickMenu(2);
    const std::map<int, int> gaugeAfterRow{{0, 0},    {1, 5},    {12, 60}, {24, 120},
                                           {36, 181}, {47, 236}, {48, 241}};
    for (int row = 1; row <= 48; ++row) {
        SCOPED_TRACE(row);
        if (const auto gauge = gaugeAfterRow.find(row - 1); gauge != gaugeAfterRow.end()) {
            EXPECT_EQ(filledGaugeRows(machine), gauge->second);
        }
        for (int tick = 1; tick <= 11; ++tick) {
            machine.user.wait(249ms);
            EXPECT_EQ(revealedCells(machine), tick);
            machine.user.wait(1ms);
            EXPECT_EQ(revealedCells(machine), tick + 1);
        }
        if (row % 8 == 0)
            machine.setBoard("121212121212");
        const GridRow waiting = machine.game.nextRow;
        machine.user.wait(250ms);
        std::string expected;
        for (const GridCell& cell : waiting)
            expected += tileLetters[static_cast<std::size_t>(cell.tile)];
        EXPECT_EQ(machine.seenRows(1), expected);
    }
    EXPECT_EQ(filledGaugeRows(machine), gaugeAfterRow.at(48));
    ASSERT_TRUE(machine.hasDialog());
    for (std::int32_t line = 0; line < 5; ++line)
        EXPECT_TRUE(showsText(machine.user.top().picture, Rect::ofSize(45, 45 + 18 * line, 380, 17))) << line;
    machine.user.wait(1h);
    EXPECT_EQ(machine.game.rowsEntered, 48) << "no row comes while the dialog is open";

    machine.closeDialog();
    EXPECT_EQ(machine.seenRows(16).substr(0, 13 * 11).find_first_not_of(". "), std::string::npos);
    EXPECT_EQ(machine.seenRows(5).find('.'), std::string::npos) << "level 2 starts with its own rows";
    EXPECT_EQ(filledGaugeRows(machine), 0);
    machine.user.wait(166ms);
    EXPECT_EQ(revealedCells(machine), 1);
    machine.user.wait(1ms);
    EXPECT_EQ(revealedCells(machine), 2);
}

TEST(TimedGame, GoesOnAfterAPauseWhereItStopped) {
    Machine machine;
    machine.clickMenu(2);
    machine.user.wait(750ms);
    machine.clickPanel(8);
    machine.user.wait(10s);
    EXPECT_EQ(machine.game.tickCount, 3);
    machine.clickStrip();
    EXPECT_EQ(machine.game.rowsEntered, 0) << "the click only resumes";
    machine.user.wait(250ms);
    EXPECT_EQ(revealedCells(machine), 5);
    machine.clickStrip();
    machine.user.wait(250ms);
    EXPECT_EQ(machine.game.rowsEntered, 1);
    EXPECT_EQ(machine.game.tickCount, 1);
}

TEST(TimedGame, StripClickedInAMoveEntersInTheMiddleOfIt) {
    Machine machine;
    machine.start(2, ".....2...... .....1...... ...3113.....");
    machine.clickCell(5, 16);
    machine.user.wait(124ms);
    machine.clickStrip();
    EXPECT_EQ(machine.game.rowsEntered, 0);
    machine.user.wait(1ms);
    EXPECT_EQ(machine.game.rowsEntered, 1);
    EXPECT_EQ(machine.seenRows(4).substr(0, 38), "............ ............ ...3.23.....")
        << "what was above the hole falls onto the new row";
}

TEST(ArcadeGames, LevelOrGameOverInAMoveLeavesWhatComesNextAlone) {
    for (const int mode : {2, 3}) {
        for (const bool lost : {false, true}) {
            SCOPED_TRACE(testing::Message() << "mode " << mode << (lost ? ", lost" : ", completed"));
            Machine machine;
            machine.start(mode, ".....2...... .....1...... ...3113.....");
            machine.game.rowsEntered = 47;
            if (lost)
                machine.game.grid.at({1, 1}) = GridCell::block(4);
            machine.clickCell(5, 16);
            machine.clickStrip();
            machine.user.wait(1s);
            ASSERT_TRUE(machine.hasDialog());
            machine.closeDialog();
            const Surface next = machine.mainPicture();
            EXPECT_EQ(machine.game.mainMenuActive, lost);
            machine.user.wait(166ms);
            EXPECT_EQ(bytesOf(machine.mainPicture()), bytesOf(next));
            EXPECT_EQ(machine.seenRows(16).find('?') != std::string::npos, lost) << "drawn over the menu";
            EXPECT_EQ(machine.game.rowsEntered, lost ? 47 : 0) << "the old move brings no row";
            machine.user.wait(1ms);
            EXPECT_EQ(machine.game.tickCount, mode == 2 && !lost ? 1 : 0) << "ticks count again";
        }
    }
}

TEST(StrategyGame, IsLostWhenTheRowOfAMoveFindsNoRoom) {
    Machine machine;
    std::string rows = "121212121212";
    for (int i = 0; i < 15; ++i)
        rows += i % 2 == 0 ? " 212121212121" : " 121212121212";
    machine.start(3, rows.replace(rows.size() - 12, 3, "333"));
    machine.user.wait(1h);
    EXPECT_EQ(machine.game.tickCount, 0);
    machine.clickCell(1, 16);
    machine.user.wait(224ms);
    EXPECT_FALSE(machine.hasDialog());
    machine.user.wait(1ms);
    EXPECT_TRUE(machine.hasDialog());
    EXPECT_FALSE(machine.game.isGameActive());
    EXPECT_EQ(machine.seenRows(1).substr(0, 3), "121") << "fallen, and no row entered";
    machine.closeDialog();
    machine.clickCell(1, 16);
    machine.clickStrip();
    EXPECT_TRUE(machine.game.mainMenuActive);
    EXPECT_EQ(machine.game.rowsEntered, 0);
}

TEST(StrategyGame, IsWonAfterTenLevels) {
    Machine machine;
    machine.clickMenu(3);
    machine.clickPanel(8);
    machine.clickStrip();
    EXPECT_FALSE(machine.app.frmQuabble().isBlockTimerOn()) << "resuming starts no timer";
    for (int level = 1; level <= 10; ++level) {
        SCOPED_TRACE(level);
        const int quota = 45 + 3 * level;
        for (int row = 1; row <= quota; ++row) {
            EXPECT_FALSE(machine.hasDialog());
            machine.game.grid.recreate(12, 16);
            machine.clickStrip();
        }
        EXPECT_TRUE(machine.hasDialog());
        EXPECT_EQ(machine.game.stats.level, level);
        machine.closeDialog();
    }
    EXPECT_TRUE(machine.hasDialog()) << "the congratulation comes again at the end of the game";
    EXPECT_FALSE(machine.game.isGameActive());
    machine.closeDialog();
    EXPECT_FALSE(machine.hasDialog());
    EXPECT_TRUE(machine.game.mainMenuActive);
}

TEST(StrategyGame, BombExplodesFallsClosesAndBringsOneRow) {
    Machine machine;
    machine.start(3, "....2....... ...31#a14...");
    const TimePoint start = machine.frontEnd.now();
    machine.clickCell(7, 16);
    machine.clickCell(9, 16);
    struct Moment {
        milliseconds at;
        const char* rows;
    };
    constexpr Moment moments[] = {{0ms, "....2....... ...3W#WW4..."},   {75ms, "....2....... ...3X#XX4..."},
                                  {150ms, "....2....... ...3Y#YY4..."}, {225ms, "....2....... ...3Z#ZZ4..."},
                                  {324ms, "....2....... ...3Z#ZZ4..."}, {325ms, "....2....... ...3.#..4..."},
                                  {575ms, "............ ...32#..4..."}, {824ms, "............ ...32#..4..."},
                                  {825ms, "............ ...32s4....."}, {945ms, "............ ...32.4....."},
                                  {1045ms, "............ ....324....."}};
    for (const Moment& moment : moments) {
        machine.user.wait(
            std::chrono::duration_cast<milliseconds>(start + moment.at - machine.frontEnd.now()));
        EXPECT_EQ(machine.seenRows(2), moment.rows) << "after " << moment.at.count() << " ms";
    }
    machine.user.wait(99ms);
    EXPECT_EQ(machine.game.rowsEntered, 0);
    machine.user.wait(1s);
    EXPECT_EQ(machine.game.rowsEntered, 1);
    EXPECT_EQ(machine.game.stats.score, 0);
    EXPECT_EQ(machine.seenRows(2).substr(0, 12), "....324.....");
}

}  // namespace
}  // namespace quabble
