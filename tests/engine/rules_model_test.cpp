#include "rules_model.hpp"

#include "game_fixture.hpp"

namespace quabble {
namespace {

// A whole number from 0 to below the limit.
template <typename Limit>
int drawBelow(Limit limit, RandomSource& random) {
    return static_cast<int>(random.next() * static_cast<double>(limit));
}

CellPosition positionOf(model::Place place) {
    return {static_cast<std::int16_t>(place.first), static_cast<std::int16_t>(place.second)};
}

class RulesModel : public GameFixture {
 protected:
    int playWholeGame(GameMode mode, std::uint64_t seed);
};

TEST_F(RulesModel, AgreesWithTheEngineOnScatteredBoards) {
    const std::string letters = "1111222233344abcSS";
    SeededRandom chance(11);
    for (int i = 0; i < 2000 && !HasFailure(); ++i) {
        const double density = chance.next();
        PlayGrid grid = board("");
        grid.forEachCell([&](CellPosition, GridCell& cell) {
            if (chance.next() < density)
                cell = cellOf(letters[static_cast<std::size_t>(drawBelow(letters.size(), chance))]);
        });
        const model::Board cells = model::read(grid);
        SCOPED_TRACE(show(grid));
        EXPECT_EQ(grid.noMovesLeft(), !model::isAnyMoveLeft(cells));
        EXPECT_EQ(grid.isTopRowOccupied(), model::isTopRowOccupied(cells));
        for (const auto& [place, letter] : cells) {
            if (letter == 'S') {
                EXPECT_EQ(grid.isStoneExposed(positionOf(place)),
                          model::exposedStones(cells).contains(place));
            }
        }
        if (cells.empty())
            continue;
        const model::Place clicked = std::next(cells.begin(), drawBelow(cells.size(), chance))->first;
        const model::Places cluster = model::cluster(cells, clicked);
        EXPECT_TRUE(grid.clusterAtLeast(positionOf(clicked), static_cast<std::int16_t>(cluster.size())));
        EXPECT_EQ(grid.removeMarked(), std::ssize(cluster));
        EXPECT_EQ(model::read(grid), model::without(cells, cluster));
        const model::Board fallen = model::fallen(model::without(cells, cluster));
        grid.dropBlocks(Direction::Down);
        EXPECT_EQ(model::read(grid), fallen);
        EXPECT_EQ(grid.closeColumns(), model::closed(fallen) != fallen);
        EXPECT_EQ(model::read(grid), model::closed(fallen));
    }
}

// Out of a few places the one with the biggest cluster, or a bomb, to stay in the game; now and then any
// place.
model::Place choosePlace(const model::Board& cells, RandomSource& random) {
    model::Place best{1 + drawBelow(12, random), 16 - drawBelow(8, random)};
    const int tries = cells.empty() ? 0 : drawBelow(12, random);
    std::size_t most = 0;
    for (int i = 0; i < tries; ++i) {
        const auto [place, letter] = *std::next(cells.begin(), drawBelow(cells.size(), random));
        const std::size_t gain = letter >= 'a' ? 30 : model::cluster(cells, place).size();
        if (letter != 'S' && gain > most) {
            most = gain;
            best = place;
        }
    }
    return best;
}

// Plays one game to its end, on the engine and on the model, and returns its last level.
int RulesModel::playWholeGame(GameMode mode, std::uint64_t seed) {
    state = {};
    random.seeded = SeededRandom(seed);
    SeededRandom player(seed + 1);
    start(mode);
    const bool isArcade = mode != GameMode::Training;
    model::Game expected{mode, model::read(state.grid), state.stats};
    while (!expected.isOver && !HasFailure()) {
        const std::string nextRow = show(state.nextRow);
        const model::Place place = choosePlace(expected.board, player);
        SCOPED_TRACE("seed " + std::to_string(seed) + ", " + std::to_string(place.first) + "," +
                     std::to_string(place.second) + " of " + show(state.grid) + ", then " + nextRow);
        if (isArcade && drawBelow(10, player) == 0)  // leave out most of the level
            state.rowsEntered = expected.rowsEntered = 42 + 3 * state.stats.level;
        const std::int16_t level = state.stats.level;
        if (isArcade && drawBelow(mode == GameMode::Timed ? 3 : 12, player) == 0) {
            run(pushRow());
            expected.push(nextRow, model::read(stage.boardOfLevel));
        } else {
            run(click(positionOf(place)));
            expected.click(place, nextRow, model::read(stage.boardOfLevel));
        }
        stage.takeLines();
        if (state.arcadeActive && state.stats.level > level) {
            const model::Board fresh = model::read(stage.boardOfLevel);
            EXPECT_EQ(std::ssize(fresh), 12 * levelTable[state.stats.level].startRows);
            EXPECT_EQ(fresh, model::fallen(fresh));
        }
        EXPECT_EQ(model::read(state.grid), expected.board);
        EXPECT_EQ(state.stats, expected.stats);
        EXPECT_EQ(state.rowsEntered, expected.rowsEntered);
        EXPECT_EQ(state.isGameActive(), !expected.isOver);
    }
    return state.stats.level;
}

TEST_F(RulesModel, AgreesWithTheEngineOverWholeGames) {
    int won = 0;
    for (std::uint64_t seed = 1; seed <= 80; ++seed) {
        for (const GameMode mode : {GameMode::Training, GameMode::Timed, GameMode::Strategy})
            won += playWholeGame(mode, seed) > lastLevel ? 1 : 0;
    }
    EXPECT_GE(won, 5) << "the higher levels are hardly tried";
}

}  // namespace
}  // namespace quabble
