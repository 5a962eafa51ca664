#pragma once

#include <array>
#include <string>
#include <string_view>
#include <vector>

#include "engine/play_grid.hpp"
#include "gfx/screen_button.hpp"
#include "platform/place.hpp"

// What is said of the picture to those who do not see it, where its own texts (string_table.hpp) do not do.
// Numbers and words take the places of |1 and so on (message_template.hpp).
namespace quabble::spoken {

constexpr std::string_view mainMenu = "Main menu";
constexpr std::string_view paused = "Game paused";
constexpr std::array<std::string_view, 4> games{"No game", "Training game", "Timed game", "Strategy game"};

constexpr std::array<std::string_view, 4> blocks{"coral disc", "mint diamond", "amber star", "violet cross"};
constexpr std::string_view bomb = "bomb for every |1";
constexpr std::string_view stone = "stone";
constexpr std::string_view empty = "empty";
constexpr std::string_view cell = "column |1, row |2: |3";
constexpr std::string_view cluster = "|1, cluster of |2";

constexpr std::string_view figure = "|1 |2";
constexpr std::string_view rows = "Row |1 of |2";
constexpr std::string_view waitingRow = "Waiting row, |1 of 12 uncovered: |2";
constexpr std::string_view bringRow = "Bring the waiting row";

constexpr std::string_view points = "|1 points";
constexpr std::string_view explosion = "Every |1 explodes";
constexpr std::string_view release = "Stones are let go";
constexpr std::string_view level = "Level |1";
constexpr std::string_view place = "Place |1 in the table";
constexpr std::string_view scoresCleared = "Scores cleared";

}  // namespace quabble::spoken

namespace quabble {

// A block of a colour, 1 to 4, as "coral disc", and any cell without its place.
std::string_view blockWords(std::int16_t colour);
std::string wordsFor(const GridCell& cell);

// Every cell of the board, row by row.
std::vector<Place> boardPlaces(const CellBox& box, const PlayGrid& grid);

// The lines of a text that is written in an area, each in a part of it.
std::vector<Place> textPlaces(const Rect& area, std::string_view text);

}  // namespace quabble
