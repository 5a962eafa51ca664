#include "app/program.hpp"

#include "app/splash.hpp"
#include "app/store_message.hpp"

namespace quabble {

Program::Program(FrontEnd& frontEnd, RegistryStore& registry, std::uint64_t seed)
    : loop_(frontEnd), state_(frontEnd, registry, seed), task_(run()) {}

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

// Before the main window is there nothing has changed, and when it closed everything was saved.
bool Program::keep() {
    return !frmQuabble_ || !frmQuabble_->isShown() || state_.save() == StoreResult::Done;
}

bool Program::requestEnd() {
    const bool isKept = keep();
    loop_.end();
    return isKept;
}

}  // namespace quabble
