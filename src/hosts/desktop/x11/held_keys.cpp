#include "hosts/desktop/x11/held_keys.hpp"

#include <utility>

namespace quabble {

void HeldKeys::changeWindow() {
    held_.reset();
    isMeant_ = true;
    isAsked_ = true;
}

void HeldKeys::areDown(const Keys& keys) {
    if (!std::exchange(isAsked_, false))
        return;
    held_ = keys;
    isMeant_ = held_.none();
}

void HeldKeys::press(unsigned key) {
    isMeant_ = !held_.test(key);
}

void HeldKeys::release(unsigned key) {
    held_.reset(key);
    isMeant_ = held_.none();
}

}  // namespace quabble
