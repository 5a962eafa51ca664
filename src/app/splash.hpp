#pragma once

#include <cstdint>

#include "gfx/screen_button.hpp"
#include "platform/timer.hpp"
#include "platform/window.hpp"

namespace quabble {

class AppState;

// The first window of a run: the backdrop with a link to the maker's page. It closes by itself after two
// ticks of a second.
class Splash final : public Window {
 public:
    explicit Splash(AppState& app);

 private:
    void Form_Load() override;
    bool isClickable(float x, float y) const override { return hitTest(taglineBox_, x, y); }
    Task<> Form_MouseDown(float x, float y) override;
    Task<> splashTimer_Timer();

    AppState& app_;
    Timer splashTimer_;
    ScreenButton taglineBox_;
    std::int16_t ticksLeft_ = 0;
};

}  // namespace quabble
