#pragma once

#include <string>
#include <string_view>

namespace quabble {

constexpr std::string_view applicationTitle = "Quabble";
constexpr int majorVersion = 1;
constexpr int minorVersion = 0;

inline std::string versionText() {
    return std::to_string(majorVersion) + "." + std::to_string(minorVersion);
}

}  // namespace quabble
