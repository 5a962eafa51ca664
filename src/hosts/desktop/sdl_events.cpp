#include "hosts/desktop/sdl_events.hpp"

#include <SDL2/SDL_keyboard.h>

#include <limits>

namespace quabble {
namespace {

// The character that a key yields; nothing for modifiers, arrows, function keys and the like, and for keys
// pressed together with a modifier that makes them a command of the desktop.
std::optional<std::int16_t> characterOf(const SDL_Keysym& keysym) {
    if ((keysym.mod & (KMOD_CTRL | KMOD_LALT | KMOD_GUI)) != 0)
        return std::nullopt;
    switch (keysym.sym) {
        case SDLK_KP_ENTER:
            return keys::enter;
        case SDLK_KP_DIVIDE:
            return '/';
        case SDLK_KP_MULTIPLY:
            return '*';
        case SDLK_KP_MINUS:
            return '-';
        case SDLK_KP_PLUS:
            return '+';
        case SDLK_DELETE:
            return std::nullopt;
        default:
            break;
    }
    const bool isKeypadDigit = keysym.sym >= SDLK_KP_1 && keysym.sym <= SDLK_KP_PERIOD;
    if (isKeypadDigit && (keysym.mod & KMOD_NUM) != 0)
        return "1234567890."[keysym.sym - SDLK_KP_1];
    const bool hasCharacter = keysym.sym > 0 && keysym.sym <= std::numeric_limits<std::int16_t>::max();
    return hasCharacter ? std::optional(static_cast<std::int16_t>(keysym.sym)) : std::nullopt;
}

// The key that a key of the keypad stands for as long as the keypad types no digits.
SDL_Keycode withoutKeypad(const SDL_Keysym& keysym) {
    if ((keysym.mod & KMOD_NUM) != 0)
        return keysym.sym;
    switch (keysym.sym) {
        case SDLK_KP_4:
            return SDLK_LEFT;
        case SDLK_KP_6:
            return SDLK_RIGHT;
        case SDLK_KP_8:
            return SDLK_UP;
        case SDLK_KP_2:
            return SDLK_DOWN;
        case SDLK_KP_0:
            return SDLK_INSERT;
        case SDLK_KP_7:
            return SDLK_HOME;
        case SDLK_KP_1:
            return SDLK_END;
        case SDLK_KP_PERIOD:
            return SDLK_DELETE;
        default:
            return keysym.sym;
    }
}

// What a key asks of a text being edited or of the program's pointer, with Ctrl held or not.
std::optional<EditCommand> commandOf(const SDL_Keysym& keysym) {
    const bool ctrl = (keysym.mod & KMOD_CTRL) != 0;
    switch (withoutKeypad(keysym)) {
        case SDLK_LEFT:
            return ctrl ? EditCommand::WordLeft : EditCommand::Left;
        case SDLK_RIGHT:
            return ctrl ? EditCommand::WordRight : EditCommand::Right;
        case SDLK_UP:
            return EditCommand::Up;
        case SDLK_DOWN:
            return EditCommand::Down;
        case SDLK_INSERT:
        case SDLK_APPLICATION:
        case SDLK_MENU:
            return EditCommand::Click;
        case SDLK_RETURN:
        case SDLK_KP_ENTER:
            return ctrl ? std::optional(EditCommand::Click) : std::nullopt;
        case SDLK_HOME:
            return EditCommand::Home;
        case SDLK_END:
            return EditCommand::End;
        case SDLK_DELETE:
            return EditCommand::Delete;
        case SDLK_a:
            return ctrl ? std::optional(EditCommand::SelectAll) : std::nullopt;
        case SDLK_c:
            return ctrl ? std::optional(EditCommand::Copy) : std::nullopt;
        case SDLK_x:
            return ctrl ? std::optional(EditCommand::Cut) : std::nullopt;
        case SDLK_v:
            return ctrl ? std::optional(EditCommand::Paste) : std::nullopt;
        default:
            return std::nullopt;
    }
}

// A key that is held down is one press or one click; only the steps of a text's caret and of the pointer, and
// what changes a text, are repeated.
std::optional<InputEvent> translateKey(const SDL_KeyboardEvent& event) {
    const bool extends = (event.keysym.mod & KMOD_SHIFT) != 0;
    const auto command = commandOf(event.keysym);
    if (command == EditCommand::Click && event.repeat != 0)
        return std::nullopt;
    if (command)
        return InputEvent{.kind = EventKind::Edit, .command = *command, .extends = extends};
    const auto key = characterOf(event.keysym);
    if (key && event.repeat == 0)
        return InputEvent{.kind = EventKind::KeyPress, .key = *key};
    if (key == keys::backspace)
        return InputEvent{.kind = EventKind::Edit, .command = EditCommand::Backspace};
    return std::nullopt;
}

InputEvent mouseEvent(EventKind kind, std::int32_t x, std::int32_t y) {
    return {.kind = kind,
            .x = static_cast<float>(x),
            .y = static_cast<float>(y),
            .extends = (SDL_GetModState() & KMOD_SHIFT) != 0};
}

std::optional<InputEvent> translateWindowEvent(const SDL_WindowEvent& event) {
    switch (event.event) {
        case SDL_WINDOWEVENT_CLOSE:
            return InputEvent{.kind = EventKind::CloseButton};
        case SDL_WINDOWEVENT_MINIMIZED:
            return InputEvent{.kind = EventKind::Minimised};
        case SDL_WINDOWEVENT_RESTORED:
            return InputEvent{.kind = EventKind::Restored};
        default:
            return std::nullopt;
    }
}

}  // namespace

std::optional<InputEvent> translate(const SDL_Event& event) {
    switch (event.type) {
        case SDL_MOUSEBUTTONDOWN: {
            InputEvent press = mouseEvent(EventKind::MouseDown, event.button.x, event.button.y);
            press.continuesClick = event.button.clicks > 1;
            return press;
        }
        case SDL_MOUSEBUTTONUP:
            return mouseEvent(EventKind::MouseUp, event.button.x, event.button.y);
        case SDL_MOUSEMOTION:
            return mouseEvent(EventKind::MouseMove, event.motion.x, event.motion.y);
        case SDL_KEYDOWN:
            return translateKey(event.key);
        case SDL_TEXTINPUT:
            return InputEvent{.kind = EventKind::TextInput, .text = event.text.text};
        case SDL_WINDOWEVENT:
            return translateWindowEvent(event.window);
        default:
            return std::nullopt;
    }
}

std::uint32_t windowOf(const SDL_Event& event) {
    switch (event.type) {
        case SDL_MOUSEBUTTONDOWN:
        case SDL_MOUSEBUTTONUP:
            return event.button.windowID;
        case SDL_MOUSEMOTION:
            return event.motion.windowID;
        case SDL_KEYDOWN:
            return event.key.windowID;
        case SDL_TEXTINPUT:
            return event.text.windowID;
        case SDL_WINDOWEVENT:
            return event.window.windowID;
        default:
            return 0;
    }
}

}  // namespace quabble
