#include "app/app_state.hpp"

namespace quabble {

StoreResult AppState::load() {
    const StoreResult result = settingsStore_.loadSettings(settings, highScores);
    game.scoreTableIndex = settings.solvingData.scoreTableIndex();
    return result;
}

StoreResult AppState::save() {
    settings.solvingData.setScoreTableIndex(game.scoreTableIndex);
    return settingsStore_.saveSettings(settings, highScores);
}

}  // namespace quabble
