#pragma once

#include <string>
#include <string_view>

namespace quabble {

// Between UTF-8, which the program speaks, and the system's UTF-16. What is malformed becomes U+FFFD.
std::wstring wideOf(std::string_view utf8);
std::string utf8Of(std::wstring_view utf16);

}  // namespace quabble
