#pragma once

#include <cstdint>
#include <string_view>

namespace quabble {

// Ids of the texts that are asked for one by one. The captions of a set of buttons are asked for by base plus
// button number.
namespace string_ids {
constexpr std::uint16_t webAddress = 1;
constexpr std::uint16_t tagline = 2;
constexpr std::uint16_t mainMenuBase = 30;
constexpr std::uint16_t classicPanelBase = 70;
constexpr std::uint16_t arcadePanelBase = 80;
constexpr std::uint16_t scoreViewBase = 90;
constexpr std::uint16_t ok = 91;
constexpr std::uint16_t gameOver = 101;
constexpr std::uint16_t trainingResult = 111;
constexpr std::uint16_t allLevelsFinished = 112;
constexpr std::uint16_t arcadeResult = 113;
constexpr std::uint16_t levelCompleted = 114;
constexpr std::uint16_t levelResult = 115;
}  // namespace string_ids

// The text of an id, which must be in the table (res/strings.inc).
std::string_view loadString(std::uint16_t id);

}  // namespace quabble
