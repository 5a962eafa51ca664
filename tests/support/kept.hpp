#pragma once

#include <string>

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

    // Everything that is kept says the same number, which is 0 in a new store.
    void fill(std::int16_t number) {
        settings.solvingData.setScoreTableIndex(number);
        for (std::int16_t each = 1; each <= highScoreTables; ++each) {
            table(each).scores.fill(number);
            table(each).names.fill(number == 0 ? unknownName : "player " + std::to_string(number));
        }
    }
};

inline StoreResult saveNumber(RegistryStore& registry, std::int16_t number) {
    Kept kept;
    kept.fill(number);
    return kept.save(registry);
}

// The number, or -1 when not everything says the same.
inline int loadNumber(RegistryStore& registry) {
    Kept kept, expected;
    kept.load(registry);
    const std::int16_t number = kept.settings.solvingData.scoreTableIndex();
    expected.fill(number);
    return kept.highScores == expected.highScores ? number : -1;
}

}  // namespace quabble
