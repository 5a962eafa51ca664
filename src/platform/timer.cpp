#include "platform/timer.hpp"

#include <utility>

namespace quabble {

Timer::Timer(MessageLoop& loop, std::function<Task<>()> tick) : loop_(loop), tick_(std::move(tick)) {
    loop_.timers_.push_back(this);
}

Timer::~Timer() {
    std::erase(loop_.timers_, this);
}

void Timer::setEnabled(bool enabled) {
    if (enabled == enabled_)
        return;
    enabled_ = enabled;
    startPeriod();
}

void Timer::setInterval(milliseconds interval) {
    interval_ = interval;
    startPeriod();
}

void Timer::startPeriod() {
    const bool runs = enabled_ && interval_ > milliseconds::zero();
    due_ = runs ? loop_.frontEnd().now() + interval_ : never;
}

Task<> Timer::tick() {
    const auto late = loop_.frontEnd().now() - due_;
    due_ += interval_ * (late / interval_ + 1);
    co_await tick_();
}

}  // namespace quabble
