#pragma once

#include <cstdint>

#include "gfx/pictures.hpp"
#include "gfx/screen_button.hpp"
#include "platform/timer.hpp"
#include "platform/window.hpp"

namespace quabble {

// The first window of a run: the backdrop with a link to the maker's page. It closes by itself after two
// ticks of a second.
class Splash final : public Window {
 public:
    // The loop and the pictures must outlive the splash.
    Splash(MessageLoop& loop, Pictures& pictures);

 private:
    void Form_Load() override;
    void Form_Paint() override;
    bool isClickable(float x, float y) const override { return hitTest(tagline_, x, y); }
    // The text stands at the area's upper edge.
    std::vector<Place> places() const override;
    Task<> Form_MouseDown(float x, float y) override;
    Task<> splashTimer_Timer();

    Pictures& pictures_;
    Timer splashTimer_;
    ScreenButton tagline_;
    std::int16_t ticksLeft_ = 0;
};

}  // namespace quabble
