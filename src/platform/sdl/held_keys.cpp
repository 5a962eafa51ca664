#include "platform/sdl/held_keys.hpp"

namespace quabble {
namespace {

// Longer than any usual wait before a key that is held down begins to repeat.
constexpr std::uint32_t longestSilence = 1000;  // milliseconds

}  // namespace

bool HeldKeys::isMeantFor(std::uint32_t window, std::int32_t key, std::uint32_t time) {
    Hold& hold = holds_[key];
    const bool isCarriedOver =
        hold.window != 0 && hold.window != window && time - hold.lastHeard < longestSilence;
    hold.lastHeard = time;
    hold.ignored = isCarriedOver;
    if (!isCarriedOver)
        hold.window = window;
    return !isCarriedOver;
}

// When a window loses the focus all its keys are reported as let go, though they may be down. Only the
// release of a key that was ignored is a real one.
void HeldKeys::release(std::int32_t key) {
    const auto hold = holds_.find(key);
    if (hold != holds_.end() && hold->second.ignored)
        holds_.erase(hold);
}

}  // namespace quabble
