#pragma once

#include <cstdint>
#include <string>

#include "platform/front_end.hpp"

namespace quabble {

enum class EventKind {
    MouseDown,
    MouseMove,
    MouseUp,
    KeyPress,
    TextInput,
    Edit,
    CloseButton,
    Minimised,
    Restored
};

// Key codes of the characters that mean something here; every other key press carries its own character.
namespace keys {
constexpr std::int16_t backspace = 8;
constexpr std::int16_t tab = 9;
constexpr std::int16_t enter = 13;
constexpr std::int16_t escape = 27;
constexpr std::int16_t space = 32;
}  // namespace keys

// What a key asks of a text that is being edited.
enum class EditCommand {
    Left,
    Right,
    WordLeft,
    WordRight,
    Home,
    End,
    Backspace,
    Delete,
    SelectAll,
    Copy,
    Cut,
    Paste
};

// Something that happened to a window.
struct InputEvent {
    WindowId window = WindowId::none;
    EventKind kind = EventKind::MouseMove;
    float x = 0;  // of a mouse event, in client pixels
    float y = 0;
    std::int16_t key = 0;  // of a key press: a key that yields a character, modifiers alone do not
    EditCommand command = EditCommand::Left;
    bool extends = false;         // of an edit or a mouse press: Shift is held, the selection grows
    std::string text = {};        // of a text input, UTF-8
    bool continuesClick = false;  // of a mouse press: it follows another quickly, as in a double click
};

}  // namespace quabble
