#pragma once

#include <cstdint>
#include <functional>
#include <memory>
#include <optional>

#include "hosts/windows/keyboard.hpp"
#include "hosts/windows/native_picture.hpp"
#include "platform/front_end.hpp"
#include "platform/input_event.hpp"

struct HWND__;

namespace quabble {

// Who hears what happens to the windows. It is told from inside calls of the system's, which may come at any
// time, also while the program is in the midst of something: it must not wake the program.
class WindowListener {
 public:
    virtual ~WindowListener() = default;
    virtual void report(const InputEvent& event) = 0;
    // The number of dots per inch of a screen, or its size, has changed: windows may be wanted at other
    // scales.
    virtual void screensHaveChanged() = 0;
    // The user wants the record of the last game. As above, it is not to be written here and now.
    virtual void recordIsWanted() = 0;
    // The user logs off: when it comes back the process may be ended.
    virtual void sessionEnds() = 0;
};

// A window of the desktop and the picture it shows, one to one, at the scale of the screen that it is on. A
// dialog has its owner's. Only where the screen is too small for a window at scale 1 its picture is brought
// down.
class Win32Window {
 public:
    // An owner takes no input from now on until the window goes. Both must outlive it, and it is at its place
    // from the first.
    Win32Window(WindowId id, const NativeWindow& traits, const Win32Window* owner, WindowListener& listener);
    ~Win32Window();
    Win32Window(const Win32Window&) = delete;
    Win32Window& operator=(const Win32Window&) = delete;

    HWND__* handle() const { return handle_; }  // null when the system had no window to give
    bool isDialog() const { return owner_ != nullptr; }

    // At which its pictures are wanted.
    Scale scale() const { return scale_; }
    // Takes over its screen's scale; true when it is another than before.
    bool followScale();

    // The first picture brings the window onto the screen.
    void show(const Surface& picture);
    void minimise() const;
    void setPointer(PointerShape shape);
    void setTextInput(std::optional<Rect> area);

 private:
    friend struct WindowProcedure;
    // What the window does about a message; nothing when the system is to do what it always does.
    std::optional<std::intptr_t> answer(unsigned message, std::uintptr_t first, std::intptr_t second);
    std::optional<std::intptr_t> answerFrame(unsigned message, std::uintptr_t first, std::intptr_t second);
    std::optional<std::intptr_t> answerInput(unsigned message, std::uintptr_t first, std::intptr_t second);
    bool obeyMenu(std::uintptr_t command, std::intptr_t key);
    void report(InputEvent event);
    void reportPointer(EventKind kind, std::uintptr_t buttons, std::intptr_t place);
    void reportSize(std::uintptr_t how);
    void paint() const;
    bool showPointer(std::intptr_t where) const;
    void placeInputMethod() const;

    double factorAt(unsigned dotsPerInch) const;
    void setFactor(double factor);
    Size sizeAt(double factor) const;
    Size size() const;  // of the client area, in the screen's pixels
    Point wantedCorner(Size outer) const;
    void resizeTo(Size client) const;
    Point programPixel(Point place) const;

    WindowId id_;
    NativeWindow traits_;
    const Win32Window* owner_;
    WindowListener& listener_;
    HWND__* handle_ = nullptr;
    double factor_ = 1;  // less than 1 only to fit
    Scale scale_;
    NativePicture picture_;
    Keyboard keyboard_;
    PointerShape pointer_ = PointerShape::Arrow;
    std::optional<Rect> textArea_;
    bool isOpened_ = false;
    bool isMinimised_ = false;
};

}  // namespace quabble
