// What the page's script calls. Every function but the first needs `start` before it, and `ended` says when
// none is to be called any more. A window is given by its number, a place by device pixels of its client
// area.

#include <cmath>
#include <cstdint>
#include <limits>
#include <memory>
#include <string>
#include <string_view>

#include "hosts/web/page.hpp"
#include "hosts/web/page_keys.hpp"
#include "hosts/web/running.hpp"

namespace quabble {
namespace {

std::unique_ptr<Running> running;
std::string text;  // what the page hands over

constexpr std::string_view keyThatAsksHowItStands = "F2";

WindowId idOf(std::uint32_t window) {
    return static_cast<WindowId>(window);
}

Page pageOf(std::int32_t width, std::int32_t height, double ratio) {
    return {.size = {width, height}, .ratio = ratio};
}

}  // namespace

Running& runningNow() {
    return *running;
}
const std::string& textHandedOver() {
    return text;
}

// Makes room for a text of so many bytes, UTF-8, which the next call takes.
QUABBLE_EXPORT(textBuffer) char* textBuffer(std::size_t size) {
    text.assign(size, '\0');
    return text.data();
}

// The room for windows in device pixels, how many of them one of the page's pixels has, and what decides
// every board.
QUABBLE_EXPORT(start)
void start(std::int32_t width, std::int32_t height, double ratio, std::uint64_t seed) {
    running = std::make_unique<Running>(pageOf(width, height, ratio), seed);
    running->program.start();
}

QUABBLE_EXPORT(resize) void resize(std::int32_t width, std::int32_t height, double ratio) {
    running->frontEnd.resize(pageOf(width, height, ratio));
}
QUABBLE_EXPORT(takeLargePictures) void takeLargePictures() {
    running->frontEnd.takeLargePictures();
}
QUABBLE_EXPORT(setHidden) void setHidden(bool isHidden) {
    running->frontEnd.setHidden(isHidden);
}
QUABBLE_EXPORT(setMinimised) void setMinimised(std::uint32_t window, bool isMinimised) {
    running->frontEnd.setMinimised(idOf(window), isMinimised);
}

QUABBLE_EXPORT(pressMouse) void pressMouse(std::uint32_t window, std::int32_t x, std::int32_t y, bool shift) {
    running->frontEnd.pressMouse(idOf(window), {x, y}, shift);
}
QUABBLE_EXPORT(moveMouse) void moveMouse(std::uint32_t window, std::int32_t x, std::int32_t y) {
    running->frontEnd.moveMouse(idOf(window), {x, y});
}
QUABBLE_EXPORT(releaseMouse) void releaseMouse(std::uint32_t window, std::int32_t x, std::int32_t y) {
    running->frontEnd.releaseMouse(idOf(window), {x, y});
}
QUABBLE_EXPORT(clickPlace) void clickPlace(std::uint32_t window, std::size_t place) {
    running->frontEnd.clickPlace(idOf(window), place);
}
QUABBLE_EXPORT(pressCloseButton) void pressCloseButton(std::uint32_t window) {
    running->program.post({.window = idOf(window), .kind = EventKind::CloseButton});
}

// The key is the text that was handed over. True when it means something to the program, and so nothing to
// the browser.
QUABBLE_EXPORT(pressKey)
bool pressKey(std::uint32_t window, bool shift, bool ctrl, bool alt, bool altGraph, bool isRepeated) {
    if (text == keyThatAsksHowItStands && !shift && !ctrl && !alt) {
        if (!isRepeated)
            running->frontEnd.sayHowItStands(idOf(window));
        return true;
    }
    auto event = translate({.key = text,
                            .shift = shift,
                            .ctrl = ctrl,
                            .alt = alt,
                            .altGraph = altGraph,
                            .isRepeated = isRepeated,
                            .editsText = running->frontEnd.editsText(idOf(window))});
    if (!event)
        return false;
    event->window = idOf(window);
    running->program.post(*event);
    return true;
}
// The text that was handed over was typed.
QUABBLE_EXPORT(typeText) void typeText(std::uint32_t window) {
    running->program.post({.window = idOf(window), .kind = EventKind::TextInput, .text = text});
}
QUABBLE_EXPORT(copyText) void copyText(std::uint32_t window) {
    running->program.post({.window = idOf(window), .kind = EventKind::Edit, .command = EditCommand::Copy});
}
QUABBLE_EXPORT(cutText) void cutText(std::uint32_t window) {
    running->program.post({.window = idOf(window), .kind = EventKind::Edit, .command = EditCommand::Cut});
}

QUABBLE_EXPORT(wake) void wake() {
    running->program.wake();
    running->tell();
}
// When to wake the program at the latest, by the page's clock in milliseconds; infinite when it waits for the
// user.
QUABBLE_EXPORT(nextDeadline) double nextDeadline() {
    const auto deadline = running->program.nextDeadline();
    if (!deadline)
        return std::numeric_limits<double>::infinity();
    return std::chrono::duration<double, std::milli>(deadline->time_since_epoch()).count();
}
QUABBLE_EXPORT(keep) bool keep() {
    return running->program.keep();
}
// Hands the page the record of the last game. It may be called at any time, also when the program has failed.
QUABBLE_EXPORT(writeRecord) void writeRecord() {
    if (running)
        running->program.writeVisit(
            [](std::string_view line) { page::addToRecord(line.data(), line.size()); });
}
QUABBLE_EXPORT(ended) bool ended() {
    return running->program.ended();
}

}  // namespace quabble
