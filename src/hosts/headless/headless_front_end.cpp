#include "hosts/headless/headless_front_end.hpp"

namespace quabble {

void HeadlessFrontEnd::createWindow(WindowId window, const NativeWindow& traits) {
    windows_[window] = {traits, Surface(traits.clientSize.width, traits.clientSize.height)};
}

void HeadlessFrontEnd::showPixels(WindowId window, const Surface& picture) {
    const auto shown = windows_.find(window);
    if (shown == windows_.end())
        return;
    shown->second.picture = picture;
    ++shown->second.timesShown;
}

void HeadlessFrontEnd::closeWindow(WindowId window) {
    windows_.erase(window);
}

void HeadlessFrontEnd::minimiseWindow(WindowId window) {
    windows_.at(window).minimised = true;
    loop_->post({.window = window, .kind = EventKind::Minimised});
}

void HeadlessFrontEnd::setTextInput(WindowId window, std::optional<Rect> area) {
    if (const auto shown = windows_.find(window); shown != windows_.end())
        shown->second.takesText = area.has_value();
}

void HeadlessFrontEnd::restoreWindow(WindowId window) {
    windows_.at(window).minimised = false;
    loop_->post({.window = window, .kind = EventKind::Restored});
}

}  // namespace quabble
