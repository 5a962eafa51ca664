#include "platform/headless/scripted_user.hpp"

namespace quabble {

void ScriptedUser::press(std::int16_t key) {
    loop_.post({topWindow(), EventKind::KeyPress, 0, 0, key});
    loop_.wake();
}

void ScriptedUser::wait(milliseconds duration) {
    const TimePoint end = frontEnd_.now() + duration;
    for (auto due = loop_.nextDeadline(); due && *due <= end; due = loop_.nextDeadline()) {
        frontEnd_.advanceTo(*due);
        loop_.wake();
    }
    frontEnd_.advanceTo(end);
    loop_.wake();
}

void ScriptedUser::act(EventKind kind, float x, float y) {
    loop_.post({topWindow(), kind, x, y});
    loop_.wake();
}

}  // namespace quabble
