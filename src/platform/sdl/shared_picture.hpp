#pragma once

#include <memory>

#include "platform/sdl/x11_window.hpp"
#include "platform/surface.hpp"

namespace quabble {

// A window's picture in memory that the X server reads. To show it is to ask the server, not to wait for it,
// as SDL does for its window surface; a picture that is changed before the server has read it may be seen
// half changed until it is shown again.
class SharedPicture {
 public:
    // Nothing when the server cannot read the program's memory, as one on another machine, or shows other
    // pixels than a Surface's.
    static std::unique_ptr<SharedPicture> of(const X11Window& window, Size size);
    ~SharedPicture();
    SharedPicture(const SharedPicture&) = delete;
    SharedPicture& operator=(const SharedPicture&) = delete;

    void set(const Surface& picture);  // of the size that was given
    void show();

 private:
    struct Segment;
    explicit SharedPicture(std::unique_ptr<Segment> segment);

    std::unique_ptr<Segment> segment_;
};

}  // namespace quabble
