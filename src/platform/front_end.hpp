#pragma once

#include <chrono>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "base/cleared_memory.hpp"
#include "draw/geometry.hpp"
#include "draw/scale.hpp"
#include "draw/surface.hpp"

namespace quabble {

using Clock = std::chrono::steady_clock;
using TimePoint = Clock::time_point;
using std::chrono::milliseconds;

using FileBytes = std::vector<std::byte, ClearedMemory<std::byte>>;

enum class WindowId : std::uint32_t { none = 0 };

// What a native window is made from. It never changes its size.
struct NativeWindow {
    std::string caption;  // UTF-8
    Size clientSize;      // what the program paints, in its pixels
    // Of its outer frame, from the first screen's top left corner; without one it is centred on its owner or,
    // if it has none, on the screen.
    std::optional<Point> position;
    bool borderless = false;
    WindowId owner = WindowId::none;  // set for a dialog: it stays above its owner
};

enum class PointerShape { Arrow, Hand };

// The machine that the program runs on, seen from the program: what a host has to write. Sizes and places are
// in the program's pixels, of which each may be several of the screen's. Texts are UTF-8.
//
// The program calls it from inside `start` and `wake` of `Program`, and when it is destroyed; the time it
// asks for in `nextDeadline`, too. All on one thread. An operation may post events, and must come back at
// once: what takes time is reported by an event. Nothing is thrown. Operations with a body here may be left
// out.
class FrontEnd {
 public:
    virtual ~FrontEnd() = default;

    // The time, by a clock that never goes back. It need not go on while the machine sleeps.
    virtual TimePoint now() = 0;

    // Makes a window under an id that was never used before, and says at which scale its pictures are wanted;
    // a dialog has its owner's. It comes to be seen with its first picture. If it cannot be made, an event
    // for the id asks to close it, as if the user had. When another scale is wanted later an event says so.
    virtual Scale createWindow(WindowId window, const NativeWindow& traits) = 0;

    // The operations below that name a window are called for those that were created and not closed yet, also
    // for one that could not be made.

    // Shows the picture, of the window's client size at a scale that was wanted for it, if not always the
    // latest. When the window is uncovered or restored the front end shows it again by itself: from a copy,
    // or with what it has kept of it, for the program draws on in the same place before it shows it again.
    // The place stays until the next picture is shown or the window is closed.
    virtual void showPixels(WindowId window, const Surface& picture) = 0;
    // The window goes from the screen, its owner is to take input again, and events that are still on their
    // way to it may be posted or not.
    virtual void closeWindow(WindowId window) = 0;
    // Asks for the window to be minimised. An event reports it once it is; one that cannot be stays as it is.
    virtual void minimiseWindow(WindowId /*window*/) {}
    // How the pointer looks over the window; at first it is an arrow.
    virtual void setPointer(WindowId /*window*/, PointerShape /*shape*/) {}
    // While a window has an area where text is typed, typed text comes as events, and what an input method
    // shows lies at the area. Without one, as at first, it does not.
    virtual void setTextInput(WindowId /*window*/, std::optional<Rect> /*area*/) {}

    // Of the first screen.
    virtual Size screenSize() { return {1024, 768}; }

    // The whole of a file that comes with the program; empty when there is none or it cannot be read.
    virtual FileBytes programFile(std::string_view name) = 0;

    // Something has happened that those who do not see it are to be told, after what they are being told.
    virtual void say(std::string_view /*words*/) {}

    // Opens a web address, which has "://" in it, or a file that comes with the program, by its name, with
    // whatever the machine has for it. That it fails is not reported.
    virtual void openDocument(std::string_view /*document*/) {}

    // The text that programs exchange; empty when there is none. That it cannot be set is not reported.
    virtual std::string clipboardText() { return {}; }
    virtual void setClipboardText(const std::string& /*text*/) {}
};

}  // namespace quabble
