#pragma once

#include <chrono>
#include <cstdint>
#include <optional>
#include <span>
#include <string>

#include "draw/geometry.hpp"
#include "draw/surface.hpp"

namespace quabble {

using Clock = std::chrono::steady_clock;
using TimePoint = Clock::time_point;
using std::chrono::milliseconds;

enum class WindowId : std::uint32_t { none = 0 };

// What a native window is made from. It never changes its size.
struct NativeWindow {
    std::string caption;  // UTF-8
    Size clientSize;      // what the program paints
    std::optional<Point>
        position;  // of its outer frame on the first screen; without one, centred on its owner or the screen
    bool borderless = false;
    WindowId owner = WindowId::none;  // set for a dialog: it stays above its owner and centres on it
};

enum class PointerShape { Arrow, Hand };

// The machine that the program runs on, seen from the program: what a port has to write. Everything is called
// on the one thread of the program. Operations with a body here may be left out by a machine that lacks them.
class FrontEnd {
 public:
    virtual ~FrontEnd() = default;

    virtual TimePoint now() = 0;

    // Makes a window. It comes to be seen with its first pixels.
    virtual void createWindow(WindowId window, const NativeWindow& traits) = 0;
    // Shows the picture, of the window's client size. When the window is uncovered or restored the front end
    // shows it again by itself: it must stay where it is until the next one or until the window is closed.
    virtual void showPixels(WindowId window, const Surface& picture) = 0;
    virtual void closeWindow(WindowId window) = 0;
    // Asks for the window to be minimised; an event reports when it is.
    virtual void minimiseWindow(WindowId /*window*/) {}
    // How the pointer looks over the window; at first it is an arrow.
    virtual void setPointer(WindowId /*window*/, PointerShape /*shape*/) {}
    // Of the first screen.
    virtual Size screenSize() { return {1024, 768}; }

    // Opens a file or an address with whatever program the desktop has for it, in the given folder, and comes
    // back at once. That it fails is not reported.
    virtual void openDocument(const std::string& /*document*/, const std::string& /*folder*/) {}

    // While a window has an area where text is typed, typed text comes as events, and what an input method
    // shows lies at the area. Without one it does not. A window that does not exist has none.
    virtual void setTextInput(WindowId /*window*/, std::optional<Rect> /*area*/) {}

    // The text that the desktop's programs exchange, UTF-8.
    virtual std::string clipboardText() { return {}; }
    virtual void setClipboardText(const std::string& /*text*/) {}

    // The folder of the running program, without a separator at its end.
    virtual std::string executableFolder() = 0;
};

}  // namespace quabble
