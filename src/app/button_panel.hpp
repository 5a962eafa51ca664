#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string_view>
#include <utility>
#include <vector>

#include "draw/canvas.hpp"
#include "gfx/screen_button.hpp"
#include "platform/place.hpp"

namespace quabble {

// A column of buttons, labels and value boxes that is drawn on a window: the main menu or a side panel.
class ButtonPanel {
 public:
    ButtonPanel() = default;
    // The caption of each box, counted from 1, is the text of `captionBase` plus its number. A button at rest
    // has its text moved against its shadow by `restingShadow` when the panel is drawn.
    ButtonPanel(std::vector<ScreenButton> boxes, std::uint16_t captionBase, std::int32_t restingShadow)
        : boxes_(std::move(boxes)), captionBase_(captionBase), restingShadow_(restingShadow) {}

    // Draws the buttons, at rest, and the labels; or once more as they were drawn last.
    void draw(Canvas& canvas);
    void drawAgain(Canvas& canvas) const;
    void drawValue(Canvas& canvas, std::size_t box, std::int32_t value, bool highlighted) const;

    // Which button, of the buttons alone, counted from 0, is at that place.
    std::optional<std::size_t> buttonAt(float x, float y) const;

    // Its buttons.
    std::vector<Place> places() const;
    // A value box in words, with the label above it.
    Place valuePlace(std::size_t box, std::int32_t value) const;

    // The next button that is not drawn as the pointer's place asks for is drawn so. False when all are.
    bool highlightNext(Canvas& canvas, float x, float y);

 private:
    enum class Look { Resting, Hovered, Left };
    std::string_view captionOf(std::size_t box) const;
    void drawBox(Canvas& canvas, std::size_t box) const;

    std::vector<ScreenButton> boxes_;
    std::vector<Look> looks_;  // of each box as it is drawn; none before that
    std::uint16_t captionBase_ = 0;
    std::int32_t restingShadow_ = 0;
};

}  // namespace quabble
