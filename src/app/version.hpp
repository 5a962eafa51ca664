#pragma once

#include <string_view>

namespace quabble {

constexpr std::string_view applicationTitle = "Quabble";
constexpr int majorVersion = 1;
constexpr int minorVersion = 0;

}  // namespace quabble
