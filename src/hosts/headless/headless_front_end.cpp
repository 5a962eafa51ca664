#include "hosts/headless/headless_front_end.hpp"

namespace quabble {

Scale HeadlessFrontEnd::createWindow(WindowId window, const NativeWindow& traits) {
    windows_[window] = {.traits = traits, .picture = {}};
    return scale;
}

void HeadlessFrontEnd::rescale(Scale wanted) {
    scale = wanted;
    for (const auto& [window, shown] : windows_)
        post_({.window = window, .kind = EventKind::Rescaled, .scale = wanted});
}

void HeadlessFrontEnd::showPixels(WindowId window, const Surface& picture) {
    Shown& shown = windows_.at(window);
    shown.picture = picture;
    ++shown.timesShown;
}

void HeadlessFrontEnd::minimiseWindow(WindowId window) {
    windows_.at(window).minimised = true;
    post_({.window = window, .kind = EventKind::Minimised});
}

void HeadlessFrontEnd::restoreWindow(WindowId window) {
    windows_.at(window).minimised = false;
    post_({.window = window, .kind = EventKind::Restored});
}

std::vector<std::byte> HeadlessFrontEnd::programFile(std::string_view name) {
    const auto file = files_.find(name);
    return file == files_.end() ? std::vector<std::byte>() : file->second;
}

}  // namespace quabble
