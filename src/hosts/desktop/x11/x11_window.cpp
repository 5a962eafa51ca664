#include "hosts/desktop/x11/x11_window.hpp"

#include <SDL2/SDL.h>
#include <SDL2/SDL_syswm.h>
#include <X11/Xatom.h>
#include <X11/Xresource.h>

#include <charconv>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <memory>
#include <utility>
#include <vector>

namespace quabble {
namespace {

struct FreeByX {
    void operator()(unsigned char* data) const { XFree(data); }
};

struct DestroyDatabase {
    void operator()(XrmDatabase database) const { XrmDestroyDatabase(database); }
};

// The resources as they are now; Xlib's own copy is as old as the connection.
std::unique_ptr<unsigned char, FreeByX> resources(Display* display) {
    constexpr long longest = 1L << 20;  // in units of 4 bytes
    Atom type = None;
    int format = 0;
    unsigned long size = 0;
    unsigned long left = 0;
    unsigned char* text = nullptr;
    XGetWindowProperty(display, DefaultRootWindow(display), XA_RESOURCE_MANAGER, 0, longest, False, XA_STRING,
                       &type, &format, &size, &left, &text);
    return std::unique_ptr<unsigned char, FreeByX>(text);
}

}  // namespace

std::optional<X11Window> X11Window::of(SDL_Window* window) {
    SDL_SysWMinfo info{};
    SDL_VERSION(&info.version);
    if (window == nullptr || SDL_GetWindowWMInfo(window, &info) == SDL_FALSE ||
        info.subsystem != SDL_SYSWM_X11)
        return std::nullopt;
    return X11Window(info.info.x11.display, info.info.x11.window);
}

void X11Window::outliveErrors() {
    XSetErrorHandler([](Display*, XErrorEvent*) { return 0; });
}

void X11Window::whenServerGoes(std::function<void()> callback) {
    static std::function<void()> kept;
    kept = std::move(callback);
    XSetIOErrorHandler([](Display*) {
        kept();
        std::fputs("The display that Quabble was shown on has gone.\n", stderr);
        std::_Exit(EXIT_FAILURE);
        return 0;
    });
}

int X11Window::connection() const {
    return ConnectionNumber(display_);
}

std::optional<double> X11Window::dotsPerInch() const {
    const auto text = resources(display_);
    if (!text)
        return std::nullopt;
    XrmInitialize();
    const std::unique_ptr<_XrmHashBucketRec, DestroyDatabase> database(
        XrmGetStringDatabase(reinterpret_cast<const char*>(text.get())));
    char* type = nullptr;
    XrmValue value{};
    if (!database || XrmGetResource(database.get(), "Xft.dpi", "Xft.Dpi", &type, &value) == False)
        return std::nullopt;
    double dots = 0;
    const auto [end, problem] = std::from_chars(value.addr, value.addr + std::strlen(value.addr), dots);
    const bool isSensible = problem == std::errc() && dots >= 48 && dots <= 960;
    return isSensible ? std::optional(dots) : std::nullopt;
}

// SDL may have asked the same window for other events.
void X11Window::listenToResources() const {
    XWindowAttributes root{};
    XGetWindowAttributes(display_, DefaultRootWindow(display_), &root);
    XSelectInput(display_, DefaultRootWindow(display_), root.your_event_mask | PropertyChangeMask);
}

void X11Window::moveTo(Point corner) const {
    XMoveWindow(display_, window_, corner.x, corner.y);
}

// The format is that of the Motif window manager, which most have taken over.
void X11Window::haveOnlyCloseButton() const {
    constexpr long functionsAndDecorations = 1 | 2;
    constexpr long moveAndClose = 4 | 32;
    constexpr long borderTitleAndMenu = 2 | 8 | 16;
    const long hints[] = {functionsAndDecorations, moveAndClose, borderTitleAndMenu, 0, 0};
    const Atom property = XInternAtom(display_, "_MOTIF_WM_HINTS", False);
    XChangeProperty(display_, window_, property, property, 32, PropModeReplace,
                    reinterpret_cast<const unsigned char*>(hints), std::size(hints));
}

void X11Window::beModal() const {
    const Atom modal = XInternAtom(display_, "_NET_WM_STATE_MODAL", False);
    XChangeProperty(display_, window_, XInternAtom(display_, "_NET_WM_STATE", False), XA_ATOM, 32,
                    PropModeAppend, reinterpret_cast<const unsigned char*>(&modal), 1);
}

void X11Window::reportHidden() const {
    XEvent event{};
    event.type = UnmapNotify;
    event.xunmap.display = display_;
    event.xunmap.event = event.xunmap.window = window_;
    XPutBackEvent(display_, &event);
}

void X11Window::waitForServer() const {
    XSync(display_, False);
}

// Each is its width and height and then its pixels, opacity first: the format of the Extended Window Manager
// Hints.
void X11Window::setIcons(std::span<const Icon> icons) const {
    std::vector<long> values;
    for (const Icon& icon : icons) {
        values.push_back(icon.size.width);
        values.push_back(icon.size.height);
        for (std::size_t i = 0; i < icon.rgba.size(); i += 4) {
            const auto part = [&](std::size_t at, int shift) { return long{icon.rgba[i + at]} << shift; };
            values.push_back(part(3, 24) | part(0, 16) | part(1, 8) | part(2, 0));
        }
    }
    XChangeProperty(display_, window_, XInternAtom(display_, "_NET_WM_ICON", False), XA_CARDINAL, 32,
                    PropModeReplace, reinterpret_cast<const unsigned char*>(values.data()),
                    static_cast<int>(values.size()));
}

}  // namespace quabble
