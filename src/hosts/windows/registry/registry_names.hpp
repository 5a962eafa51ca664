#pragma once

#include <cstddef>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace quabble {

// Names and texts as the Windows registry has them. Each character of the program's code page has one of its
// own there, the five that stand for nothing, too, so that every byte comes back as it was.
std::wstring registryNameOf(std::string_view windows1252);

// A text's UTF-16 and, back, its bytes; "?" for what the code page lacks.
std::vector<std::byte> registryTextOf(std::span<const std::byte> windows1252);
std::vector<std::byte> bytesOfRegistryText(std::span<const std::byte> utf16);

// Orders names without regard to the case of ASCII letters.
struct WithoutCase {
    bool operator()(std::wstring_view left, std::wstring_view right) const;
};

}  // namespace quabble
