#pragma once

#include <array>
#include <chrono>
#include <cstdint>
#include <string>
#include <string_view>
#include <variant>
#include <vector>

#include "engine/high_scores.hpp"
#include "platform/input_event.hpp"

namespace quabble {

using std::chrono::microseconds;

// One thing that happens in a visit, or that is then to be seen.
struct VisitStep {
    enum class Kind { Wait, Event, Given, End, Expect };
    Kind kind = Kind::Wait;
    std::size_t line = 0;   // of the text, counted from 1
    microseconds at{0};     // since the program started; of an expectation it is that of the act before it
    InputEvent event = {};  // for the topmost window, or for the one below it
    bool isBelow = false;
    std::string what = {};  // of an expectation, or what is given
    std::string value = {};
};

// What someone does in the program and what is then to be seen, from a start that is the same everywhere:
// docs/visits.md tells how it is written.
struct Visit {
    std::uint64_t seed = 1;
    std::uint64_t drawn = 0;  // random numbers that were drawn before
    Scale scale;
    std::array<std::array<std::int32_t, highScorePlaces>, highScoreTables> scores{};
    bool isStoreDamaged = false;  // what an earlier run has kept cannot be read
    // Time passes only where a step says so, and the program is not woken in between.
    bool areWakesWritten = false;
    std::vector<VisitStep> steps;
};

struct VisitProblem {
    std::size_t line = 0;
    std::string what;
};

// What expectations can be about.
namespace expectations {
constexpr std::string_view picture = "picture";  // scales and fingerprints, of the topmost window's
constexpr std::string_view window = "window";    // the topmost one's caption
constexpr std::string_view score = "score";
constexpr std::string_view level = "level";
constexpr std::string_view rows = "rows";  // that have entered in this level
constexpr std::string_view ended = "ended";
}  // namespace expectations

// What can be given, so that a visit need not play for an hour to come to it.
namespace givens {
constexpr std::string_view board = "board";  // its rows from the top, the lowest of them the bottom one
constexpr std::string_view level = "level";
constexpr std::string_view rows = "rows";
}  // namespace givens

// The letters that boards are written with: '.' is an empty cell, '1' to '4' a block, 'S' a stone, 'a' to 'c'
// a bomb of colour 1 to 3.
constexpr std::string_view boardLetters = ".1234Sabc";

// The visit that a text tells of, or the first line that cannot be understood.
std::variant<Visit, VisitProblem> parseVisit(std::string_view text);

// The words of a line, which spaces keep apart.
std::vector<std::string_view> wordsIn(std::string_view line);

}  // namespace quabble
