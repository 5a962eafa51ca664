#include "base/task.hpp"

#include <gtest/gtest.h>

#include <coroutine>
#include <memory>
#include <string>
#include <utility>

namespace quabble {
namespace {

// A wait that lasts until the test opens the gate.
class Gate {
 public:
    bool await_ready() const noexcept { return false; }
    void await_suspend(std::coroutine_handle<> waiter) noexcept { waiter_ = waiter; }
    void await_resume() const noexcept {}

    void open() { std::exchange(waiter_, {}).resume(); }

 private:
    std::coroutine_handle<> waiter_;
};

// Notes in the log when it dies.
class Witness {
 public:
    Witness(std::string& log, std::string name) : log_(log), name_(std::move(name)) {}
    ~Witness() { log_ += name_ + " "; }
    Witness(const Witness&) = delete;
    Witness& operator=(const Witness&) = delete;

 private:
    std::string& log_;
    std::string name_;
};

Task<std::unique_ptr<int>> boxed(int value) {
    co_return std::make_unique<int>(value);
}

Task<> addBoxed(int& sum, int value) {
    const std::unique_ptr<int> box = co_await boxed(value);
    sum += *box;
}

Task<int> gated(Gate& gate, int value) {
    co_await gate;
    co_return value;
}

Task<int> doubled(Gate& gate, int value) {
    const int single = co_await gated(gate, value);
    co_return 2 * single;
}

Task<> sumOfDoubled(Gate& gate, int turns, int& sum) {
    for (int i = 1; i <= turns; ++i) {
        const int value = co_await doubled(gate, i);
        sum += value;
    }
}

Task<> innermost(Gate& gate, std::string& log) {
    const Witness first(log, "innermost-first");
    const Witness second(log, "innermost-second");
    co_await gate;
    log += "woke ";
}

Task<> middle(Gate& gate, std::string& log) {
    const Witness witness(log, "middle");
    co_await innermost(gate, log);
}

Task<> outermost(Gate& gate, std::string& log) {
    const Witness witness(log, "outermost");
    co_await middle(gate, log);
}

TEST(Task, DestroyedWhileItWaitsUnwindsInnermostFirst) {
    const std::string unwound = "innermost-second innermost-first middle outermost ";
    Gate gate;
    std::string log;
    {
        Task<> task = outermost(gate, log);
        task.start();
        EXPECT_EQ(log, "");
    }
    EXPECT_EQ(log, unwound);

    log.clear();
    Task<> task = outermost(gate, log);
    task.start();
    Task<> taken = std::move(task);
    EXPECT_TRUE(task.done());
    EXPECT_EQ(log, "");
    taken = Task<>();
    EXPECT_EQ(log, unwound);
    EXPECT_TRUE(taken.done());
}

Task<> countTo(int turns, Gate& gate, int gateAt, int& counted) {
    for (int i = 0; i < turns; ++i) {
        if (i == gateAt)
            co_await gate;
        co_await addBoxed(counted, 1);
    }
}

// Each turn that left anything on the stack would overflow it.
TEST(Task, ALoopOverTasksThatFinishAtOnceNeedsNoStackPerTurn) {
    constexpr int turns = 1'000'000;
    Gate gate;
    int counted = 0;
    Task<> task = countTo(turns, gate, turns / 2, counted);
    task.start();
    EXPECT_EQ(counted, turns / 2);
    gate.open();
    EXPECT_EQ(counted, turns);
    EXPECT_TRUE(task.done());

    int sum = 0;
    constexpr int waits = 30'000;
    Task<> waiting = sumOfDoubled(gate, waits, sum);
    waiting.start();
    for (int i = 0; i < waits; ++i)
        gate.open();
    EXPECT_EQ(sum, waits * (waits + 1));
    EXPECT_TRUE(waiting.done());
}

}  // namespace
}  // namespace quabble
