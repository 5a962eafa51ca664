#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <memory>
#include <unordered_map>
#include <vector>

#include "draw/text.hpp"

namespace quabble {

// A rendered character: how much of each pixel it covers, relative to a point on the baseline.
struct Glyph {
    std::int32_t left = 0;
    std::int32_t top = 0;
    std::int32_t width = 0;
    std::int32_t height = 0;
    std::vector<std::uint8_t> coverage;

    std::uint8_t coverageAt(std::int32_t x, std::int32_t y) const {
        return coverage[static_cast<std::size_t>(std::ptrdiff_t{y} * width + x)];
    }
};

// A typeface at one size. Characters are Windows-1252; glyphs are rendered at first use, at quarters of a
// pixel, and kept.
class ScaledFont {
 public:
    ScaledFont(Typeface face, double points);
    ~ScaledFont();

    std::int32_t ascent() const { return ascent_; }
    std::int32_t lineHeight() const { return lineHeight_; }
    double advance(char character) const { return advances_[index(character)]; }

    // The glyph for a pen at the given place; paint it at wholePixel of that place.
    const Glyph& glyph(char character, double pen);
    static std::int32_t wholePixel(double pen);

 private:
    struct Outlines;
    static constexpr std::size_t phases = 4;
    static std::size_t index(char character) { return static_cast<unsigned char>(character); }
    Glyph render(char character, double shift) const;

    std::unique_ptr<Outlines> outlines_;
    float scale_ = 0;
    std::int32_t ascent_ = 0;
    std::int32_t lineHeight_ = 0;
    std::array<double, 256> advances_{};
    std::unordered_map<std::size_t, Glyph> glyphs_;  // by character and phase
};

// The font of a size, made at first use; it lives as long as the program.
ScaledFont& scaledFont(Typeface face, double points);

}  // namespace quabble
