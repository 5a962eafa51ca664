#include "platform/sdl/desktop_wait.hpp"

#include <SDL2/SDL.h>
#include <SDL2/SDL_syswm.h>
#include <poll.h>

namespace quabble {
namespace {

// The connection to the X server; nothing on other desktops.
std::optional<int> xConnection(SDL_Window* window) {
    SDL_SysWMinfo info{};
    SDL_VERSION(&info.version);
    if (window == nullptr || SDL_GetWindowWMInfo(window, &info) == SDL_FALSE ||
        info.subsystem != SDL_SYSWM_X11)
        return std::nullopt;
    return ConnectionNumber(info.info.x11.display);
}

}  // namespace

DesktopWait::DesktopWait() {
    sigset_t ends;
    sigemptyset(&ends);
    for (const int signal : {SIGINT, SIGTERM, SIGHUP})
        sigaddset(&ends, signal);
    sigprocmask(SIG_BLOCK, &ends, &before_);
}

DesktopWait::~DesktopWait() {
    sigprocmask(SIG_SETMASK, &before_, nullptr);
}

// On X11 this is not left to SDL: its own wait wakes itself by an event to one of the windows over a second
// connection, which kills the program when the window has been closed before the server gets to it.
void DesktopWait::sleep(SDL_Window* window, std::optional<milliseconds> longest) const {
    if (const auto connection = xConnection(window)) {
        pollfd waiting{*connection, POLLIN, 0};
        const auto time = longest.value_or(milliseconds::zero());
        const timespec end{time.count() / 1000, time.count() % 1000 * 1'000'000};
        ppoll(&waiting, 1, longest ? &end : nullptr, &before_);
        return;
    }
    sigset_t blocked;
    sigprocmask(SIG_SETMASK, &before_, &blocked);
    SDL_WaitEventTimeout(nullptr, longest ? static_cast<int>(longest->count()) : -1);
    sigprocmask(SIG_SETMASK, &blocked, nullptr);
}

}  // namespace quabble
