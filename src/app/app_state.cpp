#include "app/app_state.hpp"

#include "gfx/message_dialog.hpp"

namespace quabble {

AppState::AppState(MessageLoop& messageLoop, Registry& userRegistry, std::uint64_t seed)
    : loop(messageLoop), registry(userRegistry), random(seed) {}

MainWindow& AppState::frmQuabble() {
    if (!frmQuabble_)
        frmQuabble_ = std::make_unique<MainWindow>(*this);
    return *frmQuabble_;
}

ResultDialog& AppState::diagWow() {
    if (!diagWow_)
        diagWow_ = std::make_unique<ResultDialog>(loop, frmQuabble(), game, layoutUnit);
    return *diagWow_;
}

NameEntry& AppState::diagUN() {
    if (!diagUN_)
        diagUN_ = std::make_unique<NameEntry>(loop, frmQuabble());
    return *diagUN_;
}

ScoreView& AppState::frmStats() {
    if (!frmStats_)
        frmStats_ = std::make_unique<ScoreView>(loop, frmQuabble(), highScores, layoutUnit);
    return *frmStats_;
}

void AppState::openDocument(const std::string& document) {
    loop.frontEnd().openDocument(document, loop.frontEnd().executableFolder());
}

StoreResult AppState::load() {
    const StoreResult result = loadSettings(settings, highScores, registry);
    game.scoreTableIndex = settings.solvingData.scoreTableIndex();
    return result;
}

StoreResult AppState::save() {
    settings.solvingData.setScoreTableIndex(game.scoreTableIndex);
    return saveSettings(settings, highScores, registry);
}

Task<> AppState::tellStoreError(Window* owner) {
    MessageDialog message(loop, owner, std::string(applicationTitle), " Error Failerd");
    co_await loop.showModal(message);
}

}  // namespace quabble
