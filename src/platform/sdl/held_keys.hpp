#pragma once

#include <cstdint>
#include <map>

namespace quabble {

// Tells a key press that is meant for a window from the repetition of one that was meant for another: a key
// that is still down when a dialog opens or closes goes on repeating in the window that has the focus then.
class HeldKeys {
 public:
    // A press or a repetition, at a time in milliseconds. False when the window should not hear of it.
    bool isMeantFor(std::uint32_t window, std::int32_t key, std::uint32_t time);
    // The key was let go, or the desktop took the keyboard away.
    void release(std::int32_t key);

 private:
    struct Hold {
        std::uint32_t window = 0;
        std::uint32_t lastHeard = 0;
        bool ignored = false;
    };
    std::map<std::int32_t, Hold> holds_;
};

}  // namespace quabble
