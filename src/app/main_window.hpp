#pragma once

#include <cstdint>

#include "app/app_state.hpp"
#include "app/button_panel.hpp"
#include "app/game_screen.hpp"
#include "engine/game.hpp"
#include "platform/control.hpp"
#include "platform/window.hpp"

namespace quabble {

// The program's main window: it shows the main menu, a classic game or an arcade game, and routes what the
// player does to whichever it is. The program ends when it closes.
class MainWindow final : public Window {
 public:
    // The loop and the state must outlive the window.
    MainWindow(MessageLoop& loop, AppState& app);

    // Draws the main menu and makes it the current screen. A pause is over.
    void showMainMenu();

    bool isPaused() const { return screen_.isPaused(); }
    bool isBlockTimerOn() const { return screen_.isBlockTimerOn(); }

 private:
    void Form_Load() override;
    void Form_Paint() override;
    Task<> Form_QueryUnload() override;
    void Form_Unload() override;
    void Form_Resize() override;
    Task<> Form_MouseDown(float x, float y) override;
    Task<> Form_MouseMove(float x, float y) override;
    Task<> Form_KeyPress(std::int16_t key) override;
    std::string screenName() const override;
    bool isClickable(float x, float y) const override;
    std::vector<Place> places() const override;
    Task<> mainMenuClick(float x, float y);
    Task<> gameClick(float x, float y);
    Task<> gameMenuClick(PanelButton button);
    Task<> lblPause_Click();
    void openHelp();
    void enablePause(bool enab);

    AppState& app_;
    ButtonPanel mmBtns_;
    GameScreen screen_;
    Game game_;
    Label lblPause_;
};

}  // namespace quabble
