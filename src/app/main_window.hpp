#pragma once

#include <cstdint>
#include <string>

#include "app/layout.hpp"
#include "engine/game.hpp"
#include "engine/stage.hpp"
#include "gfx/screen_button.hpp"
#include "platform/control.hpp"
#include "platform/timer.hpp"
#include "platform/window.hpp"

namespace quabble {

class AppState;

// The program's main window: it shows the main menu, a classic game or an arcade game, routes what the player
// does to whichever it is, and is the stage that the games are played on.
class MainWindow final : public Window, private Stage {
 public:
    explicit MainWindow(AppState& app);

    // Draws the main menu and makes it the current screen. A pause is over.
    void showMainMenu() override;

    bool isPaused() const { return gamePaused_; }
    bool isBlockTimerOn() const { return timerBlocks_.isEnabled(); }

 private:
    // What happens to the window (main_window.cpp).
    void Form_Load() override;
    Task<> Form_QueryUnload() override;
    void Form_Unload() override;
    bool Form_Terminate() override;
    void Form_Resize() override;
    Task<> Form_MouseDown(float x, float y) override;
    Task<> Form_MouseMove(float x, float y) override;
    Task<> Form_KeyPress(std::int16_t key) override;
    int screen() const override;
    bool isClickable(float x, float y) const override;
    Task<> clickBoard(float x, float y);
    Task<> lblPause_Click();
    Task<> timerBlocks_Timer();
    void enablePause(bool enab);

    // The menus and the side panels (menus.cpp).
    Task<> mainMenuClick(std::size_t clickedBtnNum);
    Task<> standardMenuClick(std::size_t clickedBtnNum);
    Task<> arcadeMenuClick(std::size_t clickedBtnNum);
    void openHelp();
    void highlightUnderPointer(ButtonSet& buttons, std::uint16_t captionBase, float x, float y);
    void drawPanel(ButtonSet& entries, std::uint16_t captionBase);
    void drawValue(ScreenButton& box, std::int32_t value, bool highlighted);

    // What the games draw and ask for (game_stage.cpp).
    BoardArea layOutClassic() override;
    BoardArea layOutArcade() override;
    BoardArea layOutBoardAt(std::int32_t panelTop);
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

    AppState& app_;
    Game game_;
    Timer timerBlocks_;
    Label lblPause_;
    bool gamePaused_ = false;

    ScreenButton backgroundBox_;
    ScreenButton playPanelBox_;
    ButtonSet mmBtns_;
    ButtonSet standardBtns_;
    ButtonSet arcadeBtns_;
    ScreenButton boardBox_;
    ScreenButton pointsBox_;
    ScreenButton previewBox_;
    ScreenButton gaugeBox_;
};

}  // namespace quabble
