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

namespace quabble {

constexpr std::int16_t layoutUnit = 45;  // pixels; the windows' layouts are multiples of it

// Everything that lives as long as the program: the game, the tables, the pictures and one of each window.
class AppState {
 public:
    // The loop must outlive the state.
    AppState(MessageLoop& messageLoop, std::uint64_t seed);

    MessageLoop& loop;
    SeededRandom random;
    std::string programFolder;  // of the running program, ending in a separator
    LevelTable levelTable;
    GameState game;
    HighScores highScores;
    Pictures pictures;

    // Each window is made when it is first used.
    MainWindow& frmQuabble();
    ResultDialog& diagWow();

 private:
    std::unique_ptr<MainWindow> frmQuabble_;
    std::unique_ptr<ResultDialog> diagWow_;
};

}  // namespace quabble
