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
    Restored,
    Rescaled
};

// Key codes of the characters that mean something here. All other characters mean the same.
namespace keys {
constexpr std::int16_t backspace = 8;
constexpr std::int16_t tab = 9;
constexpr std::int16_t enter = 13;
constexpr std::int16_t escape = 27;
constexpr std::int16_t space = 32;
}  // namespace keys

// What a key asks of a text that is being edited, or of the program's own pointer: Up, Down and Click, and
// Left and Right where no text is.
enum class EditCommand {
    Left,
    Right,
    Up,
    Down,
    Click,
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

// Something that happened to a window. Events for windows that are closed, or that a dialog keeps from taking
// input, are ignored.
struct InputEvent {
    WindowId window = WindowId::none;
    EventKind kind = EventKind::MouseMove;
    // Of a mouse event: the program's pixel that is seen at the pointer, a whole one, counted from the client
    // area's top left corner. It may lie outside while a button is held.
    float x = 0;
    float y = 0;
    // Of a key press: the character that the key yields. A press is reported once, not again while the key is
    // held; arrows, function keys, modifiers and keys pressed together with Ctrl or Alt yield none.
    std::int16_t key = 0;
    // Of an edit, which is reported again while its keys are held, but for a click.
    EditCommand command = EditCommand::Left;
    bool extends = false;         // of an edit or a mouse press: Shift is held
    std::string text = {};        // of a text input, UTF-8
    bool continuesClick = false;  // of a mouse press: it follows another quickly, as in a double click
    Scale scale = {};             // of the pictures that a rescaled window wants from now on
};

}  // namespace quabble
