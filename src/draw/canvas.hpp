#pragma once

#include <string_view>

#include "draw/surface.hpp"
#include "draw/text.hpp"

namespace quabble {

// What a window, or a part of one, is drawn on. Everything is clipped to it.
class Canvas {
 public:
    Canvas() = default;
    explicit Canvas(Size size) : picture_(size.width, size.height) {}  // black

    const Surface& picture() const { return picture_; }
    Rect bounds() const { return picture_.bounds(); }

    void fill(const Rect& area, Colour colour) { picture_.fill(area, colour); }
    void outline(const Rect& area, Colour colour) { picture_.outline(area, colour); }

    // Copies a picture's pixels from `from` on into the area; `andCopy` combines them with what is there by a
    // bitwise AND.
    void copy(const Rect& area, const Surface& picture, Point from) { picture_.copy(area, picture, from); }
    void andCopy(const Rect& area, const Surface& picture, Point from) {
        picture_.andCopy(area, picture, from);
    }

    // Writes a text as drawText does.
    void write(const Rect& area, std::string_view text, std::int32_t format, const Font& font,
               Colour colour) {
        drawText(picture_, area, text, format, colour, font);
    }

 private:
    Surface picture_;
};

}  // namespace quabble
