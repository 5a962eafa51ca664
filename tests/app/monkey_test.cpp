#include "monkey.hpp"

#include <gtest/gtest-spi.h>

#include <cstdlib>

#include "hosts/headless/visit_player.hpp"

namespace quabble {
namespace {

// What a monkey has done on one machine: for each act, the numbers that chance gave for it.
using Story = std::vector<std::vector<int>>;

// Does it all once more. The record of it, if a fault is seen after the last act; without one it is empty.
std::string faultIn(const Story& story, const Monkey::Check& check) {
    std::size_t act = 0, number = 0;
    Monkey monkey([&](int limit) { return number < story[act].size() ? story[act][number++] % limit : 0; },
                  check);
    testing::TestPartResultArray faults;
    const testing::ScopedFakeTestPartResultReporter quietly(&faults);
    for (; act < story.size() && faults.size() == 0; ++act, number = 0)
        monkey.actAndCheck();
    return faults.size() == 0 ? std::string() : monkey.record();
}

// Leaves out whatever acts the fault does not need, many at a time and then fewer, and returns the record.
std::string shrunk(Story story, const Monkey::Check& check) {
    std::string record = faultIn(story, check);
    for (std::size_t part = story.size(); part > 0; part /= 2) {
        for (std::size_t from = 0; from + part <= story.size();) {
            Story shorter = story;
            const auto first = shorter.begin() + static_cast<std::ptrdiff_t>(from);
            shorter.erase(first, first + static_cast<std::ptrdiff_t>(part));
            const std::string shorterRecord = faultIn(shorter, check);
            if (shorterRecord.empty()) {
                from += part;
                continue;
            }
            story = std::move(shorter);
            record = shorterRecord;
        }
    }
    return record;
}

// Lets a monkey loose; the record of the first fault that it sees, shrunk, or nothing.
std::string letLoose(
    std::uint64_t seed, long events, bool skipsRows, const Monkey::Check& check = [](Machine&) {}) {
    std::mt19937_64 random(seed);
    Story story;
    Monkey monkey(
        [&](int limit) {
            return story.back().emplace_back(static_cast<int>(random() % static_cast<unsigned>(limit)));
        },
        check);
    if (skipsRows)
        monkey.skipRows();
    for (long event = 1; event <= events; ++event) {
        if (monkey.beginsAnew())
            story.clear();
        story.emplace_back();
        testing::TestPartResultArray faults;
        {
            const testing::ScopedFakeTestPartResultReporter quietly(&faults);
            monkey.actAndCheck();
        }
        if (faults.size() == 0)
            continue;
        const std::string record = skipsRows ? std::string() : shrunk(story, check);
        return std::string(faults.GetTestPartResult(0).message()) + "\nseed " + std::to_string(seed) +
               ", event " + std::to_string(event) + "\n" + record;
    }
    return {};
}

// QUABBLE_MONKEY_EVENTS=1000000 makes it a long one.
TEST(Monkey, FindsNothingWrong) {
    const char* wished = std::getenv("QUABBLE_MONKEY_EVENTS");
    const long eventsPerSeed = (wished == nullptr ? 20'000 : std::atol(wished)) / 4;
    for (std::uint64_t seed = 1; seed <= 4; ++seed)
        ASSERT_EQ(letLoose(seed, eventsPerSeed, seed % 2 == 0), "");
}

// Somebody takes a score of 30 for a fault.
TEST(Monkey, TellsOfAFaultInAShortVisit) {
    const auto check = [](Machine& machine) { EXPECT_LT(machine.game.stats.score, 30); };
    const std::string told = letLoose(7, 20'000, false, check);
    const std::string record = told.substr(told.find("# What was done"));
    const auto read = parseVisit(record);
    ASSERT_TRUE(std::holds_alternative<Visit>(read)) << told;
    const Visit& visit = std::get<Visit>(read);
    EXPECT_LT(visit.steps.size(), 40U) << record;
    VisitPlayer player(visit, programFiles);
    for (const VisitStep& step : visit.steps)
        player.play(step);
    EXPECT_GE(std::atoi(player.seen({.what = "score"}).c_str()), 30) << record;
}

}  // namespace
}  // namespace quabble
