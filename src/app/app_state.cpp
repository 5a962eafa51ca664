#include "app/app_state.hpp"

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

void AppState::load() {
    loadSettings(settings, highScores, registry, loop.frontEnd());
    game.scoreTableIndex = settings.solvingData.scoreTableIndex();
}

void AppState::save() {
    settings.solvingData.setScoreTableIndex(game.scoreTableIndex);
    saveSettings(settings, highScores, registry, loop.frontEnd());
}

}  // namespace quabble
