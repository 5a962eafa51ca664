#pragma once

#include <functional>
#include <optional>
#include <span>

#include "draw/geometry.hpp"
#include "hosts/desktop/x11/icon.hpp"

struct SDL_Window;
struct _XDisplay;

namespace quabble {

// A window as the X server knows it, for what SDL has no words for. What it asks of a window manager that
// does not know it has no effect.
class X11Window {
 public:
    // Nothing on other desktops.
    static std::optional<X11Window> of(SDL_Window* window);

    // Lets the program live on when the server refuses a request. SDL asks about frames that the window
    // manager may have taken away meanwhile, and Xlib would end the process.
    static void outliveErrors();
    // Calls this when the connection to the server is lost, and then ends the process with a failure. The
    // callback must ask nothing more of the server.
    static void whenServerGoes(std::function<void()> callback);

    _XDisplay* display() const { return display_; }
    unsigned long id() const { return window_; }
    int connection() const;  // the descriptor of the connection to the server
    // The user's dots per inch of texts (the X resource Xft.dpi), if any are set.
    std::optional<double> dotsPerInch() const;
    // Lets the server report when the user's resources change.
    void listenToResources() const;
    // Comes back before it has happened.
    void moveTo(Point corner) const;
    // Takes the buttons to minimise and maximise off a dialog's frame: its owner could not bring it back.
    void haveOnlyCloseButton() const;
    // Tells the window manager of a dialog that is not shown yet: its owner takes no keyboard meanwhile.
    void beModal() const;
    // Says in the server's stead that the window is hidden, to whoever waits for that. It was destroyed by
    // another program, and the server says nothing of it any more.
    void reportHidden() const;
    // Comes back when the server has answered everything that was asked of it.
    void waitForServer() const;
    void setIcons(std::span<const Icon> icons) const;

 private:
    X11Window(_XDisplay* display, unsigned long window) : display_(display), window_(window) {}

    _XDisplay* display_;
    unsigned long window_;
};

}  // namespace quabble
