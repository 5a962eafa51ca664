#include <gtest/gtest.h>

#include <cmath>
#include <utility>
#include <vector>

#include "board_notation.hpp"
#include "engine/rows.hpp"

namespace quabble {
namespace {

// Draws the listed numbers and no more.
struct ScriptedRandom final : RandomSource {
    explicit ScriptedRandom(std::vector<double> listed) : draws(std::move(listed)) {}
    double next() override { return draws.at(used++); }
    std::vector<double> draws;
    std::size_t used = 0;
};

// The number in [0, 1) whose product with the range is the value; a half is hit exactly.
double drawGiving(double value, double range) {
    const double near = value / range;
    for (const double draw : {near, std::nextafter(near, 0.0), std::nextafter(near, 1.0)}) {
        if (draw * range == value)
            return draw;
    }
    EXPECT_NE(std::abs(std::fmod(value, 1.0)), 0.5) << value << " of " << range << " cannot be drawn";
    return near;
}

TEST(RandomRows, CellsAtTheEdgesOfTheirRanges) {
    struct Case {
        std::int16_t level;
        double range, kind;  // the first number drawn is kind / range
        double colour;       // the second, 20 or 30 for its range
        char timed, training;
    };
    const Case cases[] = {
        {1, 618, 0.5, 0, 'a', '1'},    {1, 618, 0.51, 0, 'b', '1'},     {1, 618, 1.49, 7, 'b', '2'},
        {1, 618, 1.51, 8, 'c', '3'},   {1, 618, 2.5, 0.5, 'c', '1'},    {1, 618, 2.51, 0.5, '1', '1'},
        {1, 618, 617, 0.51, '2', '2'}, {2, 628, 1.5, 1.5, 'c', '3'},    {2, 628, 2.51, 19.49, '2', '2'},
        {2, 628, 300, 19.5, '3', '3'}, {3, 638, 2.49, 29.49, 'c', '2'}, {3, 638, 2.51, 29.5, '3', '3'},
        {4, 120, 2.5, 2.51, 'c', '4'}, {4, 120, 2.51, 2.5, '3', '3'},   {5, 150, 2.51, 3.49, 'S', '4'},
        {5, 150, 8.5, 3.5, 'S', '1'},  {5, 150, 8.51, 3.5, '1', '1'},   {6, 180, 8.5, 5, 'S', '2'},
        {6, 180, 8.51, 5, '2', '2'},   {7, 210, 12.5, 6, 'S', '3'},     {7, 210, 12.51, 6, '3', '3'},
        {8, 240, 10.5, 7, 'S', '4'},   {8, 240, 10.51, 7, '4', '4'},    {9, 270, 10.5, 8, 'S', '1'},
        {9, 270, 10.51, 8, '1', '1'},  {10, 300, 10.49, 9, 'S', '2'},   {10, 300, 10.51, 9, '2', '2'}};
    for (const Case& c : cases) {
        const std::int16_t colours = c.level <= 2 ? 3 : 4;
        for (const GameMode mode : {GameMode::Training, GameMode::Timed, GameMode::Strategy}) {
            const char expected = mode == GameMode::Training ? c.training : c.timed;
            ScriptedRandom random({drawGiving(c.kind, c.range), drawGiving(c.colour, colours * 10 - 10)});
            const GridCell made = makeNextRow(1, {mode, c.level, colours}, random)[0];
            EXPECT_EQ(letterOf(made), expected) << "level " << c.level << ", " << c.kind << ", " << c.colour;
            EXPECT_EQ(random.used, expected >= 'A' ? 1U : 2U);
        }
    }
}

TEST(RandomRows, FillABoardFromARowDown) {
    PlayGrid grid = board("S/S/S/111111111111");
    std::vector<double> draws;
    for (int cell = 0; cell < 36; ++cell)
        draws.insert(draws.end(), {0.9, (cell / 12 + cell % 12 / 6) / 20.0});
    ScriptedRandom random(draws);
    const GridRow last = fillBoard(grid, 14, {GameMode::Timed, 1, 3}, random);
    EXPECT_EQ(show(grid), "111111222222/222222333333/333333111111");
    EXPECT_EQ(show(last), "333333111111");
    EXPECT_EQ(random.used, draws.size());
}

// The ten thousandth number of the standard's default seed is laid down by the standard.
TEST(SeededRandom, GivesTheSameNumbersEverywhere) {
    SeededRandom random(5489);
    double number = 0;
    for (int i = 0; i < 10000; ++i)
        number = random.next();
    EXPECT_EQ(number, static_cast<double>(9981545732273789042u >> 11) / 9007199254740992.0);
    PlayGrid grid = board("");
    SeededRandom seeded(7);
    fillBoard(grid, 15, {GameMode::Timed, 7, 4}, seeded);
    EXPECT_EQ(show(grid), "14343322312S/S2342241123S");
}

}  // namespace
}  // namespace quabble
