#pragma once

#include <cstdint>
#include <string>
#include <utility>

#include "hosts/headless/headless_front_end.hpp"
#include "platform/message_loop.hpp"

namespace quabble {

// Someone at the machine: acts on the topmost window, waits, and looks. After every act the program has gone
// on as far as it could without time passing.
class ScriptedUser {
 public:
    ScriptedUser(HeadlessFrontEnd& frontEnd, MessageLoop& loop) : frontEnd_(frontEnd), loop_(loop) {}

    void click(float x, float y) { drag(x, y, x, y); }
    void doubleClick(float x, float y);
    // Presses the mouse button at one place and lets go of it at another.
    void drag(float fromX, float fromY, float toX, float toY);
    void movePointer(float x, float y) { act(EventKind::MouseMove, x, y); }
    void press(std::int16_t key);
    void type(const std::string& utf8);  // ignored where no text is asked for
    void edit(EditCommand command, bool extends = false);
    void clickCloseButton() { act(EventKind::CloseButton); }
    void minimise() { frontEnd_.minimiseWindow(topWindow()), loop_.wake(); }
    void restore() { frontEnd_.restoreWindow(topWindow()), loop_.wake(); }

    // Lets time pass; everything that falls due meanwhile happens at its own moment.
    void wait(milliseconds duration);

    // The window that was opened last; there must be one.
    WindowId topWindow() const { return topmost().first; }
    const HeadlessFrontEnd::Shown& top() const { return topmost().second; }
    Colour pixel(std::int32_t x, std::int32_t y) const { return top().picture.at(x, y); }

 private:
    const std::pair<const WindowId, HeadlessFrontEnd::Shown>& topmost() const;
    void act(EventKind kind, float x = 0, float y = 0);

    HeadlessFrontEnd& frontEnd_;
    MessageLoop& loop_;
};

}  // namespace quabble
