#include "platform/message_loop.hpp"

#include <algorithm>
#include <cassert>
#include <utility>

#include "platform/timer.hpp"
#include "platform/window.hpp"

namespace quabble {

Task<> MessageLoop::runPendingMessages() {
    while (hasMessage())
        co_await deliverOne();
    co_await pause(milliseconds::zero());  // which does not come back once the program has ended
}

Task<> MessageLoop::showModal(Window& window) {
    assert(modalWindow() == nullptr || modalWindow() == window.owner_);
    window.show();
    {
        const ModalWindow modal(*this, window);
        tellPointers();
        while (window.isShown()) {
            repaintRescaled();
            co_await nextMessage();
            co_await deliverOne();
        }
    }
    tellPointers();
    co_await pause(milliseconds::zero());
}

void MessageLoop::tellPointers() {
    for (Window* window : windows_) {
        if (window->isShown())
            window->tellPointer();
    }
}

// In the midst of a move a window does not know all that is to be seen on it.
void MessageLoop::repaintRescaled() {
    for (Window* window : windows_) {
        if (window->isShown())
            window->paintAtWantedScale();
    }
}

Task<> MessageLoop::run() {
    while (true) {
        repaintRescaled();
        co_await nextMessage();
        co_await deliverOne();
    }
}

void MessageLoop::post(const InputEvent& event) {
    const bool supersedes = event.kind == EventKind::MouseMove && !events_.empty() &&
                            events_.back().kind == EventKind::MouseMove &&
                            events_.back().window == event.window;
    if (supersedes)
        events_.back() = event;
    else
        events_.push_back(event);
}

void MessageLoop::wake() {
    if (isAwake_)
        return;  // what was posted is taken by the wake that is under way
    isAwake_ = true;
    while (program_ && isOver(programWaitsUntil_))
        std::exchange(program_, {}).resume();
    isAwake_ = false;
}

std::optional<TimePoint> MessageLoop::nextDeadline() const {
    if (ended_ || !program_)
        return std::nullopt;
    if (programWaitsUntil_)
        return programWaitsUntil_;
    if (!events_.empty())
        return frontEnd_.now();
    TimePoint earliest = Timer::never;
    for (const Timer* timer : timers_)
        earliest = std::min(earliest, timer->nextDue());
    return earliest == Timer::never ? std::nullopt : std::optional(earliest);
}

bool MessageLoop::isTimeUp() const {
    if (ended_ || !program_)
        return false;
    return programWaitsUntil_ ? isOver(programWaitsUntil_) : firstDueTimer() != nullptr;
}

bool MessageLoop::isOver(std::optional<TimePoint> wait) const {
    if (ended_)
        return false;
    return wait ? frontEnd_.now() >= *wait : hasMessage();
}

bool MessageLoop::hasMessage() const {
    return !ended_ && (!events_.empty() || firstDueTimer() != nullptr);
}

Timer* MessageLoop::firstDueTimer() const {
    Timer* first = nullptr;
    for (Timer* timer : timers_) {
        if (timer->nextDue() <= frontEnd_.now() && (first == nullptr || timer->nextDue() < first->nextDue()))
            first = timer;
    }
    return first;
}

// What the player did comes before the timers' ticks.
Task<> MessageLoop::deliverOne() {
    if (!events_.empty()) {
        const InputEvent event = events_.front();
        events_.pop_front();
        co_await deliver(event);
    } else if (Timer* timer = firstDueTimer()) {
        co_await timer->tick();
    }
}

Task<> MessageLoop::deliver(InputEvent event) {
    Window* window = findWindow(event.window);
    if (window == nullptr || !window->isShown())
        co_return;
    if (event.kind == EventKind::MouseDown && !isMeant(event, *window))
        co_return;
    const bool isInput = event.kind != EventKind::Minimised && event.kind != EventKind::Restored &&
                         event.kind != EventKind::Rescaled;
    if (isInput && modalWindow() != nullptr && modalWindow() != window)
        co_return;
    co_await window->handle(event);
}

// What the first press of a double click has brought onto the screen is not what the second one is meant for.
bool MessageLoop::isMeant(const InputEvent& press, const Window& window) {
    const std::pair screen(press.window, window.screenName());
    if (!press.continuesClick)
        clickedScreen_ = screen;
    return clickedScreen_ == screen;
}

Window* MessageLoop::findWindow(WindowId id) const {
    const auto found =
        std::ranges::find_if(windows_, [&](const Window* window) { return window->id() == id; });
    return found == windows_.end() ? nullptr : *found;
}

MessageLoop::Wait::~Wait() {
    if (suspended)
        loop.program_ = {};
}

void MessageLoop::Wait::await_suspend(std::coroutine_handle<> program) {
    assert(!loop.program_);
    loop.program_ = program;
    loop.programWaitsUntil_ = until;
    suspended = true;
}

}  // namespace quabble
