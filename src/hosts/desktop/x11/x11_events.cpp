#include "hosts/desktop/x11/x11_events.hpp"

#include <SDL2/SDL_syswm.h>
#include <X11/Xatom.h>

namespace quabble {
namespace {

HeldKeys::Keys keysOf(const XKeymapEvent& event) {
    HeldKeys::Keys keys;
    for (std::size_t key = 0; key < keys.size(); ++key)
        keys.set(key, (static_cast<unsigned char>(event.key_vector[key / 8]) >> key % 8 & 1) != 0);
    return keys;
}

}  // namespace

void listenToX11() {
    SDL_EventState(SDL_SYSWMEVENT, SDL_ENABLE);
}

std::optional<X11Event> translateX11(const SDL_Event& event) {
    using Kind = X11Event::Kind;
    if (event.type != SDL_SYSWMEVENT || event.syswm.msg->subsystem != SDL_SYSWM_X11)
        return std::nullopt;
    const XEvent& x11 = event.syswm.msg->msg.x11.event;
    switch (x11.type) {
        case FocusIn:
            return X11Event{.kind = Kind::KeyboardGained, .window = x11.xfocus.window};
        case KeymapNotify:
            return X11Event{.kind = Kind::KeysDown, .down = keysOf(x11.xkeymap)};
        case KeyPress:
            return X11Event{.kind = Kind::KeyPressed, .window = x11.xkey.window, .key = x11.xkey.keycode};
        case KeyRelease:
            return X11Event{.kind = Kind::KeyReleased, .window = x11.xkey.window, .key = x11.xkey.keycode};
        case DestroyNotify:
            return X11Event{.kind = Kind::WindowDestroyed, .window = x11.xdestroywindow.window};
        case PropertyNotify:
            if (x11.xproperty.atom == XA_RESOURCE_MANAGER)
                return X11Event{.kind = Kind::ResourcesChanged};
            return std::nullopt;
        default:
            return std::nullopt;
    }
}

}  // namespace quabble
