#include <gtest/gtest.h>

#include <cmath>
#include <map>
#include <utility>
#include <vector>

#include "board_notation.hpp"
#include "engine/rows.hpp"

namespace quabble {
namespace {

// Draws the listed numbers and no more.
class ScriptedRandom final : public RandomSource {
 public:
    explicit ScriptedRandom(std::vector<double> draws) : draws_(std::move(draws)) {}
    double next() override { return draws_.at(used_++); }
    std::size_t used() const { return used_; }

 private:
    std::vector<double> draws_;
    std::size_t used_ = 0;
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
        const std::vector<double> draws{drawGiving(c.kind, c.range), drawGiving(c.colour, colours * 10 - 10)};
        for (const auto& [mode, expected] : {std::pair{GameMode::Training, c.training},
                                             {GameMode::Timed, c.timed},
                                             {GameMode::Strategy, c.timed}}) {
            ScriptedRandom random(draws);
            const std::string made = show(makeNextRow(1, {mode, c.level, colours}, random));
            EXPECT_EQ(made, std::string(1, expected))
                << "level " << c.level << ", " << c.kind << ", " << c.colour;
            EXPECT_EQ(random.used(), expected >= 'A' ? 1u : 2u);
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
    EXPECT_EQ(random.used(), draws.size());
}

// The chances follow from a number uniform over 0 to N, rounded: 0 and N are half as likely as the others. So
// a bomb of colour 1 has 0.5 / N, the others 1 / N each, a stone (stone limit) / N, and what is left is a
// block. Its colour is drawn the same way from 0 to 10 n - 10, taken modulo n: for three colours each
// remainder occurs 7 times among 0 to 20, with a half end for the first and the last; for four 8, 8, 8 and 7
// times among 0 to 30, with a half end for the first and the third.
TEST(RandomRows, CellsComeInTheirChances) {
    struct Case {
        GameMode mode;
        std::int16_t level;
        double range, stones;
    };
    const Case cases[] = {
        {GameMode::Training, 1, 618, 0}, {GameMode::Training, 10, 300, 8}, {GameMode::Timed, 1, 618, 0},
        {GameMode::Timed, 2, 628, 0},    {GameMode::Timed, 3, 638, 0},     {GameMode::Timed, 4, 120, 0},
        {GameMode::Timed, 5, 150, 6},    {GameMode::Timed, 6, 180, 6},     {GameMode::Timed, 7, 210, 10},
        {GameMode::Timed, 8, 240, 8},    {GameMode::Timed, 9, 270, 8},     {GameMode::Timed, 10, 300, 8},
        {GameMode::Strategy, 5, 150, 6}};
    constexpr std::int16_t rowLength = 1000;
    constexpr int rows = 1000;
    constexpr double cells = 1.0 * rowLength * rows;
    SeededRandom random(20);
    for (const Case& c : cases) {
        const std::int16_t colours = c.level <= 2 ? 3 : 4;
        std::map<char, double> chances;
        if (c.mode != GameMode::Training)
            chances = {
                {'a', 0.5 / c.range}, {'b', 1 / c.range}, {'c', 1 / c.range}, {'S', c.stones / c.range}};
        const double blocks = c.mode == GameMode::Training ? 1.0 : 1 - (2.5 + c.stones) / c.range;
        const std::vector<double> weights =
            colours == 3 ? std::vector{6.5, 7.0, 6.5} : std::vector{7.5, 8.0, 7.5, 7.0};
        for (std::size_t i = 0; i < weights.size(); ++i)
            chances[static_cast<char>('1' + i)] = blocks * weights[i] / (colours * 10 - 10);

        std::map<char, int> counts;
        for (int i = 0; i < rows; ++i) {
            for (const char cell : show(makeNextRow(rowLength, {c.mode, c.level, colours}, random)))
                ++counts[cell];
        }
        for (const char cell : std::string("1234abcS?.")) {
            const double chance = chances[cell];
            EXPECT_NEAR(counts[cell], cells * chance, 5 * std::sqrt(cells * chance * (1 - chance)))
                << "'" << cell << "' on level " << c.level;
        }
    }
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
