#pragma once

#include <deque>
#include <functional>
#include <sstream>
#include <string>
#include <utility>
#include <vector>

#include "board_notation.hpp"
#include "engine/game_state.hpp"
#include "engine/stage.hpp"

namespace quabble {

// A stage that writes down what the game asks of it, a line for each request, with what there was to be seen:
// the board, the waiting row and the numbers (level, score, blocks cleared, largest cluster). What the player
// does while messages run or a dialog is open is scripted.
class RecordingStage final : public Stage {
 public:
    using Action = std::function<Task<>()>;  // not itself a coroutine: it calls one

    explicit RecordingStage(GameState& state) : state_(state) {}

    // What happens during the next run of the messages, the one after it, and so on; then nothing any more.
    std::deque<std::vector<Action>> inMessages;
    // Likewise during dialogs.
    std::deque<std::vector<Action>> inDialogs;

    // The board that the level began with, 12 letters a row.
    std::string boardOfLevel;

    // The lines written since they were last asked for.
    std::string takeLines() { return std::exchange(lines_, {}); }

    BoardArea layOutClassic() override { return {230, 40, 28}; }
    BoardArea layOutArcade() override { return {232, 31, 28}; }
    void clearWindow() override { write("clear"); }
    void drawClassicPanel() override { write("classic-panel"); }
    void drawArcadePanel() override { write("arcade-panel"); }
    void drawPlayPanel() override { write("play-panel"); }
    void drawBoard() override { write("board=", show(state_.grid)); }
    void drawCell(CellPosition place, std::int16_t tile) override {
        write("cell=", place.column, ",", place.row, ":", tile);
    }
    void drawPoints(CellPosition place, std::int32_t points) override {
        write("points=", points, "@", place.column, ",", place.row);
    }
    void updateScore() override { write("score=", state_.stats.score); }
    void displayLevel() override {
        write("level=", state_.stats.level);
        boardOfLevel = lettersOf(state_.grid);
    }
    void drawPreviewRow(std::int16_t revealed) override {
        write("strip=", revealed, ":", show(state_.nextRow));
    }
    void drawGauge(double percentage) override { write("gauge=", percentage); }
    void present() override { write("present"); }
    Task<> pause(std::chrono::milliseconds duration) override {
        write("pause=", duration.count());
        co_return;
    }
    Task<> runPendingMessages() override {
        write("messages");
        co_await act(inMessages);
    }
    void switchBlockTimer(bool on) override { write("timer=", on ? "on" : "off"); }
    void setBlockTimerInterval(std::chrono::milliseconds interval) override {
        write("interval=", interval.count());
    }
    Task<> showResult(bool goNextLevel) override {
        const GameStats& stats = state_.stats;
        write(goNextLevel ? "completed:" : "result:", stats.level, ",", stats.score, ",", stats.blocksCleared,
              ",", stats.largestCluster);
        co_await act(inDialogs);
    }
    Task<std::string> enterName() override {
        write("name?");
        co_await act(inDialogs);
        co_return "Player";
    }
    Task<> showHighScores(std::int16_t tableIndex) override {
        write("scores:", tableIndex);
        co_await act(inDialogs);
    }
    void showMainMenu() override {
        write("menu");
        state_.mainMenuActive = true;
    }

 private:
    static Task<> act(std::deque<std::vector<Action>>& script) {
        if (script.empty())
            co_return;
        const std::vector<Action> actions = std::move(script.front());
        script.pop_front();
        for (const Action& action : actions) {
            Task<> task = action();
            co_await std::move(task);
        }
    }
    template <typename... Parts>
    void write(const Parts&... parts) {
        std::ostringstream line;
        (line << ... << parts) << "\n";
        lines_ += line.str();
    }

    GameState& state_;
    std::string lines_;
};

}  // namespace quabble
