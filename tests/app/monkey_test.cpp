#include "monkey.hpp"

#include <cstdlib>

namespace quabble {
namespace {

// QUABBLE_MONKEY_EVENTS=1000000 makes it a long one.
TEST(Monkey, FindsNothingWrong) {
    const char* wished = std::getenv("QUABBLE_MONKEY_EVENTS");
    const long eventsPerSeed = (wished == nullptr ? 20'000 : std::atol(wished)) / 4;
    for (std::uint64_t seed = 1; seed <= 4; ++seed) {
        std::mt19937_64 random(seed);
        Monkey monkey([&](int limit) { return static_cast<int>(random() % static_cast<unsigned>(limit)); });
        for (long event = 1; event <= eventsPerSeed; ++event) {
            monkey.actAndCheck();
            ASSERT_FALSE(HasFailure()) << "seed " << seed << ", event " << event;
        }
    }
}

}  // namespace
}  // namespace quabble
