#include "app/main_window.hpp"

#include "app/layout.hpp"
#include "app/store_message.hpp"
#include "base/round_half_even.hpp"
#include "gfx/spoken_words.hpp"
#include "gfx/string_table.hpp"
#include "store/version.hpp"

namespace quabble {
namespace {

// What the buttons of the main menu do, from the top down.
enum class MenuButton {
    Training,
    Timed,
    Strategy,
    TrainingScores,
    TimedScores,
    StrategyScores,
    Instructions,
    Exit
};

constexpr std::int32_t menuShadow = 3;

}  // namespace

MainWindow::MainWindow(MessageLoop& loop, AppState& app)
    : Window(loop),
      app_(app),
      mmBtns_(layout::initMMBtns(), string_ids::mainMenuBase, menuShadow),
      screen_(loop, *this, app,
              {.showMainMenu = [this] { showMainMenu(); },
               .blockTimerTick = [this] { return game_.blockTimerTick(); }}),
      game_(app.game, app.highScores, app.levelTable, app.random, screen_),
      lblPause_([this] { return lblPause_Click(); }) {
    lblPause_.caption = "Game Paused Click here to continue";
    lblPause_.font = {Typeface::SansNarrowBold, 18};
    lblPause_.textColour = palette::pauseTextColour;
    lblPause_.background = palette::pauseBackground;
    addControl(lblPause_);
}

void MainWindow::Form_Load() {
    setClientSize(layout::clientSize());
    setPosition({(loop().frontEnd().screenSize().width - clientSize().width) / 2, 0});
    setCaption(std::string(applicationTitle) + "  Ver " + versionText());
    lblPause_.area = Rect::ofSize(0, 0, clientSize().width, clientSize().height);
    app_.game.mainMenuActive = true;
    app_.game.grid.recreate(12, 15);
}

void MainWindow::Form_Paint() {
    if (!app_.game.mainMenuActive) {
        screen_.paint();
        return;
    }
    screen_.clearWindow();
    mmBtns_.drawAgain(canvas());
}

// The settings are saved while the window is still there for a message to stand in front of.
Task<> MainWindow::Form_QueryUnload() {
    if (app_.save() == StoreResult::NotOpened) {
        screen_.switchBlockTimer(false);
        co_await showStoreMessage(loop(), this);
    }
    unload();
}

void MainWindow::Form_Unload() {
    loop().end();
}

// The window's size is fixed. Minimising it by its frame hides a running game as a key does.
void MainWindow::Form_Resize() {
    if (state() == State::Minimised && app_.game.isGameActive() && !isPaused())
        enablePause(true);
}

std::string MainWindow::screenName() const {
    if (app_.game.mainMenuActive)
        return std::string(spoken::mainMenu);
    return std::string(isPaused() ? spoken::paused
                                  : spoken::games[static_cast<std::size_t>(app_.game.gameMode)]);
}

bool MainWindow::isClickable(float x, float y) const {
    if (app_.game.mainMenuActive)
        return mmBtns_.buttonAt(x, y).has_value();
    return app_.game.isGameActive() && (screen_.buttonAt(x, y) || screen_.isOnPreview(x, y));
}

std::vector<Place> MainWindow::places() const {
    return app_.game.mainMenuActive ? mmBtns_.places() : screen_.places();
}

Task<> MainWindow::Form_MouseDown(float x, float y) {
    if (isPaused())
        enablePause(false);
    else if (app_.game.mainMenuActive)
        co_await mainMenuClick(x, y);
    else if (app_.game.isGameActive())
        co_await gameClick(x, y);
}

Task<> MainWindow::Form_MouseMove(float x, float y) {
    if (app_.game.isGameActive() && !isPaused())
        screen_.highlightUnderPointer(x, y);
    while (app_.game.mainMenuActive && mmBtns_.highlightNext(canvas(), x, y))
        refresh();
    co_return;
}

// Any key hides the window at once and leaves a running game paused.
Task<> MainWindow::Form_KeyPress(std::int16_t) {
    if (app_.game.mainMenuActive) {
        minimise();
    } else if (state() == State::Normal && !isPaused()) {
        enablePause(true);
        minimise();
    }
    co_return;
}

void MainWindow::showMainMenu() {
    screen_.setPaused(false);
    lblPause_.visible = false;
    app_.game.mainMenuActive = true;
    screen_.clearWindow();
    mmBtns_.draw(canvas());
    refresh();
}

Task<> MainWindow::mainMenuClick(float x, float y) {
    const auto button = mmBtns_.buttonAt(x, y);
    if (!button)
        co_return;
    const auto choose = [this](GameMode mode) {
        app_.game.gameMode = mode;
        app_.game.scoreTableIndex = static_cast<std::int16_t>(mode);
    };
    switch (static_cast<MenuButton>(*button)) {
        case MenuButton::Training:
            choose(GameMode::Training);
            game_.startStandardGame();
            break;
        case MenuButton::Timed:
            choose(GameMode::Timed);
            co_await game_.startArcadeGame();
            break;
        case MenuButton::Strategy:
            choose(GameMode::Strategy);
            co_await game_.startArcadeGame();
            break;
        case MenuButton::TrainingScores:
            co_await screen_.showHighScores(static_cast<std::int16_t>(GameMode::Training));
            break;
        case MenuButton::TimedScores:
            co_await screen_.showHighScores(static_cast<std::int16_t>(GameMode::Timed));
            break;
        case MenuButton::StrategyScores:
            co_await screen_.showHighScores(static_cast<std::int16_t>(GameMode::Strategy));
            break;
        case MenuButton::Instructions:
            openHelp();
            break;
        case MenuButton::Exit:
            co_await Form_QueryUnload();
            break;
    }
}

Task<> MainWindow::gameClick(float x, float y) {
    if (const auto button = screen_.buttonAt(x, y)) {
        co_await gameMenuClick(*button);
        co_return;
    }
    if (screen_.isOnPreview(x, y))
        co_await game_.putnextRow();
    co_await game_.gameBoardClick(static_cast<std::int16_t>(roundHalfEven(x)),
                                  static_cast<std::int16_t>(roundHalfEven(y)));
}

Task<> MainWindow::gameMenuClick(PanelButton button) {
    switch (button) {
        case PanelButton::Pause:
            enablePause(true);
            break;
        case PanelButton::Help:
            openHelp();
            break;
        case PanelButton::EndGame:
            co_await game_.endGame();
            break;
    }
}

Task<> MainWindow::lblPause_Click() {
    enablePause(false);
    co_return;
}

void MainWindow::openHelp() {
    loop().frontEnd().openDocument("QB_HELP.HTM");
}

void MainWindow::enablePause(bool enab) {
    screen_.setPaused(enab);
    lblPause_.visible = enab;
    refresh();
}

}  // namespace quabble
