#include <gtest/gtest.h>

#include <cmath>
#include <coroutine>
#include <memory>
#include <utility>

#include "base/round_half_even.hpp"
#include "base/task.hpp"

namespace quabble {
namespace {

TEST(RoundHalfEven, GoesToTheNearestAndAHalfToTheEvenNeighbour) {
    for (const double value :
         {0.0, 0.5, 1.5, 2.5, 4.5, 5.5, 2.49, 2.51, -0.5, -1.5, -2.5, -2.49, -2.51, std::nextafter(0.5, 0.0),
          std::nextafter(0.5, 1.0), 2147483646.5, -2147483648.0})
        EXPECT_EQ(roundHalfEven(value), std::nearbyint(value)) << value;
}

// A wait that lasts until the test opens the gate.
struct Gate : std::suspend_always {
    void await_suspend(std::coroutine_handle<> waiting) noexcept { waiter = waiting; }
    void open() { std::exchange(waiter, {}).resume(); }
    std::coroutine_handle<> waiter;
};

// Waits for the gate if there is one.
Task<std::unique_ptr<int>> one(Gate* gate) {
    if (gate != nullptr)
        co_await *gate;
    co_return std::make_unique<int>(1);
}

Task<> addOne(int& sum, Gate* gate) {
    const std::unique_ptr<int> box = co_await one(gate);
    sum += *box;
}

Task<> addOnes(int& sum, int turns, int turnsAGate, Gate& gate) {
    for (int i = 1; i <= turns; ++i)
        co_await addOne(sum, i % turnsAGate == 0 ? &gate : nullptr);
}

// Each turn that left anything on the stack would overflow it.
TEST(Task, ALoopOverTasksNeedsNoStackPerTurn) {
    for (const auto& [turns, turnsAGate] : {std::pair{1'000'000, 500'000}, {30'000, 1}}) {
        Gate gate;
        int sum = 0;
        Task<> task = addOnes(sum, turns, turnsAGate, gate);
        task.start();
        for (int turn = turnsAGate; turn <= turns; turn += turnsAGate) {
            EXPECT_EQ(sum, turn - 1);
            gate.open();
        }
        EXPECT_EQ(sum, turns);
        EXPECT_TRUE(task.done());
    }
}

}  // namespace
}  // namespace quabble
