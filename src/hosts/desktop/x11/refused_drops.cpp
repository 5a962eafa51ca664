#include "hosts/desktop/x11/refused_drops.hpp"

#include <X11/Xlibint.h>  // its macros named min and max are no trouble to <cassert>

#include <cassert>

namespace quabble {
namespace {

using Convert = Bool (*)(Display*, XEvent*, xEvent*);

struct Refusal {
    Convert convertMessage = nullptr;
    Atom dropOffered = None;
};

// Xlib's conversions have no argument of ours.
Refusal& refusal() {
    static Refusal kept;
    return kept;
}

Bool convertUnlessDropOffered(Display* display, XEvent* event, xEvent* sent) {
    const Convert convert = refusal().convertMessage;
    assert(convert != nullptr);
    if (sent->u.clientMessage.u.l.type == refusal().dropOffered)
        return False;
    return convert(display, event, sent);
}

}  // namespace

void refuseDrops(const X11Window& window) {
    if (refusal().convertMessage != nullptr)
        return;
    refusal().dropOffered = XInternAtom(window.display(), "XdndEnter", False);
    refusal().convertMessage = XESetWireToEvent(window.display(), ClientMessage, convertUnlessDropOffered);
}

}  // namespace quabble
