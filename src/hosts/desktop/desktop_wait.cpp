#include "hosts/desktop/desktop_wait.hpp"

#include <SDL2/SDL.h>
#include <poll.h>

#include <algorithm>

#include "hosts/desktop/x11/x11_window.hpp"

namespace quabble {

DesktopWait::DesktopWait() {
    sigset_t ends;
    sigemptyset(&ends);
    for (const int signal : {SIGINT, SIGTERM, SIGHUP, SIGUSR1})
        sigaddset(&ends, signal);
    sigprocmask(SIG_BLOCK, &ends, &before_);
}

DesktopWait::~DesktopWait() {
    sigprocmask(SIG_SETMASK, &before_, nullptr);
}

// On X11 this is not left to SDL: its own wait wakes itself by an event to one of the windows over a second
// connection, which kills the program when the window has been closed before the server gets to it.
void DesktopWait::sleep(SDL_Window* window, std::optional<Clock::duration> longest) const {
    if (const auto x11 = X11Window::of(window)) {
        // An input method may speak to SDL by another way than the X server.
        constexpr Clock::duration inputMethodPatience = milliseconds(50);
        if (SDL_IsTextInputActive() != SDL_FALSE)
            longest = std::min(longest.value_or(inputMethodPatience), inputMethodPatience);
        pollfd waiting{x11->connection(), POLLIN, 0};
        const auto time = std::chrono::nanoseconds(longest.value_or(Clock::duration::zero())).count();
        const timespec end{time / 1'000'000'000, time % 1'000'000'000};
        ppoll(&waiting, 1, longest ? &end : nullptr, &before_);
        return;
    }
    sigset_t blocked;
    sigprocmask(SIG_SETMASK, &before_, &blocked);
    const auto wholeTime = std::chrono::ceil<milliseconds>(longest.value_or(milliseconds(-1)));
    SDL_WaitEventTimeout(nullptr, static_cast<int>(wholeTime.count()));
    sigprocmask(SIG_SETMASK, &blocked, nullptr);
}

}  // namespace quabble
