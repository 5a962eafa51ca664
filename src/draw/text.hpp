#pragma once

#include <cstdint>
#include <string_view>

#include "draw/scale.hpp"
#include "draw/surface.hpp"

namespace quabble {

// The typefaces compiled into the program, metric twins of the usual named ones.
enum class Typeface { Sans, SansBold, SansNarrowBold, SerifBold };

struct Font {
    Typeface face = Typeface::Sans;
    double points = 10;  // at 96 dots per inch: 14 points are 18 2/3 pixels
    bool underlined = false;
    friend bool operator==(const Font&, const Font&) = default;
};

// How a text lies in its rectangle; the values may be added up.
namespace text_format {
constexpr std::int32_t topLeft = 0;
constexpr std::int32_t centre = 1;
constexpr std::int32_t verticalCentre = 4;  // only together with singleLine
constexpr std::int32_t singleLine = 32;
}  // namespace text_format

// Writes a Windows-1252 text into a rectangle, to which it is clipped; only the glyphs are painted. Without
// the single-line flag a line ends at each line feed (a carriage return before it belongs to it) and the
// first one starts at the rectangle's top. A line is centred to a quarter of a pixel, so that the two copies
// of a text with a shadow lie equally far apart whatever its length; up and down it stays on whole pixels,
// where it is sharp. The glyphs are smoothed and kept for the next time.
//
// The area is in the program's pixels, and so is the layout: at every scale each line and each letter begins
// where it does at scale 1, but for less than a device pixel.
void drawText(Surface& surface, Scale scale, const Rect& area, std::string_view text, std::int32_t format,
              Colour colour, const Font& font);

// How far a character moves the pen, in pixels.
double advanceOf(char character, const Font& font);

// The width and the height of one line of text, in pixels.
Size measureText(std::string_view text, const Font& font);

}  // namespace quabble
