#pragma once

#include <functional>

#include "base/task.hpp"
#include "platform/message_loop.hpp"

namespace quabble {

// A periodic timer. Its ticks come as messages; of several that fall due while none is delivered, one comes,
// and the next one is due at the following whole period. It starts switched off, with no interval.
class Timer {
 public:
    // `tick` makes the handler's task. The loop must outlive the timer.
    Timer(MessageLoop& loop, std::function<Task<>()> tick);
    ~Timer();
    Timer(const Timer&) = delete;
    Timer& operator=(const Timer&) = delete;

    bool isEnabled() const { return enabled_; }
    // Switching on a timer that is off starts its first period; one that is on goes on as it was.
    void setEnabled(bool enabled);
    // Starts the period of a running timer anew. A timer with an interval of 0 never ticks.
    void setInterval(milliseconds interval);

    // When the next tick falls due.
    TimePoint nextDue() const { return due_; }
    static constexpr TimePoint never = TimePoint::max();

 private:
    friend class MessageLoop;
    void startPeriod();
    Task<> tick();

    MessageLoop& loop_;
    std::function<Task<>()> tick_;
    milliseconds interval_{0};
    bool enabled_ = false;
    TimePoint due_ = never;
};

}  // namespace quabble
