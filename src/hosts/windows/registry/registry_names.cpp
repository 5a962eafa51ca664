#include "hosts/windows/registry/registry_names.hpp"

#include <algorithm>
#include <array>

#include "draw/windows_1252.hpp"

namespace quabble {
namespace {

wchar_t wideOf(char character) {
    const char32_t codePoint = codePointOf(character);
    return codePoint == 0xFFFD ? static_cast<unsigned char>(character) : static_cast<wchar_t>(codePoint);
}

char characterOf(wchar_t wide) {
    static const auto table = [] {
        std::array<wchar_t, 256> all{};
        for (std::size_t i = 0; i < all.size(); ++i)
            all[i] = wideOf(static_cast<char>(i));
        return all;
    }();
    const auto found = std::ranges::find(table, wide);
    return found == table.end() ? '?' : static_cast<char>(found - table.begin());
}

wchar_t lowerCase(wchar_t character) {
    return character >= L'A' && character <= L'Z' ? static_cast<wchar_t>(character - L'A' + L'a') : character;
}

}  // namespace

std::wstring registryNameOf(std::string_view windows1252) {
    std::wstring name;
    for (const char character : windows1252)
        name += wideOf(character);
    return name;
}

std::vector<std::byte> registryTextOf(std::span<const std::byte> windows1252) {
    std::vector<std::byte> text;
    for (const std::byte byte : windows1252) {
        const wchar_t wide = wideOf(static_cast<char>(byte));
        text.push_back(static_cast<std::byte>(wide));
        text.push_back(static_cast<std::byte>(wide >> 8));
    }
    return text;
}

std::vector<std::byte> bytesOfRegistryText(std::span<const std::byte> utf16) {
    std::vector<std::byte> bytes;
    for (std::size_t i = 0; i + 1 < utf16.size(); i += 2) {
        const auto wide = std::to_integer<unsigned>(utf16[i]) | std::to_integer<unsigned>(utf16[i + 1]) << 8;
        bytes.push_back(static_cast<std::byte>(characterOf(static_cast<wchar_t>(wide))));
    }
    return bytes;
}

bool WithoutCase::operator()(std::wstring_view left, std::wstring_view right) const {
    return std::ranges::lexicographical_compare(left, right, {}, lowerCase, lowerCase);
}

}  // namespace quabble
