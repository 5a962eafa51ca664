#pragma once

#include <string>
#include <string_view>

namespace quabble {

// The Unicode code point of a Windows-1252 character; U+FFFD for the five values that stand for none.
char32_t codePointOf(char character);

std::string utf8Of(std::string_view windows1252);

// Turns text that comes from outside into Windows-1252. What the code page lacks, malformed UTF-8 included,
// becomes "?"; control characters, line ends among them, are left out.
std::string windows1252Of(std::string_view utf8);

}  // namespace quabble
