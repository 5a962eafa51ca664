#include "app/splash.hpp"

#include <string>

#include "gfx/painters.hpp"
#include "gfx/string_table.hpp"
#include "store/version.hpp"

namespace quabble {
namespace {

using namespace std::chrono_literals;

constexpr Size splashSize{680, 450};
constexpr Colour taglineColour{200, 200, 250};

}  // namespace

Splash::Splash(MessageLoop& loop, Pictures& pictures)
    : Window(loop), pictures_(pictures), splashTimer_(loop, [this] { return splashTimer_Timer(); }) {}

void Splash::Form_Load() {
    setCaption(std::string(applicationTitle));
    setBorderless();
    showPlainFirst();
    setClientSize(splashSize);
    tagline_ = {.left = 350,
                .top = 400,
                .width = 200,
                .height = 40,
                .textColour = taglineColour,
                .font = {Typeface::SansBold, 9, true}};
    splashTimer_.setInterval(1000ms);
    splashTimer_.setEnabled(true);
    ticksLeft_ = 2;
}

void Splash::Form_Paint() {
    canvas().take(pictures_.backdrop(canvas().scale()));
    drawShadowText(canvas(), tagline_, 2, loadString(string_ids::tagline), defaultTextFormat);
}

std::vector<Place> Splash::places() const {
    return {{tagline_.rect().shrunkBy(-6), Place::Role::Link, std::string(loadString(string_ids::tagline))}};
}

// The first tick is a good time to make ready what the games are drawn with.
Task<> Splash::splashTimer_Timer() {
    pictures_.sprites(canvas().scale());
    if (--ticksLeft_ < 1) {
        splashTimer_.setEnabled(false);
        unload();
    }
    co_return;
}

Task<> Splash::Form_MouseDown(float x, float y) {
    if (hitTest(tagline_, x, y))
        loop().frontEnd().openDocument(loadString(string_ids::webAddress));
    co_return;
}

}  // namespace quabble
