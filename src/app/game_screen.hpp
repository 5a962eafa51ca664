#pragma once

#include <functional>
#include <optional>
#include <string>

#include "app/app_state.hpp"
#include "app/button_panel.hpp"
#include "engine/stage.hpp"
#include "gfx/result_dialog.hpp"
#include "platform/timer.hpp"
#include "platform/window.hpp"
#include "store/name_entry.hpp"
#include "store/score_view.hpp"

namespace quabble {

// What a button of a side panel does; both panels have these three, from the top down.
enum class PanelButton { Pause, Help, EndGame };

// The stage that the games are played on: it draws on a window, shows its dialogs in front of it, and has the
// block timer.
class GameScreen final : public Stage {
 public:
    // What happens on the screen and is somebody else's affair.
    struct Handlers {
        std::function<void()> showMainMenu;
        std::function<Task<>()> blockTimerTick;
    };

    // The loop, the window and the state must outlive the screen.
    GameScreen(MessageLoop& loop, Window& window, AppState& app, Handlers handlers);

    // While the game is paused the block timer stays off, whatever goes on beneath the notice.
    bool isPaused() const { return gamePaused_; }
    void setPaused(bool paused);
    bool isBlockTimerOn() const { return timerBlocks_.isEnabled(); }

    // The button of the running game's panel that is at that place.
    std::optional<PanelButton> buttonAt(float x, float y) const;
    // Whether the place is on the strip of the waiting row, which only an arcade game has.
    bool isOnPreview(float x, float y) const;
    void highlightUnderPointer(float x, float y);
    // The figures, the panel's buttons, the board's cells and the strip of the game that is on the screen.
    std::vector<Place> places() const;

    // Paints all that was drawn for the game that is on the screen once more, as it is outside a move.
    void paint();

    BoardArea layOutClassic() override;
    BoardArea layOutArcade() override;
    void clearWindow() override;
    void drawClassicPanel() override;
    void drawArcadePanel() override;
    void drawPlayPanel() override;
    void drawBoard() override;
    void drawCell(CellPosition place, std::int16_t tile) override;
    void drawPoints(CellPosition place, std::int32_t points) override;
    void updateScore() override;
    void displayLevel() override;
    void drawPreviewRow(std::int16_t revealed) override;
    void drawGauge(double percentage) override;
    void present() override;
    Task<> pause(std::chrono::milliseconds duration) override;
    Task<> runPendingMessages() override;
    void switchBlockTimer(bool on) override;
    void setBlockTimerInterval(std::chrono::milliseconds interval) override;
    Task<> showResult(bool goNextLevel) override;
    Task<std::string> enterName() override;
    Task<> showHighScores(std::int16_t tableIndex) override;
    void showMainMenu() override { handlers_.showMainMenu(); }

 private:
    const Sprites& sprites() { return app_.pictures.sprites(window_.canvas().scale()); }
    ButtonPanel& panel();
    const ButtonPanel& panel() const;
    Rect strip() const;
    BoardArea layOutOn(const Rect& playPanel);
    void clear();
    void drawPanel();
    void drawValues();
    std::string rowsInWords() const;
    std::string waitingRowInWords() const;
    void sayOf(CellPosition place, std::int16_t tile);
    void say(std::string_view words);

    MessageLoop& loop_;
    Window& window_;
    AppState& app_;
    Handlers handlers_;
    Timer timerBlocks_;
    bool gamePaused_ = false;

    ResultDialog diagWow_;
    NameEntry diagUN_;
    ScoreView frmStats_;

    // What is drawn beside the board.
    enum class Shown { Nothing, ClassicGame, ArcadeGame };
    struct Figures {
        std::int32_t bestScore = 0;
        std::int32_t score = 0;
        std::int32_t level = 0;
        bool isLevelHighlighted = false;
    };
    struct Points {
        CellPosition place;
        std::int32_t points = 0;
    };
    Shown shown_ = Shown::Nothing;
    Figures figures_;
    std::int16_t revealed_ = 0;     // of the waiting row
    double percentage_ = 0;         // of the gauge
    std::optional<Points> points_;  // on the board, until it is drawn again
    std::int16_t drawnTile_ = -1;   // the last one that was drawn on the board by itself, likewise

    ButtonPanel standardBtns_;
    ButtonPanel arcadeBtns_;
    Rect playPanelBox_;
    CellBox boardBox_;
    CellBox previewBox_;
    Rect gaugeBox_;
};

}  // namespace quabble
