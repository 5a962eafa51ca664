#pragma once

#include <cstdint>
#include <memory>
#include <string>

#include "app/main_window.hpp"
#include "engine/game_state.hpp"
#include "engine/high_scores.hpp"
#include "engine/level_table.hpp"
#include "engine/random_source.hpp"
#include "gfx/result_dialog.hpp"
#include "gfx/sprite_sheet.hpp"
#include "platform/message_loop.hpp"
#include "platform/registry.hpp"
#include "store/name_entry.hpp"
#include "store/score_view.hpp"
#include "store/settings_store.hpp"
#include "store/version.hpp"

namespace quabble {

constexpr std::int16_t layoutUnit = 45;  // pixels; the windows' layouts are multiples of it

// Everything that lives as long as the program: the game, the tables, the pictures and one of each window.
class AppState {
 public:
    // The loop and the registry must outlive the state.
    AppState(MessageLoop& messageLoop, Registry& userRegistry, std::uint64_t seed);

    MessageLoop& loop;
    Registry& registry;
    SeededRandom random;
    std::string programFolder;  // of the running program, ending in a separator
    LevelTable levelTable;
    GameState game;
    HighScores highScores;
    Settings settings;
    Pictures pictures;

    // Each window is made when it is first used.
    MainWindow& frmQuabble();
    ResultDialog& diagWow();
    NameEntry& diagUN();
    ScoreView& frmStats();

    // Hands a file or an address to the desktop; no error is reported.
    void openDocument(const std::string& document);

    // The settings as the registry has them, and back.
    StoreResult load();
    StoreResult save();

    // Tells the user that the registry could not be opened, in front of the owner, if there is one.
    Task<> tellStoreError(Window* owner);

 private:
    std::unique_ptr<MainWindow> frmQuabble_;
    std::unique_ptr<ResultDialog> diagWow_;
    std::unique_ptr<NameEntry> diagUN_;
    std::unique_ptr<ScoreView> frmStats_;
};

}  // namespace quabble
