#pragma once

#include <SDL2/SDL_events.h>

#include <optional>

#include "hosts/desktop/x11/held_keys.hpp"

namespace quabble {

// Something that the X server reports and SDL does not pass on.
struct X11Event {
    enum class Kind {
        KeyboardGained,  // by a window; KeysDown follows
        KeysDown,
        KeyPressed,  // or repeated
        KeyReleased,
        WindowDestroyed,  // by whomever
        ResourcesChanged  // the user's, of which one is the scale
    };
    Kind kind;
    unsigned long window = 0;  // the server's number
    unsigned key = 0;
    HeldKeys::Keys down = {};
};

// Lets such events come among SDL's.
void listenToX11();

std::optional<X11Event> translateX11(const SDL_Event& event);

}  // namespace quabble
