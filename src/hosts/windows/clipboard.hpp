#pragma once

#include <string>

struct HWND__;

namespace quabble {

// The text on the system's clipboard, which all programs share, in UTF-8; for the window that asks.
std::string clipboardTextFor(HWND__* window);
void putOnClipboard(HWND__* window, const std::string& text);

}  // namespace quabble
