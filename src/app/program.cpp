#include "app/program.hpp"

#include "app/splash.hpp"
#include "app/store_message.hpp"

namespace quabble {

Program::Program(FrontEnd& frontEnd, RegistryStore& registry, std::uint64_t seed)
    : frontEnd_(frontEnd), seed_(seed), loop_(frontEnd), state_(frontEnd, registry, seed), task_(run()) {}

void Program::start() {
    task_.start();
    beginRecord(false);
}

void Program::post(const InputEvent& event) {
    record(event);
    loop_.post(event);
}

void Program::wake() {
    if (loop_.isTimeUp())
        recorder_.addWake(frontEnd_.now());
    loop_.wake();
    if (!state_.game.mainMenuActive)
        recorder_.beginAtMark();
}

Task<> Program::run() {
    co_await Main();
    co_await loop_.run();
}

Task<> Program::Main() {
    if (state_.load() == StoreResult::NotOpened)
        co_await showStoreMessage(loop_, nullptr);
    Splash diagSWS(loop_, state_.pictures);
    co_await loop_.showModal(diagSWS);
    state_.settings.solvingData.setSplashSeen();
    frmQuabble_ = std::make_unique<MainWindow>(loop_, state_);
    frmQuabble_->show();
    frmQuabble_->showMainMenu();
}

std::optional<WindowId> Program::modalWindow() const {
    const Window* window = loop_.modalWindow();
    return window == nullptr ? std::nullopt : std::optional(window->id());
}

const Window* Program::topmostWindow() const {
    if (const Window* window = loop_.modalWindow())
        return window;
    return frmQuabble_ && frmQuabble_->isShown() ? frmQuabble_.get() : nullptr;
}

// Before the main window is there nothing has changed, and when it closed everything was saved.
bool Program::keep() {
    return !frmQuabble_ || !frmQuabble_->isShown() || state_.save() == StoreResult::Done;
}

bool Program::requestEnd() {
    const bool isKept = keep();
    loop_.end();
    return isKept;
}

// A record begins anew with what is done at the menu, while nothing else goes on, if a game begins with it:
// so it has the last game from the click that began it, and what is done at the menu after that.
void Program::record(const InputEvent& event) {
    if (state_.game.mainMenuActive && frmQuabble_ && loop_.modalWindow() == nullptr && loop_.isIdle())
        beginRecord(true);
    const Window* topmost = topmostWindow();
    const bool isTopmost = topmost != nullptr && event.window == topmost->id();
    const bool isBelow = !isTopmost && frmQuabble_ && event.window == frmQuabble_->id();
    if (isTopmost || isBelow)
        recorder_.add(event, isBelow, frontEnd_.now(), loop_.picturesShown());
}

void Program::beginRecord(bool isAtMenu) {
    Recorder::Start start;
    start.seed = seed_;
    start.drawn = state_.random.drawn();
    start.isAtMenu = isAtMenu;
    for (std::int16_t table = 1; table <= highScoreTables; ++table)
        start.scores[static_cast<std::size_t>(table - 1)] = state_.highScores.table(table).scores;
    if (isAtMenu) {
        start.pointer = frmQuabble_->pointer();
        start.isRingShown = frmQuabble_->isRingShown();
    }
    const Window* window = isAtMenu ? frmQuabble_.get() : loop_.modalWindow();
    if (window != nullptr)
        start.scale = window->wantedScale();
    if (isAtMenu)
        recorder_.mark(start, frontEnd_.now());
    else
        recorder_.begin(start, frontEnd_.now());
}

void Program::writeVisit(const Recorder::Output& output) const {
    const GameState& game = state_.game;
    const bool hasRows = game.gameMode != GameMode::Training;
    recorder_.write({game.stats.score, game.stats.level, hasRows ? game.rowsEntered : 0}, output);
}

}  // namespace quabble
