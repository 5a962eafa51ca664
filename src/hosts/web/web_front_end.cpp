#include "hosts/web/web_front_end.hpp"

#include <algorithm>
#include <chrono>
#include <cstdlib>

#include "draw/bitmap_file.hpp"
#include "draw/png_file.hpp"
#include "draw/scaling.hpp"
#include "hosts/web/page.hpp"

namespace quabble {
namespace {

FileBytes pageFile(std::string_view name) {
    FileBytes bytes(page::fileSize(name.data(), name.size()));
    page::take(bytes.data());
    return bytes;
}

}  // namespace

TimePoint WebFrontEnd::now() {
    const std::chrono::duration<double, std::milli> sinceOpened(page::now());
    return TimePoint(std::chrono::duration_cast<Clock::duration>(sinceOpened));
}

// --- Windows ---

Scale WebFrontEnd::wantedScale() const {
    return hasLargePictures_ ? Scale::nearest(factorOn(page_)) : Scale();
}

Scale WebFrontEnd::createWindow(WindowId window, const NativeWindow& traits) {
    page::createWindow(window, traits.owner, traits.borderless, traits.caption.data(), traits.caption.size());
    Shown& shown = windows_[window];
    shown.traits = traits;
    place(window, shown);
    if (isHidden_)
        setMinimised(window, true);
    return wantedScale();
}

void WebFrontEnd::place(WindowId window, Shown& shown) {
    const auto owner = windows_.find(shown.traits.owner);
    const Rect* around = owner == windows_.end() ? nullptr : &owner->second.place.frame;
    shown.place = placeOn(page_, shown.traits, factorOn(page_), around);
    const Rect& frame = shown.place.frame;
    const Rect& client = shown.place.client;
    page::placeWindow(window, frame.left, frame.top, frame.width(), frame.height(), client.left, client.top,
                      client.width(), client.height());
    placeTextField(window, shown);
}

void WebFrontEnd::showPixels(WindowId window, const Surface& picture) {
    page::showPixels(window, picture.width(), picture.height(), picture.row(0).data());
}

void WebFrontEnd::closeWindow(WindowId window) {
    windows_.erase(window);
    voice_.close(window);
    page::closeWindow(window);
}

// Owners come before their dialogs.
void WebFrontEnd::resize(const Page& page) {
    const Scale before = wantedScale();
    page_ = page;
    for (auto& [window, shown] : windows_)
        place(window, shown);
    if (wantedScale() == before)
        return;
    for (const auto& [window, shown] : windows_)
        post_({.window = window, .kind = EventKind::Rescaled, .scale = wantedScale()});
}

void WebFrontEnd::takeLargePictures() {
    hasLargePictures_ = true;
    for (const auto& [window, shown] : windows_)
        post_({.window = window, .kind = EventKind::Rescaled, .scale = wantedScale()});
}

void WebFrontEnd::minimiseWindow(WindowId window) {
    page::minimiseWindow(window);
    setMinimised(window, true);
}

void WebFrontEnd::setMinimised(WindowId window, bool isMinimised) {
    const auto found = windows_.find(window);
    if (found == windows_.end() || found->second.isMinimised == isMinimised)
        return;
    found->second.isMinimised = isMinimised;
    if (!isHidden_)
        post_({.window = window, .kind = isMinimised ? EventKind::Minimised : EventKind::Restored});
}

void WebFrontEnd::setHidden(bool isHidden) {
    if (isHidden == isHidden_)
        return;
    isHidden_ = isHidden;
    for (const auto& [window, shown] : windows_) {
        if (!shown.isMinimised && shown.traits.owner == WindowId::none)
            post_({.window = window, .kind = isHidden ? EventKind::Minimised : EventKind::Restored});
    }
}

// --- Input ---

InputEvent WebFrontEnd::mouseEvent(WindowId window, EventKind kind, Point at) const {
    InputEvent event{.window = window, .kind = kind};
    const auto found = windows_.find(window);
    if (found != windows_.end()) {
        const Rect& client = found->second.place.client;
        const Scale scale = Scale::nearest(factorOn(page_));
        const Size picture = scale.device(found->second.traits.clientSize);
        const Point place = scale.pixelAt(pixelSeenAt(at, {client.width(), client.height()}, picture));
        event.x = static_cast<float>(place.x);
        event.y = static_cast<float>(place.y);
    }
    return event;
}

void WebFrontEnd::pressMouse(WindowId window, Point at, bool shift) {
    using namespace std::chrono_literals;
    constexpr auto doubleClickTime = 500ms;
    constexpr double doubleClickDistance = 4;  // of the page's pixels
    const Press press{window, at, now()};
    const auto isNear = [this](std::int32_t one, std::int32_t other) {
        return std::abs(one - other) <= doubleClickDistance * page_.ratio;
    };
    InputEvent event = mouseEvent(window, EventKind::MouseDown, at);
    event.extends = shift;
    event.continuesClick = press.when - lastPress_.when < doubleClickTime && isNear(at.x, lastPress_.at.x) &&
                           isNear(at.y, lastPress_.at.y);
    lastPress_ = press;
    post_(event);
}

void WebFrontEnd::moveMouse(WindowId window, Point at) {
    post_(mouseEvent(window, EventKind::MouseMove, at));
}

void WebFrontEnd::releaseMouse(WindowId window, Point at) {
    post_(mouseEvent(window, EventKind::MouseUp, at));
}

void WebFrontEnd::setPointer(WindowId window, PointerShape shape) {
    page::setPointer(window, shape == PointerShape::Hand);
}

// --- Text ---

void WebFrontEnd::setTextInput(WindowId window, std::optional<Rect> area) {
    Shown& shown = windows_.at(window);
    shown.textArea = area;
    placeTextField(window, shown);
}

void WebFrontEnd::placeTextField(WindowId window, const Shown& shown) {
    if (!shown.textArea) {
        page::setTextField(window, 0, 0, 0, 0);
        return;
    }
    const Rect& client = shown.place.client;
    const Size size = shown.traits.clientSize;
    const auto across = [&](std::int32_t x) { return x * client.width() / size.width; };
    const auto down = [&](std::int32_t y) { return y * client.height() / size.height; };
    const Rect area{across(shown.textArea->left), down(shown.textArea->top), across(shown.textArea->right),
                    down(shown.textArea->bottom)};
    page::setTextField(window, area.left, area.top, area.width(), area.height());
}

bool WebFrontEnd::editsText(WindowId window) const {
    const auto found = windows_.find(window);
    return found != windows_.end() && found->second.textArea.has_value();
}

void WebFrontEnd::setClipboardText(const std::string& text) {
    clipboard_ = text;
    page::setClipboard(text.data(), text.size());
}

// --- For those who do not see the pictures ---

void WebFrontEnd::tell(WindowId window, const Description& description) {
    const auto found = windows_.find(window);
    if (found == windows_.end())
        return;
    const NativeWindow& traits = found->second.traits;
    voice_.tell(window, traits.owner != WindowId::none, traits.clientSize, description);
}

void WebFrontEnd::clickPlace(WindowId window, std::size_t place) {
    const Point at = voice_.middleOf(window, place);
    InputEvent event{.window = window, .x = static_cast<float>(at.x), .y = static_cast<float>(at.y)};
    for (const EventKind kind : {EventKind::MouseMove, EventKind::MouseDown, EventKind::MouseUp}) {
        event.kind = kind;
        post_(event);
    }
}

// --- Files ---

// The page has the backdrop as a PNG picture, for it shows it by itself until the program does.
FileBytes WebFrontEnd::programFile(std::string_view name) {
    constexpr std::string_view backdrop = "BGIMG.BMP";
    FileBytes bytes = pageFile(name == backdrop ? "BGIMG.PNG" : name);
    if (name != backdrop)
        return bytes;
    const auto picture = decodePng(bytes);
    const auto bitmap = picture ? encodeBitmap(*picture) : std::vector<std::byte>();
    return {bitmap.begin(), bitmap.end()};
}

void WebFrontEnd::openDocument(std::string_view document) {
    page::openDocument(document.data(), document.size());
}

}  // namespace quabble
