#include <gtest/gtest.h>

#include "board_notation.hpp"
#include "engine/game.hpp"
#include "quiet_stage.hpp"

namespace quabble {
namespace {

// Someone who clicks about the window at random, whatever the program is doing, as far as the window lets the
// clicks through: in the middle of moves too.
class RestlessPlayer final : public QuietStage {
 public:
    RestlessPlayer(GameState& state, std::uint64_t seed) : QuietStage(state), random_(seed) {}

    void plays(Game& game) { game_ = &game; }
    Task<> act();

    int gamesStarted() const { return started_; }
    int gamesEnded() const { return ended_; }
    int rowsInMidMove() const { return rowsInMidMove_; }

    void drawBoard() override { EXPECT_TRUE(state_.isGameActive()) << "the board is drawn over the menu"; }
    void drawCell(CellPosition, std::int16_t) override { drawBoard(); }
    void drawPoints(CellPosition, std::int32_t) override { drawBoard(); }
    void switchBlockTimer(bool on) override { timerRuns_ = on; }
    Task<> runPendingMessages() override;
    Task<> showResult(bool goNextLevel) override;

    bool timerRuns() const { return timerRuns_; }

 private:
    bool oneIn(int chances) { return random_.next() * chances < 1; }
    Task<> startGame();
    Task<> clickSomewhere();

    SeededRandom random_;
    Game* game_ = nullptr;
    int started_ = 0;
    int ended_ = 0;
    int rowsInMidMove_ = 0;
    int depth_ = 0;
    bool timerRuns_ = false;
};

Task<> RestlessPlayer::act() {
    if (state_.mainMenuActive) {
        co_await startGame();
    } else if (oneIn(60)) {
        co_await game_->endGame();
    } else if (state_.arcadeActive && oneIn(6)) {
        rowsInMidMove_ += state_.boolProcessing ? 1 : 0;
        if (oneIn(4))  // near the end of the level
            state_.rowsEntered = 43 + 3 * state_.stats.level;
        co_await game_->putnextRow();
    } else if (timerRuns_ && oneIn(3)) {
        co_await game_->blockTimerTick();
    } else {
        co_await clickSomewhere();
    }
}

Task<> RestlessPlayer::startGame() {
    ++started_;
    const auto mode = static_cast<std::int16_t>(1 + random_.next() * 3);
    state_.gameMode = GameMode{mode};
    state_.scoreTableIndex = mode;
    if (mode == 1)
        game_->startStandardGame();
    else
        co_await game_->startArcadeGame();
}

Task<> RestlessPlayer::clickSomewhere() {
    const auto x = static_cast<std::int16_t>(random_.next() * 340);
    const auto y = static_cast<std::int16_t>(448 - random_.next() * random_.next() * 460);
    co_await game_->gameBoardClick(x, y);
}

Task<> RestlessPlayer::runPendingMessages() {
    ++depth_;
    while (depth_ < 4 && oneIn(2))
        co_await act();
    --depth_;
}

Task<> RestlessPlayer::showResult(bool goNextLevel) {
    ended_ += goNextLevel ? 0 : 1;
    EXPECT_FALSE(timerRuns_);
    EXPECT_EQ(goNextLevel, state_.arcadeActive);
    co_return;
}

// What must be true of a game, or of the menu, whenever the player has stopped clicking.
void expectSettled(const GameState& state, const RestlessPlayer& player) {
    EXPECT_FALSE(state.boolProcessing);
    EXPECT_EQ(player.gamesEnded(), player.gamesStarted() - (state.isGameActive() ? 1 : 0));
    EXPECT_EQ(state.mainMenuActive + state.classicActive + state.arcadeActive, 1);
    EXPECT_EQ(player.timerRuns(), state.arcadeActive && state.gameMode == GameMode::Timed);
    EXPECT_TRUE(state.tickCount >= 0 && state.tickCount < 12) << state.tickCount;
    if (!state.isGameActive())
        return;
    PlayGrid settled = state.grid;
    settled.dropBlocks(Direction::Down);
    settled.closeColumns();
    EXPECT_EQ(show(state.grid), show(settled));
    EXPECT_FALSE(state.classicActive && settled.noMovesLeft());
}

TEST(WholeGames, StayInOrderWhateverThePlayerClicks) {
    GameState state;
    HighScores highScores;
    const LevelTable levelTable;
    SeededRandom rows(5);
    RestlessPlayer player(state, 6);
    Game game(state, highScores, levelTable, rows, player);
    player.plays(game);
    player.showMainMenu();
    for (int turn = 0; player.gamesStarted() < 2000 && !testing::Test::HasFailure(); ++turn) {
        SCOPED_TRACE("turn " + std::to_string(turn));
        Task<> task = player.act();
        task.start();
        ASSERT_TRUE(task.done());
        expectSettled(state, player);
    }
    EXPECT_GT(player.rowsInMidMove(), 1000);
}

}  // namespace
}  // namespace quabble
