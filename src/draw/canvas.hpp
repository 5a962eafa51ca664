#pragma once

#include <string_view>
#include <utility>

#include "draw/scale.hpp"
#include "draw/surface.hpp"
#include "draw/text.hpp"

namespace quabble {

// What a window, or a part of one, is drawn on, in the program's pixels, whatever the scale of the picture
// that comes of it. Everything is clipped to the canvas.
class Canvas {
 public:
    Canvas() = default;
    Canvas(Size size, Scale scale)  // black
        : size_(size), scale_(scale), picture_(scale.device(size).width, scale.device(size).height) {}

    Scale scale() const { return scale_; }
    Rect bounds() const { return Rect::ofSize(0, 0, size_.width, size_.height); }
    const Surface& picture() const { return picture_; }  // in device pixels

    void fill(const Rect& area, Colour colour) { picture_.fill(scale_.device(area), colour); }

    // Takes a picture over that was made for the scale and covers all of the canvas.
    void take(Surface&& picture) {
        if (picture.bounds() == picture_.bounds())
            picture_ = std::move(picture);
        else
            copy(bounds(), picture);
    }

    // Draws a frame along the area's edge: a line thick, and so many lines inside the edge, or outside of it.
    void outline(const Rect& area, Colour colour, std::int32_t linesInside = 0);

    // Copies a picture that was made for the scale, in device pixels, into the area from its top left corner
    // on.
    void copy(const Rect& area, const Surface& picture) {
        picture_.copy(scale_.device(area), picture, {0, 0});
    }

    // Copies the part that lies in the area from the picture of a canvas of this size.
    void copyPart(const Rect& area, const Surface& picture) {
        const Rect part = scale_.device(area);
        picture_.copy(part, picture, {part.left, part.top});
    }

    // Copies the device rows from `first` up to `last` of such a picture into the same rows of the area.
    void copyRows(const Rect& area, const Surface& picture, std::int32_t first, std::int32_t last) {
        const Rect whole = scale_.device(area);
        picture_.copy({whole.left, whole.top + first, whole.right, whole.top + last}, picture, {0, first});
    }

    // Writes a text as drawText does.
    void write(const Rect& area, std::string_view text, std::int32_t format, const Font& font,
               Colour colour) {
        drawText(picture_, scale_, area, text, format, colour, font);
    }

 private:
    Size size_;
    Scale scale_;
    Surface picture_;
};

}  // namespace quabble
