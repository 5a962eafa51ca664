#include "hosts/headless/scripted_user.hpp"

#include <cassert>

namespace quabble {

void ScriptedUser::drag(float fromX, float fromY, float toX, float toY) {
    const WindowId window = topWindow();
    const auto follow = [&](EventKind kind) {
        if (!frontEnd_.windows().empty() && topWindow() == window)
            act(kind, toX, toY);
    };
    act(EventKind::MouseDown, fromX, fromY);
    if (fromX != toX || fromY != toY)
        follow(EventKind::MouseMove);
    follow(EventKind::MouseUp);
}

void ScriptedUser::doubleClick(float x, float y) {
    click(x, y);
    const InputEvent second{
        .window = topWindow(), .kind = EventKind::MouseDown, .x = x, .y = y, .continuesClick = true};
    loop_.post(second);
    loop_.wake();
    act(EventKind::MouseUp, x, y);
}

void ScriptedUser::press(std::int16_t key) {
    loop_.post({.window = topWindow(), .kind = EventKind::KeyPress, .key = key});
    loop_.wake();
}

void ScriptedUser::type(const std::string& utf8) {
    if (!top().takesText)
        return;
    loop_.post({.window = topWindow(), .kind = EventKind::TextInput, .text = utf8});
    loop_.wake();
}

void ScriptedUser::edit(EditCommand command, bool extends) {
    loop_.post({.window = topWindow(), .kind = EventKind::Edit, .command = command, .extends = extends});
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

const std::pair<const WindowId, HeadlessFrontEnd::Shown>& ScriptedUser::topmost() const {
    assert(!frontEnd_.windows().empty());
    return *frontEnd_.windows().rbegin();
}

void ScriptedUser::act(EventKind kind, float x, float y) {
    loop_.post({.window = topWindow(), .kind = kind, .x = x, .y = y});
    loop_.wake();
}

}  // namespace quabble
