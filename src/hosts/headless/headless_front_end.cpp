#include "hosts/headless/headless_front_end.hpp"

#include <cassert>
#include <utility>

namespace quabble {

Scale HeadlessFrontEnd::createWindow(WindowId window, const NativeWindow& traits) {
    assert(window > latest_);
    latest_ = window;
    windows_[window] = {.traits = traits, .picture = {}};
    return scale;
}

void HeadlessFrontEnd::rescale(Scale wanted) {
    earlierScale_ = std::exchange(scale, wanted);
    for (const auto& [window, shown] : windows_)
        post_({.window = window, .kind = EventKind::Rescaled, .scale = wanted});
}

void HeadlessFrontEnd::showPixels(WindowId window, const Surface& picture) {
    Shown& shown = windows_.at(window);
    [[maybe_unused]] const auto isAt = [&](int quarters) {
        const Size size = Scale::ofQuarters(quarters).device(shown.traits.clientSize);
        return size == Size{picture.width(), picture.height()};
    };
    assert(isAt(4) || isAt(scale.quarters()) || isAt(earlierScale_.quarters()));
    shown.picture = picture;
    ++shown.timesShown;
}

void HeadlessFrontEnd::closeWindow(WindowId window) {
    assert(windows_.contains(window));
    windows_.erase(window);
}

void HeadlessFrontEnd::minimiseWindow(WindowId window) {
    windows_.at(window).minimised = true;
    post_({.window = window, .kind = EventKind::Minimised});
}

void HeadlessFrontEnd::restoreWindow(WindowId window) {
    windows_.at(window).minimised = false;
    post_({.window = window, .kind = EventKind::Restored});
}

FileBytes HeadlessFrontEnd::programFile(std::string_view name) {
    const auto file = files_.find(name);
    return file == files_.end() ? FileBytes() : FileBytes(file->second.begin(), file->second.end());
}

}  // namespace quabble
