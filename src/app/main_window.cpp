#include "app/main_window.hpp"

#include <algorithm>
#include <optional>

#include "app/app_state.hpp"
#include "base/round_half_even.hpp"
#include "gfx/painters.hpp"
#include "gfx/string_table.hpp"

namespace quabble {
namespace {

constexpr std::int32_t twipsPerPixel = 15;  // a twip is 1/1440 inch

// The first box that the point hits, of those that are buttons.
std::optional<std::size_t> buttonAt(const ButtonSet& boxes, float x, float y) {
    const auto hit = std::ranges::find_if(
        boxes, [&](const ScreenButton& box) { return box.active == BoxKind::Button && hitTest(box, x, y); });
    if (hit == boxes.end())
        return std::nullopt;
    return static_cast<std::size_t>(hit - boxes.begin()) + 1;
}

}  // namespace

MainWindow::MainWindow(AppState& app)
    : Window(app.loop),
      app_(app),
      game_(app.game, app.highScores, app.levelTable, app.random, *this),
      timerBlocks_(app.loop, [this] { return timerBlocks_Timer(); }) {
    lblPause_.caption = "Game Paused Click here to continue";
    lblPause_.font = {Typeface::SansNarrowBold, 18};
    lblPause_.textColour = palette::pauseTextColour;
    lblPause_.background = palette::pauseBackground;
    lblPause_.onClick = [this] { return lblPause_Click(); };
    addControl(lblPause_);
}

void MainWindow::Form_Load() {
    const std::int32_t myHt = roundHalfEven(layoutUnit * 12.5 * twipsPerPixel);
    const std::int32_t myWid = layoutUnit * 15 * twipsPerPixel;
    setClientSize({myWid / twipsPerPixel, myHt / twipsPerPixel});
    setPosition({(app_.loop.frontEnd().screenSize().width - clientSize().width) / 2, 0});
    setCaption(std::string(applicationTitle) + "  Ver " + versionText());
    canvas().font.face = Typeface::SansBold;
    backgroundBox_ = layOutBackground(canvas());
    fillBox(backgroundBox_);
    mmBtns_ = initMMBtns(canvas(), backgroundBox_);
    playPanelBox_ = layOutPlayPanel(canvas(), backgroundBox_);
    app_.game.mainMenuActive = true;
    standardBtns_ = initStandardBtns(canvas());
    arcadeBtns_ = initArcadeBtns(canvas());
    app_.game.grid.recreate(12, 15);
}

// The settings are saved while the window is still there for a message to stand in front of.
Task<> MainWindow::Form_QueryUnload() {
    if (app_.save() == StoreResult::NotOpened) {
        timerBlocks_.setEnabled(false);
        co_await app_.tellStoreError(this);
    }
    unload();
}

void MainWindow::Form_Unload() {
    app_.loop.end();
}

bool MainWindow::Form_Terminate() {
    return app_.save() == StoreResult::Done;
}

// The window's size is fixed. Minimising it by its frame hides a running game as a key does.
void MainWindow::Form_Resize() {
    if (state() == State::Minimised && app_.game.isGameActive() && !gamePaused_)
        enablePause(true);
}

int MainWindow::screen() const {
    enum { Menu, Game, PausedGame };
    if (app_.game.mainMenuActive)
        return Menu;
    return gamePaused_ ? PausedGame : Game;
}

bool MainWindow::isClickable(float x, float y) const {
    if (app_.game.mainMenuActive)
        return buttonAt(mmBtns_, x, y).has_value();
    if (app_.game.classicActive)
        return buttonAt(standardBtns_, x, y).has_value();
    return app_.game.arcadeActive && (buttonAt(arcadeBtns_, x, y) || hitTest(previewBox_, x, y));
}

Task<> MainWindow::Form_MouseDown(float x, float y) {
    if (gamePaused_) {
        enablePause(false);
    } else if (app_.game.mainMenuActive) {
        if (const auto button = buttonAt(mmBtns_, x, y))
            co_await mainMenuClick(*button);
    } else if (app_.game.classicActive) {
        if (const auto button = buttonAt(standardBtns_, x, y))
            co_await standardMenuClick(*button);
        else
            co_await clickBoard(x, y);
    } else if (app_.game.arcadeActive) {
        if (const auto button = buttonAt(arcadeBtns_, x, y)) {
            co_await arcadeMenuClick(*button);
            co_return;
        }
        if (hitTest(previewBox_, x, y))
            co_await game_.putnextRow();
        co_await clickBoard(x, y);
    }
}

Task<> MainWindow::clickBoard(float x, float y) {
    return game_.gameBoardClick(static_cast<std::int16_t>(roundHalfEven(x)),
                                static_cast<std::int16_t>(roundHalfEven(y)));
}

Task<> MainWindow::Form_MouseMove(float x, float y) {
    if (gamePaused_)
        co_return;
    if (app_.game.mainMenuActive)
        highlightUnderPointer(mmBtns_, string_ids::mainMenuBase, x, y);
    else if (app_.game.classicActive)
        highlightUnderPointer(standardBtns_, string_ids::classicPanelBase, x, y);
    else if (app_.game.arcadeActive)
        highlightUnderPointer(arcadeBtns_, string_ids::arcadePanelBase, x, y);
}

// Any key hides the window at once and leaves a running game paused.
Task<> MainWindow::Form_KeyPress(std::int16_t) {
    if (app_.game.mainMenuActive) {
        minimise();
    } else if (state() == State::Normal && !gamePaused_) {
        enablePause(true);
        minimise();
    }
    co_return;
}

Task<> MainWindow::lblPause_Click() {
    enablePause(false);
    co_return;
}

Task<> MainWindow::timerBlocks_Timer() {
    return game_.blockTimerTick();
}

void MainWindow::enablePause(bool enab) {
    gamePaused_ = enab;
    switchBlockTimer(!enab && app_.game.arcadeActive && app_.game.gameMode == GameMode::Timed);
    lblPause_.area = Rect::ofSize(0, 0, clientSize().width, clientSize().height);
    lblPause_.visible = enab;
    refresh();
}

}  // namespace quabble
