#pragma once

#include <SDL2/SDL_events.h>

#include <optional>

#include "platform/input_event.hpp"

namespace quabble {

// What an SDL event means to the window it happened to; nothing for those that mean nothing here. The
// window's id is left to the caller.
std::optional<InputEvent> translate(const SDL_Event& event);

// SDL's number of the window that the event happened to, 0 for none.
std::uint32_t windowOf(const SDL_Event& event);

}  // namespace quabble
