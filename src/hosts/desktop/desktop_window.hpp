#pragma once

#include <cstdint>
#include <memory>
#include <span>

#include "draw/scaling.hpp"
#include "hosts/desktop/x11/shared_picture.hpp"
#include "platform/front_end.hpp"

struct SDL_Window;
struct SDL_Surface;

namespace quabble {

// A window of the desktop and the picture it shows, one to one, at the desktop's scale. A dialog has its
// owner's. Only where the screen is too small for a window at scale 1 its picture is brought down.
class DesktopWindow {
 public:
    DesktopWindow(const NativeWindow& traits, const DesktopWindow* owner);

    ~DesktopWindow();
    DesktopWindow(const DesktopWindow&) = delete;
    DesktopWindow& operator=(const DesktopWindow&) = delete;

    SDL_Window* sdl() const { return window_.get(); }
    std::uint32_t sdlId() const;  // 0 when the desktop had no window to give

    // At which its pictures are wanted.
    Scale scale() const { return scale_; }
    // Takes over the desktop's scale; true when it is another than before.
    bool followScale();

    // Shows a picture of the window's client size, at whatever scale, which must stay until the next one or
    // the window's end. The first one brings the window onto the screen.
    void show(const Surface& picture);
    // A window that was uncovered, restored or resized gets its picture again.
    void showAgain();

    void takeKeyboard() const;
    // Another program has destroyed it.
    void setLost() { isLost_ = true; }

    PointerShape pointer() const { return pointer_; }  // above the window
    void setPointer(PointerShape shape) { pointer_ = shape; }

    // From the desktop's coordinates within the window to the program's pixels, and back.
    Point programPixel(Point place) const;
    Rect placeOf(const Rect& programPixels) const;

 private:
    Size size() const;  // in the desktop's coordinates
    double wantedFactor() const;
    void setFactor(double factor);
    void moveTo(Point corner) const;
    Size sizeAtScale() const;
    Point wantedPosition() const;
    Magnifier& magnifierFor(const Surface& picture, Size shown);
    void fill(SDL_Surface& screen, const Surface& picture);

    struct Destroy {
        void operator()(SDL_Window* window) const;
    };
    std::unique_ptr<SDL_Window, Destroy> window_;
    NativeWindow traits_;
    const DesktopWindow* owner_;
    double factor_ = 1;  // less than 1 only to fit
    Scale scale_;
    const Surface* picture_ = nullptr;
    std::unique_ptr<SharedPicture> shared_;  // or else it is shown by SDL's window surface
    Magnifier magnifier_;
    bool isLost_ = false;
    PointerShape pointer_ = PointerShape::Arrow;
    bool isOpened_ = false;  // from then on it is the desktop's to hide it and to bring it back
};

}  // namespace quabble
