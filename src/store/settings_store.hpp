#pragma once

#include <array>
#include <cstddef>
#include <cstdint>

#include "engine/high_scores.hpp"
#include "registry/registry_store.hpp"

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

// What became of the settings. The user is told of a registry that could not be opened, and of nothing else.
enum class StoreResult { Done, NotOpened, NotWritten };

// The settings and the tables as they are kept between runs. When they could not be loaded the registry is
// left alone from then on, so that values that were never read are not overwritten.
class SettingsStore {
 public:
    // The registry must outlive the store.
    explicit SettingsStore(RegistryStore& registry) : registry_(registry) {}

    // Fills the settings and the tables. Each value that is missing or unreadable has a default of its own;
    // when the registry cannot be opened everything stays as it was.
    StoreResult loadSettings(Settings& settings, HighScores& highScores);

    // Writes the settings and the tables, all or nothing: when something cannot be written, what was kept
    // before stays.
    StoreResult saveSettings(const Settings& settings, const HighScores& highScores);

 private:
    RegistryStore& registry_;
    bool isGivenUp_ = false;
};

}  // namespace quabble
