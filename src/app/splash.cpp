#include "app/splash.hpp"

#include <string>

#include "app/app_state.hpp"
#include "gfx/painters.hpp"
#include "gfx/string_table.hpp"

namespace quabble {
namespace {

using namespace std::chrono_literals;

constexpr Size splashSize{680, 450};
constexpr Colour taglineColour{200, 200, 250};

}  // namespace

Splash::Splash(AppState& app)
    : Window(app.loop), app_(app), splashTimer_(app.loop, [this] { return splashTimer_Timer(); }) {}

void Splash::Form_Load() {
    setCaption(std::string(applicationTitle));
    setBorderless();
    setClientSize(splashSize);
    const ScreenButton background{
        .surface = &canvas(), .width = splashSize.width, .height = splashSize.height};
    copyPicture(background, app_.pictures.backdrop);
    taglineBox_ = {.surface = &canvas(),
                   .left = 350,
                   .top = 400,
                   .width = 200,
                   .height = 40,
                   .textColour = taglineColour};
    splashTimer_.setInterval(1000ms);
    splashTimer_.setEnabled(true);
    canvas().font = {Typeface::SansBold, 9, true};
    drawShadowText(taglineBox_, 2, loadString(string_ids::tagline), defaultTextFormat);
    canvas().font.underlined = false;
    ticksLeft_ = 2;
}

Task<> Splash::splashTimer_Timer() {
    if (--ticksLeft_ < 1) {
        splashTimer_.setEnabled(false);
        unload();
    }
    co_return;
}

Task<> Splash::Form_MouseDown(float x, float y) {
    if (hitTest(taglineBox_, x, y))
        app_.openDocument(std::string(loadString(string_ids::webAddress)));
    co_return;
}

}  // namespace quabble
