#pragma once

#include <csignal>
#include <optional>

#include "platform/front_end.hpp"

struct SDL_Window;

namespace quabble {

// Sleeps until the desktop has something to say. Requests to end the process (SIGINT, SIGTERM, SIGHUP) or to
// write its record (SIGUSR1) are let in during the sleep alone, so that none can slip in just before it and
// be slept over.
class DesktopWait {
 public:
    DesktopWait();
    ~DesktopWait();
    DesktopWait(const DesktopWait&) = delete;
    DesktopWait& operator=(const DesktopWait&) = delete;

    // Comes back when SDL may have events, a signal came or the time is over; without a time it waits for
    // ever. The window is any of the program's.
    void sleep(SDL_Window* window, std::optional<Clock::duration> longest) const;

 private:
    sigset_t before_{};
};

}  // namespace quabble
