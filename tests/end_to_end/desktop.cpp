#include "desktop.hpp"

#include <X11/Xatom.h>
#include <X11/Xlib.h>
#include <X11/Xutil.h>
#include <X11/extensions/XTest.h>

#include <cstdio>
#include <cstdlib>
#include <thread>

namespace quabble {
namespace {

using namespace std::chrono_literals;

constexpr auto patience = 10s;
constexpr auto reactionTime = 150ms;  // a window manager may need some of it to take a closed window away

}  // namespace

void require(bool condition, const std::string& what) {
    if (condition)
        return;
    std::fprintf(stderr, "FAILED: %s\n", what.c_str());
    std::exit(EXIT_FAILURE);
}

void waitUntil(const std::string& what, const std::function<bool()>& isSo) {
    const auto end = std::chrono::steady_clock::now() + patience;
    while (!isSo()) {
        require(std::chrono::steady_clock::now() < end, "it did not come: " + what);
        std::this_thread::sleep_for(1ms);
    }
}

Desktop::Desktop() : display_(XOpenDisplay(nullptr)), root_(None) {
    require(display_ != nullptr, "a display");
    root_ = DefaultRootWindow(display_);
    // A window may go between being found and being looked at.
    XSetErrorHandler([](Display*, XErrorEvent*) { return 0; });
}

Desktop::~Desktop() {
    XCloseDisplay(display_);
}

::Window Desktop::waitForWindow(const std::string& caption) {
    ::Window found = None;
    waitUntil("the window " + caption, [&] {
        found = find(root_, caption);
        return found != None && isVisible(found);
    });
    return found;
}

bool Desktop::isVisible(::Window window) {
    XWindowAttributes attributes{};
    return XGetWindowAttributes(display_, window, &attributes) != 0 && attributes.map_state == IsViewable;
}

::Window Desktop::find(::Window below, const std::string& caption) {
    char* name = nullptr;
    if (XFetchName(display_, below, &name) != 0 && name != nullptr) {
        const bool matches = caption == name;
        XFree(name);
        if (matches)
            return below;
    }
    ::Window root = None;
    ::Window parent = None;
    ::Window* children = nullptr;
    unsigned count = 0;
    ::Window found = None;
    if (XQueryTree(display_, below, &root, &parent, &children, &count) != 0) {
        for (unsigned i = 0; i < count && found == None; ++i)
            found = find(children[i], caption);
        if (children != nullptr)
            XFree(children);
    }
    return found;
}

void Desktop::setScale(Scale scale) {
    const std::string resources = "Xft.dpi: " + std::to_string(24 * scale.quarters()) + "\n";
    XChangeProperty(display_, root_, XA_RESOURCE_MANAGER, XA_STRING, 8, PropModeReplace,
                    reinterpret_cast<const unsigned char*>(resources.data()),
                    static_cast<int>(resources.size()));
    XSync(display_, False);
    scale_ = scale;
}

void Desktop::click(::Window window, int x, int y, int times) {
    const Rect pixel = scale_.device(Rect::ofSize(x, y, 1, 1));
    clickAt(window, {pixel.left, pixel.top}, times);
}

void Desktop::clickAt(::Window window, Point place, int times) {
    std::this_thread::sleep_for(reactionTime);
    int screenX = 0;
    int screenY = 0;
    ::Window child = None;
    XTranslateCoordinates(display_, window, root_, place.x, place.y, &screenX, &screenY, &child);
    XTestFakeMotionEvent(display_, -1, screenX, screenY, CurrentTime);
    for (int i = 0; i < times; ++i) {
        if (i > 0)
            std::this_thread::sleep_for(reactionTime);
        XTestFakeButtonEvent(display_, 1, True, CurrentTime);
        XTestFakeButtonEvent(display_, 1, False, CurrentTime);
        XSync(display_, False);
    }
}

void Desktop::offerUnknownDrop(::Window window) {
    constexpr long version = 5L << 24;
    constexpr long unknownKind = 0x1FFFFFFF;
    XEvent offer{};
    offer.xclient.type = ClientMessage;
    offer.xclient.window = window;
    offer.xclient.message_type = XInternAtom(display_, "XdndEnter", False);
    offer.xclient.format = 32;
    offer.xclient.data.l[0] = static_cast<long>(root_);
    offer.xclient.data.l[1] = version;
    offer.xclient.data.l[2] = unknownKind;
    XSendEvent(display_, window, False, NoEventMask, &offer);
    XSync(display_, False);
}

// The last button of the title bar that the window manager has put above the window.
void Desktop::clickCloseButton(::Window window) {
    XWindowAttributes attributes{};
    XGetWindowAttributes(display_, window, &attributes);
    clickAt(window, {attributes.width - 10, -10}, 1);
}

void Desktop::press(KeySym keysym, std::chrono::milliseconds howLong) {
    setKey(keysym, true);
    std::this_thread::sleep_for(howLong);
    setKey(keysym, false);
}

void Desktop::pressWith(KeySym modifier, KeySym keysym) {
    setKey(modifier, true);
    press(keysym);
    setKey(modifier, false);
}

void Desktop::setKey(KeySym keysym, bool isDown) {
    XTestFakeKeyEvent(display_, XKeysymToKeycode(display_, keysym), isDown ? True : False, CurrentTime);
    XSync(display_, False);
}

void Desktop::type(const std::string& lowerCaseLetters) {
    for (const char letter : lowerCaseLetters)
        press(static_cast<unsigned char>(letter));  // a letter's keysym is its character
}

void Desktop::waitForFocus(WindowOnScreen window) {
    waitUntil("the keyboard's focus", [&] {
        ::Window focused = None;
        int revert = 0;
        XGetInputFocus(display_, &focused, &revert);
        return focused == window;
    });
}

void Desktop::minimise(::Window window) {
    XIconifyWindow(display_, window, DefaultScreen(display_));
    waitUntil("the window's leaving", [&] { return !isVisible(window); });
}

void Desktop::restore(::Window window) {
    constexpr long fromTaskBar = 2;
    askWindowManager(window, "_NET_ACTIVE_WINDOW", fromTaskBar);
    waitUntil("the window's return", [&] { return isVisible(window); });
}

void Desktop::showWorkspace(int number) {
    askWindowManager(root_, "_NET_CURRENT_DESKTOP", number);
}

void Desktop::destroy(::Window window) {
    XDestroyWindow(display_, window);
    XSync(display_, False);
}

// A message of the Extended Window Manager Hints.
void Desktop::askWindowManager(::Window window, const char* what, long first) {
    XEvent message{};
    message.xclient.type = ClientMessage;
    message.xclient.window = window;
    message.xclient.message_type = XInternAtom(display_, what, False);
    message.xclient.format = 32;
    message.xclient.data.l[0] = first;
    XSendEvent(display_, root_, False, SubstructureNotifyMask | SubstructureRedirectMask, &message);
    XSync(display_, False);
}

Surface Desktop::look(::Window window) {
    XWindowAttributes attributes{};
    XGetWindowAttributes(display_, window, &attributes);
    Surface seen(attributes.width, attributes.height);
    XImage* image = nullptr;
    waitUntil("a window that lies on the screen", [&] {  // a restored one may come flying
        image = XGetImage(display_, window, 0, 0, static_cast<unsigned>(attributes.width),
                          static_cast<unsigned>(attributes.height), AllPlanes, ZPixmap);
        return image != nullptr;
    });
    for (int y = 0; y < attributes.height; ++y) {
        for (int x = 0; x < attributes.width; ++x)
            seen.row(y)[static_cast<std::size_t>(x)] =
                static_cast<std::uint32_t>(XGetPixel(image, x, y)) & 0xFFFFFF;
    }
    XDestroyImage(image);
    return seen;
}

}  // namespace quabble
