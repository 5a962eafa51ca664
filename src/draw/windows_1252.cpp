#include "draw/windows_1252.hpp"

#include <algorithm>
#include <array>
#include <cstdint>
#include <optional>

namespace quabble {
namespace {

// 0x80 to 0x9F, where the code page differs from Latin-1.
constexpr std::array<char32_t, 32> upperControls{
    0x20AC, 0xFFFD, 0x201A, 0x0192, 0x201E, 0x2026, 0x2020, 0x2021, 0x02C6, 0x2030, 0x0160,
    0x2039, 0x0152, 0xFFFD, 0x017D, 0xFFFD, 0xFFFD, 0x2018, 0x2019, 0x201C, 0x201D, 0x2022,
    0x2013, 0x2014, 0x02DC, 0x2122, 0x0161, 0x203A, 0x0153, 0xFFFD, 0x017E, 0x0178};

// The first code point of a text and how many bytes it takes; nothing when the bytes are no UTF-8.
struct Decoded {
    char32_t codePoint = 0;
    std::size_t length = 0;
};

std::optional<Decoded> decodeFirst(std::string_view utf8) {
    const auto byte = [&](std::size_t i) { return static_cast<unsigned char>(utf8[i]); };
    constexpr std::array<char32_t, 5> smallest{0, 0, 0x80, 0x800, 0x10000};
    const std::size_t length = byte(0) < 0x80    ? 1
                               : byte(0) >= 0xF0 ? 4
                               : byte(0) >= 0xE0 ? 3
                               : byte(0) >= 0xC0 ? 2
                                                 : 0;
    if (length == 0 || length > utf8.size())
        return std::nullopt;
    char32_t codePoint = length == 1 ? byte(0) : byte(0) & (0x7FU >> length);
    for (std::size_t i = 1; i < length; ++i) {
        if ((byte(i) & 0xC0U) != 0x80U)
            return std::nullopt;
        codePoint = codePoint << 6 | (byte(i) & 0x3FU);
    }
    if (codePoint < smallest[length])
        return std::nullopt;
    return Decoded{codePoint, length};
}

void appendUtf8(std::string& text, char32_t codePoint) {
    const auto add = [&](char32_t byte) { text += static_cast<char>(byte); };
    if (codePoint < 0x80) {
        add(codePoint);
    } else if (codePoint < 0x800) {
        add(0xC0 | codePoint >> 6);
        add(0x80 | (codePoint & 0x3F));
    } else {
        add(0xE0 | codePoint >> 12);
        add(0x80 | (codePoint >> 6 & 0x3F));
        add(0x80 | (codePoint & 0x3F));
    }
}

char characterOf(char32_t codePoint) {
    if (codePoint < 0x80 || (codePoint >= 0xA0 && codePoint <= 0xFF))
        return static_cast<char>(codePoint);
    const auto found = std::ranges::find(upperControls, codePoint);
    if (codePoint == 0xFFFD || found == upperControls.end())
        return '?';
    return static_cast<char>(0x80 + (found - upperControls.begin()));
}

bool isControl(char32_t codePoint) {
    return codePoint < 0x20 || (codePoint >= 0x7F && codePoint < 0xA0);
}

}  // namespace

char32_t codePointOf(char character) {
    const auto value = static_cast<unsigned char>(character);
    if (value >= 0x80 && value < 0xA0)
        return upperControls[value - 0x80U];
    return value;
}

std::string utf8Of(std::string_view windows1252) {
    std::string utf8;
    for (const char character : windows1252)
        appendUtf8(utf8, codePointOf(character));
    return utf8;
}

std::string windows1252Of(std::string_view utf8) {
    std::string text;
    while (!utf8.empty()) {
        const auto first = decodeFirst(utf8);
        if (!first)
            text += '?';
        else if (!isControl(first->codePoint))
            text += characterOf(first->codePoint);
        utf8.remove_prefix(first ? first->length : 1);
    }
    return text;
}

}  // namespace quabble
