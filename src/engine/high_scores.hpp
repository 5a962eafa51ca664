#pragma once

#include <array>
#include <cstdint>
#include <string>

namespace quabble {

constexpr std::int16_t highScorePlaces = 8;
constexpr std::int16_t highScoreTables = 3;

// The best scores of one game mode, best first, each with the name of its player (Windows-1252).
struct HighScoreTable {
    std::array<std::int32_t, highScorePlaces> scores{};
    std::array<std::string, highScorePlaces> names{};

    friend bool operator==(const HighScoreTable&, const HighScoreTable&) = default;
};

// The tables of the three game modes, numbered like the modes from 1.
class HighScores {
 public:
    HighScoreTable& table(std::int16_t tableIndex);
    const HighScoreTable& table(std::int16_t tableIndex) const;

    // The place 1 to 8 that a score would take, or 9 when it does not enter; equal scores rank below.
    std::int16_t rankOf(std::int16_t tableIndex, std::int32_t score) const;

    // Puts a score that ranks into its place; the ones below move down and the eighth drops out.
    void insertHighScore(std::int16_t tableIndex, std::int32_t score, std::string name);

    friend bool operator==(const HighScores&, const HighScores&) = default;

 private:
    std::array<HighScoreTable, highScoreTables> tables_{};
};

}  // namespace quabble
