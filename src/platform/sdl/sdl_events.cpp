#include "platform/sdl/sdl_events.hpp"

#include <limits>

namespace quabble {
namespace {

// The character that a key yields; nothing for modifiers, arrows, function keys and the like, and for keys
// pressed together with a modifier that makes them a command of the desktop.
std::optional<std::int16_t> characterOf(const SDL_Keysym& keysym) {
    switch (keysym.sym) {
        case SDLK_KP_ENTER:
            return keys::enter;
        case SDLK_DELETE:
            return std::nullopt;
        default:
            break;
    }
    const bool isCommand = (keysym.mod & (KMOD_CTRL | KMOD_LALT | KMOD_GUI)) != 0;
    const bool isKeypadCharacter = keysym.sym >= SDLK_KP_DIVIDE && keysym.sym <= SDLK_KP_PERIOD;
    const bool hasCharacter = keysym.sym > 0 && keysym.sym <= std::numeric_limits<std::int16_t>::max();
    if (isCommand || !(hasCharacter || isKeypadCharacter))
        return std::nullopt;
    return static_cast<std::int16_t>(hasCharacter ? keysym.sym : ' ');
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
        case SDL_MOUSEBUTTONDOWN:
            return InputEvent{.kind = EventKind::MouseDown,
                              .x = static_cast<float>(event.button.x),
                              .y = static_cast<float>(event.button.y)};
        case SDL_MOUSEMOTION:
            return InputEvent{.kind = EventKind::MouseMove,
                              .x = static_cast<float>(event.motion.x),
                              .y = static_cast<float>(event.motion.y)};
        case SDL_KEYDOWN:
            // A key that is held down is one press.
            if (const auto key = characterOf(event.key.keysym); key && event.key.repeat == 0)
                return InputEvent{.kind = EventKind::KeyPress, .key = *key};
            return std::nullopt;
        case SDL_WINDOWEVENT:
            return translateWindowEvent(event.window);
        default:
            return std::nullopt;
    }
}

std::uint32_t windowOf(const SDL_Event& event) {
    switch (event.type) {
        case SDL_MOUSEBUTTONDOWN:
            return event.button.windowID;
        case SDL_MOUSEMOTION:
            return event.motion.windowID;
        case SDL_KEYDOWN:
            return event.key.windowID;
        case SDL_WINDOWEVENT:
            return event.window.windowID;
        default:
            return 0;
    }
}

}  // namespace quabble
