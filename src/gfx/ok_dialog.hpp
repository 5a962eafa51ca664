#pragma once

#include <cstdint>
#include <string>

#include "gfx/screen_button.hpp"
#include "platform/window.hpp"

namespace quabble {

// A dialog that tells something: its OK button, Enter and Esc close it, and closing is its only result.
// Whoever derives from it lays text and button out and draws them when it loads.
class OkDialog : public Window {
 protected:
    using Window::Window;

    ScreenButton textBox_;
    std::string text_;  // Windows-1252
    ScreenButton okBox_;

 private:
    bool isClickable(float x, float y) const override { return hitTest(okBox_, x, y); }
    std::vector<Place> places() const override;
    Task<> Form_MouseDown(float x, float y) override;
    Task<> Form_MouseMove(float x, float y) override;
    Task<> Form_KeyPress(std::int16_t key) override;
};

}  // namespace quabble
