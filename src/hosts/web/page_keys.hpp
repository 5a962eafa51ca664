#pragma once

#include <optional>
#include <string_view>

#include "platform/input_event.hpp"

namespace quabble {

// A key that went down, in the browser's words.
struct PageKey {
    std::string_view key;  // a character in UTF-8, or a name like "ArrowLeft"
    bool shift = false;
    bool ctrl = false;  // or the key that commands begin with on a Mac
    bool alt = false;
    bool altGraph = false;  // with which keys yield their third character, also reported as Ctrl and Alt
    bool isRepeated = false;
    bool editsText = false;  // the window has a text field
};

// What the key means for the program; nothing for keys that mean nothing to it, and for those that are the
// browser's: commands, and Tab outside a text field.
std::optional<InputEvent> translate(const PageKey& key);

}  // namespace quabble
