#pragma once

#include <cstdint>

namespace quabble {

// Tells a key press that is meant for a window from the repetition of one that was meant for another: a key
// that is still down when a dialog opens or closes goes on repeating in the window that has the focus then.
// Only the key that was pressed last repeats.
class HeldKeys {
 public:
    // A press or a repetition, at a time in milliseconds. False when the window should not hear of it.
    bool isMeantFor(std::uint32_t window, std::int32_t key, std::uint32_t time);
    void release(std::int32_t key);

 private:
    std::int32_t key_ = 0;
    std::uint32_t window_ = 0;  // none when 0
    std::uint32_t lastHeard_ = 0;
    bool ignored_ = false;
};

}  // namespace quabble
