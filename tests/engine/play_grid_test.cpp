#include "engine/play_grid.hpp"

#include <gtest/gtest.h>

#include "board_notation.hpp"
#include "engine/board_area.hpp"

namespace quabble {
namespace {

TEST(PlayGrid, OccupiedCellsMoveAsFarAsTheyCan) {
    for (const auto& [direction, after] : {std::pair<Direction, std::string>{Direction::Down, ".S2/1a43"},
                                           {Direction::Right, ".........1S3//..........a2/...........4"},
                                           {Direction::Left, "1S3//a2/4"},
                                           {Direction::Up, "1S23/.a4" + std::string(14, '/')}}) {
        PlayGrid grid = board("1S.3//.a2/..4");
        grid.dropBlocks(direction);
        EXPECT_EQ(show(grid), after);
    }
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
