#pragma once

#include "engine/game_state.hpp"
#include "engine/stage.hpp"

namespace quabble {

// A stage that draws nothing and never waits. The board lies in the window's corner.
class QuietStage : public Stage {
 public:
    explicit QuietStage(GameState& state) : state_(state) {}

    BoardArea layOutClassic() override { return {0, 0, 28}; }
    BoardArea layOutArcade() override { return {0, 0, 28}; }
    void clearWindow() override {}
    void drawClassicPanel() override {}
    void drawArcadePanel() override {}
    void drawPlayPanel() override {}
    void drawBoard() override {}
    void drawCell(CellPosition, std::int16_t) override {}
    void drawPoints(CellPosition, std::int32_t) override {}
    void updateScore() override {}
    void displayLevel() override {}
    void drawPreviewRow(std::int16_t) override {}
    void drawGauge(double) override {}
    void present() override {}
    Task<> pause(std::chrono::milliseconds) override { co_return; }
    Task<> runPendingMessages() override { co_return; }
    void switchBlockTimer(bool) override {}
    void setBlockTimerInterval(std::chrono::milliseconds) override {}
    Task<> showResult(bool) override { co_return; }
    Task<std::string> enterName() override { co_return "Player"; }
    Task<> showHighScores(std::int16_t) override { co_return; }
    void showMainMenu() override { state_.mainMenuActive = true; }

 protected:
    GameState& state_;
};

}  // namespace quabble
