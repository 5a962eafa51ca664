#pragma once

#include <memory>

#include "draw/scaling.hpp"
#include "draw/surface.hpp"
#include "hosts/desktop/x11/x11_window.hpp"

namespace quabble {

// A window's picture in memory that the X server reads. To show it is to ask the server, not to wait for it,
// as SDL does for its window surface; a picture that is changed before the server has read it may be seen
// half changed until the next one. The server keeps a copy as the window's background and paints it by itself
// as soon as the window, or a part of it, comes to be seen.
class SharedPicture {
 public:
    // Nothing when the server cannot read the program's memory, as one on another machine, or shows other
    // pixels than a Surface's.
    static std::unique_ptr<SharedPicture> of(const X11Window& window, Size size);
    ~SharedPicture();
    SharedPicture(const SharedPicture&) = delete;
    SharedPicture& operator=(const SharedPicture&) = delete;

    Size size() const;
    // The magnifier makes pictures of the size that was given.
    void show(const Surface& picture, Magnifier& magnifier);

 private:
    struct Segment;
    explicit SharedPicture(std::unique_ptr<Segment> segment);

    std::unique_ptr<Segment> segment_;
};

}  // namespace quabble
