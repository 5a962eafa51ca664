#pragma once

#include "store/settings_store.hpp"

namespace quabble {

// What a run of the program has in memory of what is kept.
struct Kept {
    Settings settings;
    HighScores highScores;

    StoreResult load(RegistryStore& registry) {
        return SettingsStore(registry).loadSettings(settings, highScores);
    }
    StoreResult save(RegistryStore& registry) {
        return SettingsStore(registry).saveSettings(settings, highScores);
    }
    HighScoreTable& table(std::int16_t number) { return highScores.table(number); }
};

}  // namespace quabble
