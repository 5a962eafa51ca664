#pragma once

#include <coroutine>
#include <deque>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "base/task.hpp"
#include "platform/front_end.hpp"
#include "platform/input_event.hpp"

namespace quabble {

class Timer;
class Window;

// Where the program waits. There is one logical thread of control, and at any moment exactly one innermost
// wait: for a time, in which nothing is delivered, or for the next message. "Nested message loops" are
// therefore a chain of awaits.
//
// It has two faces: the program's, which awaits, and the host's, which posts what happened and wakes the
// program when its wait is over. Both are called on one thread.
class MessageLoop {
 public:
    explicit MessageLoop(FrontEnd& frontEnd) : frontEnd_(frontEnd) {}
    ~MessageLoop() = default;
    MessageLoop(const MessageLoop&) = delete;
    MessageLoop& operator=(const MessageLoop&) = delete;

    FrontEnd& frontEnd() { return frontEnd_; }

    // --- The program's face ---

    // Waits; what happens meanwhile is delivered later. A pause of nothing or less is over at once.
    auto pause(milliseconds duration) { return Wait{*this, frontEnd_.now() + duration}; }

    // Delivers what is waiting and comes back when those handlers are done.
    Task<> runPendingMessages();

    // Shows the window and delivers messages until it closes; no other window takes input meanwhile. The
    // window that took all input before, if one did, must be its owner.
    Task<> showModal(Window& window);

    // Delivers messages until the program ends; it never comes back.
    Task<> run();

    // Nothing is delivered and no wait comes back from now on.
    void end() { ended_ = true; }

    // --- The host's face ---

    // Something happened. It is delivered when the program next asks for messages.
    void post(const InputEvent& event);

    // Lets the program go on as far as it can: until it waits for something that has not happened yet. From
    // inside the program it does nothing.
    void wake();

    // When to wake the program at the latest, if no event comes before.
    std::optional<TimePoint> nextDeadline() const;

    bool ended() const { return ended_; }

    // Whether it waits for a message and has none.
    bool isIdle() const { return program_ && !programWaitsUntil_ && !hasMessage(); }
    // Whether it has something to do even if nothing has happened.
    bool isTimeUp() const;
    // How many pictures the windows have shown.
    std::uint64_t picturesShown() const { return picturesShown_; }

    // The window that input goes to: the innermost modal one, or nothing when every window takes input.
    Window* modalWindow() const { return modalWindows_.empty() ? nullptr : modalWindows_.back(); }

 private:
    friend class Timer;
    friend class Window;

    // The innermost wait: until a time or, without one, until there is a message. Destroying the waiting task
    // takes it back.
    struct Wait {
        MessageLoop& loop;
        std::optional<TimePoint> until;
        bool suspended = false;

        Wait(MessageLoop& waitingLoop, std::optional<TimePoint> end) : loop(waitingLoop), until(end) {}
        Wait(const Wait&) = delete;
        Wait& operator=(const Wait&) = delete;
        ~Wait();
        bool await_ready() const { return loop.isOver(until); }
        void await_suspend(std::coroutine_handle<> program);
        void await_resume() { suspended = false; }
    };

    // A window takes all input as long as this lives.
    class ModalWindow {
     public:
        ModalWindow(MessageLoop& loop, Window& window) : loop_(loop) {
            loop_.modalWindows_.push_back(&window);
        }
        ~ModalWindow() { loop_.modalWindows_.pop_back(); }
        ModalWindow(const ModalWindow&) = delete;
        ModalWindow& operator=(const ModalWindow&) = delete;

     private:
        MessageLoop& loop_;
    };

    bool isOver(std::optional<TimePoint> wait) const;
    bool hasMessage() const;
    Timer* firstDueTimer() const;
    Task<> deliverOne();
    Task<> deliver(InputEvent event);
    void tellPointers();
    void repaintRescaled();
    bool isMeant(const InputEvent& press, const Window& window);
    Wait nextMessage() { return Wait{*this, std::nullopt}; }
    Window* findWindow(WindowId id) const;

    FrontEnd& frontEnd_;
    std::deque<InputEvent> events_;
    std::vector<Timer*> timers_;
    std::vector<Window*> windows_;
    std::vector<Window*> modalWindows_;
    std::pair<WindowId, std::string> clickedScreen_{};  // of the first press of a double click
    std::coroutine_handle<> program_;
    std::optional<TimePoint> programWaitsUntil_;
    std::uint32_t lastWindowId_ = 0;
    std::uint64_t picturesShown_ = 0;
    bool isAwake_ = false;  // the program is being carried on
    bool ended_ = false;
};

}  // namespace quabble
