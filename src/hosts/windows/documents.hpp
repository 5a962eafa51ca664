#pragma once

#include <string>

namespace quabble {

// Opens a file or a web address with whatever the user has for it. That it fails is not reported.
void openByShell(const std::wstring& target);

}  // namespace quabble
