#include "engine/level_table.hpp"

#include <cassert>

#include "base/round_half_even.hpp"

namespace quabble {

std::int32_t ArcadeLevelSpec::tickInterval() const {
    return roundHalfEven(static_cast<double>(rowPeriod) / ticksPerRow);
}

LevelTable::LevelTable() {
    constexpr std::array<std::int16_t, lastLevel> rowPeriods{3000, 2000, 3000, 2300, 3000,
                                                             2500, 2000, 1800, 1500, 1200};
    for (std::int16_t level = 1; level <= lastLevel; ++level) {
        const auto i = static_cast<std::size_t>(level - 1);
        levels_[i].startRows = static_cast<std::int16_t>(roundHalfEven(level / 2.0 + 4));
        levels_[i].colourCount = level <= 2 ? 3 : 4;
        levels_[i].rowPeriod = rowPeriods[i];
        levels_[i].rowsToComplete = 3 * level + 45;
    }
}

const ArcadeLevelSpec& LevelTable::operator[](std::int16_t level) const {
    assert(level >= 1 && level <= lastLevel);
    return levels_[static_cast<std::size_t>(level - 1)];
}

}  // namespace quabble
