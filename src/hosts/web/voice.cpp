#include "hosts/web/voice.hpp"

#include <algorithm>
#include <utility>

#include "draw/windows_1252.hpp"
#include "hosts/web/page.hpp"
#include "platform/places.hpp"

namespace quabble {
namespace {

void add(std::string& text, std::string_view sentence) {
    if (sentence.empty())
        return;
    if (!text.empty())
        text += ". ";
    text += sentence;
}

bool isLaidAlike(const Place& one, const Place& other) {
    return one.role == other.role && one.area == other.area;
}

void sayNow(const std::string& words) {
    const std::string text = utf8Of(words);
    if (!text.empty())
        page::say(text.data(), text.size());
}

}  // namespace

void Voice::say(std::string_view words) {
    add(said_, words);
}

void Voice::tell(WindowId window, bool isDialog, Size clientSize, const Description& now) {
    const bool isNew = !told_.contains(window);
    const bool hadFocus = std::exchange(focused_, window) == window;
    const Description before = std::exchange(told_[window], now);
    if (before.name != now.name) {
        const std::string name = utf8Of(now.name);
        page::nameScreen(window, name.data(), name.size());
        if (hadFocus) {
            const std::string others = std::exchange(said_, now.name);
            add(said_, others);
        }
    }
    tellPlaces(window, clientSize, before.places, now.places);
    if (isNew || before.current != now.current)
        page::setCurrentPlace(window, now.current ? static_cast<std::int32_t>(*now.current) : -1);
    if (now.edited && before.edited != now.edited) {
        const std::string label = now.current ? utf8Of(now.places[*now.current].words) : "";
        const std::string text = utf8Of(now.edited->text);
        page::setFieldText(window, label.data(), label.size(), text.data(), text.size(), now.edited->caret,
                           now.edited->anchor);
    }
    if (isNew && isDialog)
        add(said_, textsOf(now, Place::Role::Text));
    sayNow(std::exchange(said_, {}));
}

void Voice::tellPlaces(WindowId window, Size clientSize, const std::vector<Place>& before,
                       const std::vector<Place>& now) const {
    const bool isLaidAnew = !std::ranges::equal(before, now, isLaidAlike);
    if (isLaidAnew)
        page::clearPlaces(window);
    for (std::size_t i = 0; i < now.size(); ++i) {
        const Place& place = now[i];
        if (!isLaidAnew && before[i].words == place.words)
            continue;
        const std::string words = utf8Of(place.words);
        const auto across = [&](std::int32_t x) { return 100.0 * x / clientSize.width; };
        const auto down = [&](std::int32_t y) { return 100.0 * y / clientSize.height; };
        page::setPlace(window, i, static_cast<std::uint32_t>(place.role), across(place.area.left),
                       down(place.area.top), across(place.area.width()), down(place.area.height()),
                       words.data(), words.size());
    }
}

std::string Voice::textsOf(const Description& description, Place::Role role) {
    std::string texts;
    for (const Place& place : description.places) {
        if (place.role == role)
            add(texts, place.words);
    }
    return texts;
}

void Voice::sayHowItStands(WindowId window) const {
    const auto found = told_.find(window);
    if (found == told_.end())
        return;
    std::string words = found->second.name;
    add(words, textsOf(found->second, Place::Role::Text));
    add(words, textsOf(found->second, Place::Role::TableRow));
    sayNow(words);
}

Point Voice::middleOf(WindowId window, std::size_t place) const {
    const auto found = told_.find(window);
    if (found == told_.end() || place >= found->second.places.size())
        return {-1, -1};
    return quabble::middleOf(found->second.places[place].area);
}

}  // namespace quabble
