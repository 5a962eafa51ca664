#pragma once

#include <bitset>
#include <cstdint>
#include <optional>
#include <vector>

#include "platform/input_event.hpp"

namespace quabble {

// What the system's messages of one window's keys mean. A key that was pressed before the window had the
// keyboard is not meant for it, however long it is held.
class Keyboard {
 public:
    // The window gets the keyboard.
    void begin() { pressed_.reset(); }

    // WM_KEYDOWN: a key, by its number, and what else the message says of it.
    std::optional<InputEvent> press(std::uintptr_t key, std::intptr_t details);

    // WM_CHAR, which follows it when the key yields a character: a unit of UTF-16. With the second one of a
    // pair comes the text of both.
    std::vector<InputEvent> character(std::uintptr_t unit, std::intptr_t details);

 private:
    static std::size_t scanCodeOf(std::intptr_t details);
    static bool isRepeated(std::intptr_t details);

    std::bitset<512> pressed_;  // since the window has the keyboard, by their scan codes
    wchar_t firstOfPair_ = 0;
};

}  // namespace quabble
