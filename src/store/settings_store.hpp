#pragma once

#include <array>
#include <cstddef>
#include <cstdint>

#include "engine/high_scores.hpp"
#include "platform/front_end.hpp"
#include "platform/registry.hpp"

namespace quabble {

// The 14 bytes of game state that are kept. The ones without a meaning here are carried from load to save.
class SolvingData {
 public:
    static constexpr std::size_t size = 14;

    std::int16_t scoreTableIndex() const;  // the game mode chosen last, 1 to 3; 0 in a new store
    void setScoreTableIndex(std::int16_t index);
    void setSplashSeen();

    std::array<std::byte, size> bytes{};
};

// What is kept between runs besides the high scores.
struct Settings {
    SolvingData solvingData;
    std::array<std::byte, 4> numwfsf{};          // carried unchanged
    std::array<std::int16_t, 7> soundOptions{};  // one switch each; nothing plays a sound yet
};

// The name that an entry gets which the store has none for; its score is then 0.
constexpr const char* unknownName = "Anononymous";

// Fills the settings and the tables from the registry. Each value that is missing or unreadable has a default
// of its own; when the registry cannot be opened the user is told and everything stays as it was.
void loadSettings(Settings& settings, HighScores& highScores, Registry& registry, FrontEnd& frontEnd);

// Writes the settings and the tables, all or nothing. When the registry cannot be opened the user is told;
// when something cannot be written nobody is, and what was kept before stays.
void saveSettings(const Settings& settings, const HighScores& highScores, Registry& registry,
                  FrontEnd& frontEnd);

}  // namespace quabble
