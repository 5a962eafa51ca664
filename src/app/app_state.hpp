#pragma once

#include <cstdint>

#include "engine/game_state.hpp"
#include "engine/high_scores.hpp"
#include "engine/level_table.hpp"
#include "engine/random_source.hpp"
#include "gfx/pictures.hpp"
#include "store/settings_store.hpp"

namespace quabble {

// What lives as long as the program and is no window: the game, the tables, the settings, the pictures.
class AppState {
 public:
    // The front end and the registry must outlive the state.
    AppState(FrontEnd& frontEnd, RegistryStore& registry, std::uint64_t seed)
        : random(seed), pictures(frontEnd), settingsStore_(registry) {}

    SeededRandom random;
    LevelTable levelTable;
    GameState game;
    HighScores highScores;
    Settings settings;
    Pictures pictures;

    // The settings and the tables as the registry has them, and back.
    StoreResult load();
    StoreResult save();

 private:
    SettingsStore settingsStore_;
};

}  // namespace quabble
