#pragma once

#include <chrono>
#include <functional>
#include <string>

#include "draw/scale.hpp"
#include "draw/surface.hpp"

struct _XDisplay;

namespace quabble {

using WindowOnScreen = unsigned long;  // the X server's number of it, 0 for none

// A person at the desktop: sees the screen and moves a real pointer and real keys.
class Desktop {
 public:
    Desktop();
    ~Desktop();
    Desktop(const Desktop&) = delete;
    Desktop& operator=(const Desktop&) = delete;

    // The window with this caption; fails the run when none comes within ten seconds.
    WindowOnScreen waitForWindow(const std::string& caption);
    bool hasWindow(const std::string& caption) { return find(root_, caption) != 0; }

    bool isVisible(WindowOnScreen window);

    // That the programs find when they start: 96 dots per inch are 1.
    void setScale(Scale scale);
    Scale scale() const { return scale_; }

    void click(WindowOnScreen window, int x, int y, int times = 1);  // in the program's pixels
    void clickCloseButton(WindowOnScreen window);
    // As at the beginning of a drop, of a kind of thing that has no name.
    void offerUnknownDrop(WindowOnScreen window);
    void press(unsigned long keysym, std::chrono::milliseconds howLong = {});
    void pressWith(unsigned long modifier, unsigned long keysym);

    void minimise(WindowOnScreen window);
    // As a task bar does; comes back when the window is seen.
    void restore(WindowOnScreen window);
    void destroy(WindowOnScreen window);
    void showWorkspace(int number);  // counted from 0

    void type(const std::string& lowerCaseLetters);
    void waitForFocus(WindowOnScreen window);

    // What is seen of a window's client area, in the screen's pixels.
    Surface look(WindowOnScreen window);

 private:
    WindowOnScreen find(WindowOnScreen below, const std::string& caption);
    void clickAt(WindowOnScreen window, Point place, int times);  // in the screen's pixels
    void setKey(unsigned long keysym, bool isDown);
    void askWindowManager(WindowOnScreen window, const char* what, long first);

    _XDisplay* display_;
    WindowOnScreen root_;
    Scale scale_;
};

// Asks again and again until the answer is yes; fails the run when it is not within ten seconds.
void waitUntil(const std::string& what, const std::function<bool()>& isSo);

void require(bool condition, const std::string& what);

}  // namespace quabble
