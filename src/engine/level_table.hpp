#pragma once

#include <array>
#include <cstdint>

namespace quabble {

constexpr std::int16_t lastLevel = 10;
constexpr std::int16_t ticksPerRow = 12;

// How one arcade level is played.
struct ArcadeLevelSpec {
    std::int16_t nominalCols = 13;    // no behaviour depends on it: the board is 12 columns wide
    std::int16_t nominalRows = 15;    // likewise: the board is 16 rows high
    std::int16_t startRows = 0;       // random rows at the bottom of the board when the level starts
    std::int16_t colourCount = 0;     // colours of its blocks, 3 or 4
    std::int16_t rowPeriod = 0;       // milliseconds that one row takes to arrive in the Timed game
    std::int32_t rowsToComplete = 0;  // rows that must enter the board to complete the level

    // The block timer's interval in milliseconds.
    std::int32_t tickInterval() const;
};

// The ten arcade levels, computed once.
class LevelTable {
 public:
    LevelTable();

    // The record of a level, 1 to 10.
    const ArcadeLevelSpec& operator[](std::int16_t level) const;

 private:
    std::array<ArcadeLevelSpec, lastLevel> levels_{};
};

}  // namespace quabble
