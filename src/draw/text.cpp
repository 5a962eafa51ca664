#include "draw/text.hpp"

#include <utility>

#include "draw/glyphs.hpp"

namespace quabble {
namespace {

// Mixes a colour into a pixel, `coverage` 0 (not at all) to 255 (wholly).
std::uint32_t blend(std::uint32_t pixel, Colour colour, std::uint32_t coverage) {
    const auto mix = [coverage](std::uint32_t below, std::uint32_t above) {
        return static_cast<std::uint8_t>((below * (255 - coverage) + above * coverage + 127) / 255);
    };
    const Colour held = colourOf(pixel);
    return pixelOf({mix(held.red, colour.red), mix(held.green, colour.green), mix(held.blue, colour.blue)});
}

void paintGlyph(Surface& surface, const Rect& clip, const Glyph& glyph, Point origin, Colour colour) {
    const Rect place = Rect::ofSize(origin.x + glyph.left, origin.y + glyph.top, glyph.width, glyph.height);
    const Rect visible = place.intersection(clip);
    for (std::int32_t y = visible.top; y < visible.bottom; ++y) {
        const auto line = surface.row(y);
        for (std::int32_t x = visible.left; x < visible.right; ++x) {
            std::uint32_t& pixel = line[static_cast<std::size_t>(x)];
            pixel = blend(pixel, colour, glyph.coverageAt(x - place.left, y - place.top));
        }
    }
}

// The clip is in device pixels, the place in the program's.
void paintLine(Surface& surface, Scale scale, const Rect& clip, std::string_view text, double left,
               std::int32_t top, Colour colour, const Font& font) {
    const ScaledFont& layout = scaledFont(font.face, font.points);
    ScaledFont& glyphs = scaledFont(font.face, font.points * scale.factor());
    const std::int32_t baseline = top + layout.ascent();
    // No glyph reaches further from its pen than this; of a long line most lie far outside.
    const std::int32_t reach = 2 * glyphs.lineHeight();
    double pen = left;
    for (const char character : text) {
        const double place = pen * scale.factor();
        if (place > clip.left - reach && place < clip.right + reach) {
            paintGlyph(surface, clip, glyphs.glyph(character, place),
                       {ScaledFont::wholePixel(place), scale.edge(baseline)}, colour);
        }
        pen += layout.advance(character);
    }
    if (font.underlined) {
        const std::int32_t lineTop = scale.edge(baseline + 2);
        const Rect line{scale.edge(ScaledFont::wholePixel(left)), lineTop,
                        scale.edge(ScaledFont::wholePixel(pen)), lineTop + scale.line()};
        surface.fill(line.intersection(clip), colour);
    }
}

// The nearest whole pixel. A half always goes the same way, or some shadows would lie nearer to their text
// than others.
std::int32_t nearestPixel(double place) {
    return ScaledFont::wholePixel(place + 0.5);
}

double lineWidth(std::string_view text, const ScaledFont& font) {
    double width = 0;
    for (const char character : text)
        width += font.advance(character);
    return width;
}

// Splits the first line off a text; a line ends at a line feed, with or without a carriage return before it.
std::string_view takeLine(std::string_view& text) {
    const std::size_t end = text.find('\n');
    std::string_view line = text.substr(0, end);
    text = end == std::string_view::npos ? std::string_view{} : text.substr(end + 1);
    if (!line.empty() && line.back() == '\r')
        line.remove_suffix(1);
    return line;
}

}  // namespace

void drawText(Surface& surface, Scale scale, const Rect& area, std::string_view text, std::int32_t format,
              Colour colour, const Font& font) {
    const ScaledFont& layout = scaledFont(font.face, font.points);
    const Rect clip = scale.device(area).intersection(surface.bounds());
    const bool single = (format & text_format::singleLine) != 0;
    std::int32_t top = area.top;
    if (single && (format & text_format::verticalCentre) != 0)
        top += nearestPixel((area.height() - layout.lineHeight()) / 2.0);
    while (!text.empty()) {
        const std::string_view line = single ? std::exchange(text, {}) : takeLine(text);
        double left = area.left;
        if ((format & text_format::centre) != 0)
            left += (area.width() - lineWidth(line, layout)) / 2;
        paintLine(surface, scale, clip, line, left, top, colour, font);
        top += layout.lineHeight();
    }
}

double advanceOf(char character, const Font& font) {
    return scaledFont(font.face, font.points).advance(character);
}

Size measureText(std::string_view text, const Font& font) {
    ScaledFont& scaled = scaledFont(font.face, font.points);
    return {nearestPixel(lineWidth(text, scaled)), scaled.lineHeight()};
}

}  // namespace quabble
