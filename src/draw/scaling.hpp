#pragma once

#include <cstddef>
#include <cstdint>
#include <vector>

#include "draw/geometry.hpp"
#include "draw/scale.hpp"
#include "draw/surface.hpp"

namespace quabble {

// How many pixels of the screen, across and down, one pixel of the program takes: 1 at 96 dots per inch and
// in proportion above, in steps of a quarter, but never less than 1 for the sake of the dots, nor so many
// that a picture of this size leaves the available one. Only to fit is it less than 1.
double scaleFor(double dotsPerInch, Size picture, Size available);

Size scaled(Size size, double scale);

// The picture's pixel that is seen at a pixel of the window that shows it, also beyond its edges.
Point pixelSeenAt(Point shown, Size window, Size picture);

// A picture that is drawn `factor` times as large as the program's pixels, at a scale of its own: each pixel
// is the mean of what it covers. Where its size is no whole number of device pixels it is the next larger
// one.
Surface reduced(const Surface& large, std::int32_t factor, Scale scale);

// A picture that is drawn in the program's pixels, as large as the scale asks for.
Surface magnified(const Surface& picture, Scale scale);

// Shows pictures of one size at another: each pixel is repeated the next whole number of times, and what that
// is too large is taken off by linear interpolation. So whole scales are exact, and others are as sharp as
// can be.
class Magnifier {
 public:
    Magnifier() = default;
    Magnifier(Size picture, Size shown);

    Size pictureSize() const { return picture_; }
    Size shownSize() const { return shown_; }

    // Writes the shown size's pixels, `stride` bytes from one row to the next, which must have room for them.
    void show(const Surface& picture, std::uint32_t* pixels, std::ptrdiff_t stride);

 private:
    // The pixels that one shown pixel is mixed from, along one axis; the weight is of the second, in 256ths.
    struct Mix {
        std::int32_t first = 0;
        std::int32_t second = 0;
        std::uint32_t weight = 0;
    };
    // One of the picture's rows at its shown width.
    struct Row {
        std::int32_t of = -1;
        std::vector<std::uint32_t> pixels;
    };
    static std::vector<Mix> mixes(std::int32_t from, std::int32_t to);
    const Row& widened(const Surface& picture, std::int32_t y);

    Size picture_;
    Size shown_;
    std::vector<Mix> columns_;
    std::vector<Mix> rows_;
    Row latest_[2];
};

}  // namespace quabble
