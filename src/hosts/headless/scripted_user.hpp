#pragma once

#include <cassert>
#include <cstdint>
#include <string>
#include <utility>

#include "hosts/headless/headless_front_end.hpp"

namespace quabble {

// Someone at the machine: acts on the topmost window, waits, and looks. After every act the program has gone
// on as far as it could without time passing. The program is a Program, or a MessageLoop with windows on it.
template <typename Program>
class ScriptedUser {
 public:
    ScriptedUser(HeadlessFrontEnd& frontEnd, Program& program) : frontEnd_(frontEnd), program_(program) {
        frontEnd.connect([&program](const InputEvent& event) { program.post(event); });
    }

    void click(float x, float y) { drag(x, y, x, y); }

    void doubleClick(float x, float y) {
        click(x, y);
        act({.kind = EventKind::MouseDown, .x = x, .y = y, .continuesClick = true});
        act({.kind = EventKind::MouseUp, .x = x, .y = y});
    }

    // Presses the mouse button at one place and lets go of it at another.
    void drag(float fromX, float fromY, float toX, float toY) {
        const WindowId window = topWindow();
        const auto follow = [&](EventKind kind) {
            if (!frontEnd_.windows().empty() && topWindow() == window)
                act({.kind = kind, .x = toX, .y = toY});
        };
        act({.kind = EventKind::MouseDown, .x = fromX, .y = fromY});
        if (fromX != toX || fromY != toY)
            follow(EventKind::MouseMove);
        follow(EventKind::MouseUp);
    }

    void movePointer(float x, float y) { act({.kind = EventKind::MouseMove, .x = x, .y = y}); }
    void press(std::int16_t key) { act({.kind = EventKind::KeyPress, .key = key}); }
    // Ignored where no text is asked for.
    void type(const std::string& utf8) {
        if (top().takesText)
            act({.kind = EventKind::TextInput, .text = utf8});
    }
    void edit(EditCommand command, bool extends = false) {
        act({.kind = EventKind::Edit, .command = command, .extends = extends});
    }
    void clickCloseButton() { act({.kind = EventKind::CloseButton}); }
    void minimise() { frontEnd_.minimiseWindow(topWindow()), program_.wake(); }
    void restore() { frontEnd_.restoreWindow(topWindow()), program_.wake(); }

    // Lets time pass; everything that falls due meanwhile happens at its own moment.
    void wait(Clock::duration duration) {
        const TimePoint end = frontEnd_.now() + duration;
        for (auto due = program_.nextDeadline(); due && *due <= end; due = program_.nextDeadline()) {
            frontEnd_.advanceTo(*due);
            program_.wake();
        }
        frontEnd_.advanceTo(end);
        program_.wake();
    }

    // The window that was opened last; there must be one.
    WindowId topWindow() const { return topmost().first; }
    const HeadlessFrontEnd::Shown& top() const { return topmost().second; }
    Colour pixel(std::int32_t x, std::int32_t y) const { return top().picture.at(x, y); }

 private:
    const std::pair<const WindowId, HeadlessFrontEnd::Shown>& topmost() const {
        assert(!frontEnd_.windows().empty());
        return *frontEnd_.windows().rbegin();
    }
    void act(InputEvent event) {
        event.window = topWindow();
        program_.post(event);
        program_.wake();
    }

    HeadlessFrontEnd& frontEnd_;
    Program& program_;
};

}  // namespace quabble
