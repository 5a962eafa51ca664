#pragma once

#include <cstdint>

namespace quabble {

// The Unicode code point of a Windows-1252 character; U+FFFD for the five values that stand for none.
char32_t codePointOf(char character);

}  // namespace quabble
