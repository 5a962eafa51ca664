#include "platform/sdl/held_keys.hpp"

namespace quabble {
namespace {

// Longer than any usual wait before a key that is held down begins to repeat.
constexpr std::uint32_t longestSilence = 700;  // milliseconds

}  // namespace

bool HeldKeys::isMeantFor(std::uint32_t window, std::int32_t key, std::uint32_t time) {
    ignored_ = key == key_ && window_ != 0 && window_ != window && time - lastHeard_ < longestSilence;
    if (!ignored_)
        window_ = window;
    key_ = key;
    lastHeard_ = time;
    return !ignored_;
}

// When a window loses the focus all its keys are reported as let go, though they may be down. Only the
// release of a key that was ignored is a real one.
void HeldKeys::release(std::int32_t key) {
    if (ignored_ && key == key_)
        window_ = 0;
}

}  // namespace quabble
