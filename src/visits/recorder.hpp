#pragma once

#include <array>
#include <cstdint>
#include <functional>
#include <optional>
#include <string_view>
#include <vector>

#include "engine/high_scores.hpp"
#include "platform/front_end.hpp"
#include "platform/input_event.hpp"
#include "visits/visit.hpp"

namespace quabble {

// Keeps what is done in the program, so that a visit can be written that does it again. It takes a megabyte
// at most; what comes when it is full is left out.
class Recorder {
 public:
    // What the program is like where a record begins.
    struct Start {
        std::uint64_t seed = 0;
        std::uint64_t drawn = 0;
        Scale scale;
        std::array<std::array<std::int32_t, highScorePlaces>, highScoreTables> scores{};
        bool isAtMenu = false;  // or where the program starts
        Point pointer{-1, -1};
        bool isRingShown = false;
    };
    // How far the game has come, for a replay to be held against.
    struct Figures {
        std::int32_t score = 0;
        std::int32_t level = 0;
        std::int32_t rows = 0;
    };
    using Output = std::function<void(std::string_view)>;

    // Forgets what it has and begins anew.
    void begin(const Start& start, TimePoint now);

    // The next game may begin here, as `beginAtMark` then says. Until it does, what came before is kept.
    void mark(const Start& start, TimePoint now);
    void beginAtMark();

    // An event comes for the topmost window or, with `isBelow`, for the one below it. `picturesShown` counts
    // what the program has shown up to now: a move of the mouse that changed nothing gives way to the next.
    void add(const InputEvent& event, bool isBelow, TimePoint now, std::uint64_t picturesShown);

    // The program is woken because its time has come.
    void addWake(TimePoint now);

    // Writes the visit, a line at a time and without memory of its own, so that it can be done when little
    // else can. What was typed is not in it: every letter has become an x.
    void write(const Figures& figures, const Output& output) const;

 private:
    struct Act {
        microseconds at{0};
        std::int16_t x = 0;
        std::int16_t y = 0;
        std::int16_t code = 0;  // the key, the command, the scale in quarters or the number of letters
        EventKind kind = EventKind::MouseMove;
        bool isWake = false;
        bool isBelow = false;
        bool extends = false;
        bool continuesClick = false;
    };
    static constexpr std::size_t mostActs = 40'000;
    static constexpr std::size_t mostActsOfABeginning = 100;

    bool hasRoom();
    static void writeAct(const Act& act, const Output& output);
    void writeStart(const Output& output) const;

    struct Mark {
        Start start;
        TimePoint base;
        std::size_t firstAct = 0;
    };

    Start start_;
    TimePoint base_;  // when the visit starts
    std::vector<Act> acts_;
    std::optional<Mark> mark_;
    std::uint64_t picturesShown_ = 0;  // when the last act was added
    bool isFull_ = false;
};

}  // namespace quabble
