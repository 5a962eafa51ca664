#include "platform/sdl/refused_drops.hpp"

#include <X11/Xlibint.h>  // last: it has macros named min and max

namespace quabble {
namespace {

using Convert = Bool (*)(Display*, XEvent*, xEvent*);
Convert convertMessage;
Atom dropOffered;

Bool convertUnlessDropOffered(Display* display, XEvent* event, xEvent* sent) {
    if (sent->u.clientMessage.u.l.type == dropOffered)
        return False;
    return convertMessage(display, event, sent);
}

}  // namespace

void refuseDrops(const X11Window& window) {
    if (convertMessage != nullptr)
        return;
    dropOffered = XInternAtom(window.display(), "XdndEnter", False);
    convertMessage = XESetWireToEvent(window.display(), ClientMessage, convertUnlessDropOffered);
}

}  // namespace quabble
