#include "draw/glyphs.hpp"

#define STBTT_STATIC
#define STB_TRUETYPE_IMPLEMENTATION
#include <stb/stb_truetype.h>

#include <cassert>
#include <cmath>
#include <map>
#include <utility>

#include "base/round_half_even.hpp"
#include "draw/windows_1252.hpp"

// The font files, made part of the program.
extern "C" {
extern const unsigned char quabbleFontSans[];
extern const unsigned char quabbleFontSansBold[];
extern const unsigned char quabbleFontSansNarrowBold[];
extern const unsigned char quabbleFontSerifBold[];
}

namespace quabble {
namespace {

constexpr double pixelsPerPoint = 96.0 / 72.0;

const unsigned char* fontFile(Typeface face) {
    switch (face) {
        case Typeface::SansBold:
            return quabbleFontSansBold;
        case Typeface::SansNarrowBold:
            return quabbleFontSansNarrowBold;
        case Typeface::SerifBold:
            return quabbleFontSerifBold;
        case Typeface::Sans:
            break;
    }
    return quabbleFontSans;
}

}  // namespace

struct ScaledFont::Outlines {
    stbtt_fontinfo info{};
};

ScaledFont::ScaledFont(Typeface face, double points) : outlines_(std::make_unique<Outlines>()) {
    stbtt_fontinfo& info = outlines_->info;
    [[maybe_unused]] const int known = stbtt_InitFont(&info, fontFile(face), 0);
    assert(known != 0);
    scale_ = stbtt_ScaleForMappingEmToPixels(&info, static_cast<float>(points * pixelsPerPoint));
    int ascent = 0;
    int descent = 0;
    stbtt_GetFontVMetrics(&info, &ascent, &descent, nullptr);
    ascent_ = roundHalfEven(ascent * double{scale_});
    lineHeight_ = ascent_ + roundHalfEven(-descent * double{scale_});
    for (std::size_t i = 0; i < advances_.size(); ++i) {
        int advance = 0;
        const auto codePoint = static_cast<int>(codePointOf(static_cast<char>(i)));
        stbtt_GetCodepointHMetrics(&info, codePoint, &advance, nullptr);
        advances_[i] = advance * double{scale_};
    }
}

ScaledFont::~ScaledFont() = default;

std::int32_t ScaledFont::wholePixel(double pen) {
    return static_cast<std::int32_t>(std::floor(pen));
}

const Glyph& ScaledFont::glyph(char character, double pen) {
    const double fraction = pen - std::floor(pen);
    const auto phase = static_cast<std::size_t>(fraction * phases);
    const std::size_t key = index(character) * phases + phase;
    const auto kept = glyphs_.find(key);
    if (kept != glyphs_.end())
        return kept->second;
    return glyphs_.emplace(key, render(character, static_cast<double>(phase) / phases)).first->second;
}

Glyph ScaledFont::render(char character, double shift) const {
    const auto codePoint = static_cast<int>(codePointOf(character));
    const auto shiftX = static_cast<float>(shift);
    int left = 0;
    int top = 0;
    int right = 0;
    int bottom = 0;
    stbtt_GetCodepointBitmapBoxSubpixel(&outlines_->info, codePoint, scale_, scale_, shiftX, 0, &left, &top,
                                        &right, &bottom);
    Glyph glyph{left, top, right - left, bottom - top, {}};
    glyph.coverage.resize(static_cast<std::size_t>(glyph.width) * static_cast<std::size_t>(glyph.height));
    if (!glyph.coverage.empty()) {
        stbtt_MakeCodepointBitmapSubpixel(&outlines_->info, glyph.coverage.data(), glyph.width, glyph.height,
                                          glyph.width, scale_, scale_, shiftX, 0, codePoint);
    }
    return glyph;
}

ScaledFont& scaledFont(Typeface face, double points) {
    static std::map<std::pair<Typeface, double>, ScaledFont> fonts;
    return fonts.try_emplace({face, points}, face, points).first->second;
}

}  // namespace quabble
