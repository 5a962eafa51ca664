#include "engine/play_grid.hpp"

#include <gtest/gtest.h>

#include "board_notation.hpp"
#include "engine/board_area.hpp"

namespace quabble {
namespace {

TEST(PlayGrid, OccupiedCellsMoveAsFarAsTheyCan) {
    struct Case {
        std::string name, before;
        Direction direction;
        std::string after;
    };
    const std::string scattered = "1S.3//.a2/..4";
    const Case cases[] = {{"down", scattered, Direction::Down, ".S2/1a43"},
                          {"right", scattered, Direction::Right, ".........1S3//..........a2/...........4"},
                          {"left", scattered, Direction::Left, "1S3//a2/4"},
                          {"up", "////////////..1//.a/1.2", Direction::Up, "1a1/..2//////////////"}};
    for (const Case& c : cases) {
        PlayGrid grid = board(c.before);
        grid.dropBlocks(c.direction);
        EXPECT_EQ(show(grid), c.after) << c.name;
    }
}

TEST(PlayGrid, EmptyColumnsCloseTowardTheMiddle) {
    struct Case {
        std::string before, after;
    };
    const Case moving[] = {{"1", ".....1"},
                           {"...........1", ".....1"},
                           {"......1", ".....1"},
                           {"1..........2", ".....12"},
                           {"....1.2", ".....12"},
                           {".....1.2", ".....12"},
                           {"12", "....12"},
                           {"..........12", ".....12"},
                           {"1.2.3.4.1.2", "...123412"},
                           {"123..4.a.bcS", "..1234abcS"},
                           {"11111.222222", ".11111222222"},
                           {"......222222", ".....222222"},
                           {"4.....3/1....a2..S.1", "....4.3/....1a2S1"}};
    for (const Case& c : moving) {
        PlayGrid grid = board(c.before);
        EXPECT_TRUE(grid.closeColumns()) << c.before;
        EXPECT_EQ(show(grid), c.after) << c.before;
        EXPECT_FALSE(grid.closeColumns()) << c.after;
    }
    for (const std::string settled : {"", ".....1", "..1234123", "111111222222", "...123", ".....1234123"}) {
        PlayGrid grid = board(settled);
        EXPECT_FALSE(grid.closeColumns()) << settled;
        EXPECT_EQ(show(grid), settled);
    }
}

TEST(PlayGrid, RowsEnterFromBelow) {
    PlayGrid grid = board("1/2//////////////34");
    EXPECT_TRUE(grid.isTopRowOccupied());
    grid.pushRowFromBottom(gridRow("abcS12341234"));
    EXPECT_EQ(show(grid), "2//////////////34/abcS12341234");
    grid.pushRowFromBottom(gridRow(""));
    EXPECT_FALSE(grid.isTopRowOccupied());
    for (const std::int16_t column : std::array<std::int16_t, 3>{1, 6, 12}) {
        grid.at({column, 1}) = GridCell::stone();
        EXPECT_TRUE(grid.isTopRowOccupied());
        grid.at({column, 1}) = GridCell{};
    }
}

TEST(PlayGrid, AColourIsClearedWhateverTheCellsAre) {
    PlayGrid grid = board("1a2/bS3/21b/4c2");
    grid.clearColour(2);
    EXPECT_EQ(show(grid), "1a/.S3/.1/4c");
}

TEST(BoardArea, ItsBorderLinesBelongToNoCell) {
    const BoardArea area{232, 31, 28};
    EXPECT_EQ(area.cellAt(233, 32), (CellPosition{1, 1}));
    EXPECT_EQ(area.cellAt(259, 58), (CellPosition{1, 1}));
    EXPECT_EQ(area.cellAt(260, 58), (CellPosition{2, 1}));
    EXPECT_EQ(area.cellAt(259, 59), (CellPosition{1, 2}));
    EXPECT_EQ(area.cellAt(567, 478), (CellPosition{12, 16}));
    for (const auto& [x, y] : {std::pair{232, 40}, {240, 31}, {568, 400}, {400, 479}, {231, 40}, {400, 480}})
        EXPECT_EQ(area.cellAt(x, y), std::nullopt) << x << "," << y;
}

}  // namespace
}  // namespace quabble
