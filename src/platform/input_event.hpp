#pragma once

#include <cstdint>

#include "platform/front_end.hpp"

namespace quabble {

enum class EventKind { MouseDown, MouseMove, KeyPress, CloseButton, Minimised, Restored };

// Key codes of the characters that mean something here; every other key press carries its own character.
namespace keys {
constexpr std::int16_t backspace = 8;
constexpr std::int16_t tab = 9;
constexpr std::int16_t enter = 13;
constexpr std::int16_t escape = 27;
}  // namespace keys

// Something that happened to a window.
struct InputEvent {
    WindowId window = WindowId::none;
    EventKind kind = EventKind::MouseMove;
    float x = 0;  // of a mouse event, in client pixels
    float y = 0;
    std::int16_t key = 0;  // of a key press: a key that yields a character, modifiers alone do not
};

}  // namespace quabble
