#include "app/button_panel.hpp"

#include <algorithm>
#include <string>

#include "gfx/message_template.hpp"
#include "gfx/painters.hpp"
#include "gfx/spoken_words.hpp"
#include "gfx/string_table.hpp"

namespace quabble {
namespace {

constexpr std::int32_t labelShadow = 2;
constexpr std::int32_t hoveredShadow = 6;
constexpr std::int32_t leftShadow = 3;  // of a button that the pointer has left

}  // namespace

void ButtonPanel::draw(Canvas& canvas) {
    looks_.assign(boxes_.size(), Look::Resting);
    drawAgain(canvas);
}

void ButtonPanel::drawAgain(Canvas& canvas) const {
    for (std::size_t i = 0; i < looks_.size(); ++i) {
        if (boxes_[i].active != BoxKind::ValueBox)
            drawBox(canvas, i);
    }
}

void ButtonPanel::drawBox(Canvas& canvas, std::size_t box) const {
    const bool isHovered = looks_[box] == Look::Hovered;
    std::int32_t shadow = boxes_[box].active == BoxKind::Button ? restingShadow_ : labelShadow;
    if (looks_[box] != Look::Resting)
        shadow = isHovered ? hoveredShadow : leftShadow;
    drawLabelledBox(canvas, boxes_[box], isHovered ? BoxStyle::Framed : BoxStyle::Plain, isHovered, shadow,
                    captionOf(box));
}

std::string_view ButtonPanel::captionOf(std::size_t box) const {
    return loadString(static_cast<std::uint16_t>(captionBase_ + box + 1));
}

void ButtonPanel::drawValue(Canvas& canvas, std::size_t box, std::int32_t value, bool highlighted) const {
    drawLabelledBox(canvas, boxes_[box], BoxStyle::Plain, highlighted, labelShadow, std::to_string(value));
}

std::optional<std::size_t> ButtonPanel::buttonAt(float x, float y) const {
    std::size_t number = 0;
    for (const ScreenButton& box : boxes_) {
        if (box.active != BoxKind::Button)
            continue;
        if (hitTest(box, x, y))
            return number;
        ++number;
    }
    return std::nullopt;
}

std::vector<Place> ButtonPanel::places() const {
    std::vector<Place> places;
    for (std::size_t box = 0; box < boxes_.size(); ++box) {
        if (boxes_[box].active == BoxKind::Button)
            places.push_back({boxes_[box].rect(), Place::Role::Button, std::string(captionOf(box))});
    }
    return places;
}

Place ButtonPanel::valuePlace(std::size_t box, std::int32_t value) const {
    return {boxes_[box].rect(), Place::Role::Text,
            fillText(spoken::figure, {"|1", captionOf(box - 1), "|2", value})};
}

bool ButtonPanel::highlightNext(Canvas& canvas, float x, float y) {
    const auto isWrong = [&](const ScreenButton& box) {
        return box.active == BoxKind::Button && box.hovered != hitTest(box, x, y);
    };
    const auto button = std::ranges::find_if(boxes_, isWrong);
    if (button == boxes_.end())
        return false;
    button->hovered = !button->hovered;
    const auto box = static_cast<std::size_t>(button - boxes_.begin());
    looks_[box] = button->hovered ? Look::Hovered : Look::Left;
    drawBox(canvas, box);
    return true;
}

}  // namespace quabble
