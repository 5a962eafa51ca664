#include "app/layout.hpp"

#include "app/app_state.hpp"
#include "base/round_half_even.hpp"

namespace quabble {
namespace {

constexpr std::int32_t buttonHeight = 30;
constexpr std::size_t mainMenuButtons = 8;
constexpr std::int32_t cellSize = 28;

ScreenButton panelEntry(Canvas& canvas, std::size_t i) {
    return {.surface = &canvas,
            .left = 25,
            .top = 90 + 40 * static_cast<std::int32_t>(i),
            .width = 140,
            .height = buttonHeight,
            .fillBrush = palette::backgroundBrush,
            .framePen = palette::lightPen,
            .textColour = palette::panelTextColour};
}

// A panel of `size` entries: a title, `values` pairs of a label and a value box, and buttons.
ButtonSet layOutPanel(Canvas& canvas, std::size_t size, std::size_t values) {
    ButtonSet entries;
    for (std::size_t i = 0; i < size; ++i)
        entries.push_back(panelEntry(canvas, i));
    entries[0].top = 50;
    entries[0].active = BoxKind::Label;
    for (std::size_t i = 1; i <= 2 * values; i += 2) {
        entries[i].active = BoxKind::Label;
        entries[i].textColour = palette::labelColour;
        entries[i + 1].active = BoxKind::ValueBox;
        entries[i + 1].textColour = palette::valueColour;
        entries[i + 1].top -= 10;
    }
    return entries;
}

}  // namespace

ScreenButton layOutBackground(Canvas& canvas) {
    return {.surface = &canvas,
            .width = layoutUnit * 15,
            .height = roundHalfEven(layoutUnit * 12.5),
            .fillBrush = palette::backgroundBrush};
}

ButtonSet initMMBtns(Canvas& canvas, const ScreenButton& background) {
    ButtonSet buttons;
    for (std::size_t i = 1; i <= mainMenuButtons; ++i) {
        buttons.push_back({.surface = &canvas,
                           .left = roundHalfEven(background.width / 2.0 - layoutUnit * 2.5),
                           .top = roundHalfEven(30.0 * static_cast<double>(i) * 1.75),
                           .width = layoutUnit * 5,
                           .height = buttonHeight,
                           .fillBrush = palette::backgroundBrush,
                           .framePen = palette::lightPen,
                           .textColour = palette::panelTextColour});
    }
    return buttons;
}

ButtonSet initStandardBtns(Canvas& canvas) {
    return layOutPanel(canvas, 8, 2);
}

ButtonSet initArcadeBtns(Canvas& canvas) {
    return layOutPanel(canvas, 10, 3);
}

ScreenButton layOutPlayPanel(Canvas& canvas, const ScreenButton& background) {
    return {.surface = &canvas,
            .left = roundHalfEven((background.width - 400) / 2.0),
            .top = roundHalfEven((background.height - 540) / 2.0),
            .width = 400,
            .height = 500};
}

ScreenButton layOutBoard(Canvas& canvas, const ScreenButton& playPanel) {
    constexpr std::int32_t width = 12 * cellSize;
    constexpr std::int32_t height = 16 * cellSize;
    return {.surface = &canvas,
            .left = roundHalfEven((playPanel.width - width) / 2.0 + playPanel.left),
            .top = roundHalfEven((playPanel.height - height) / 2.0 + playPanel.top),
            .width = width,
            .height = height,
            .cellSize = cellSize};
}

ScreenButton layOutPreview(Canvas& canvas, const ScreenButton& board) {
    return {.surface = &canvas,
            .left = board.left,
            .top = board.top + board.height + 25,
            .width = board.width,
            .height = cellSize,
            .cellSize = cellSize};
}

ScreenButton layOutGauge(Canvas& canvas, const ScreenButton& playPanel, const ScreenButton& board) {
    return {.surface = &canvas,
            .left = layoutUnit + board.left + board.width,
            .top = roundHalfEven((playPanel.height - 240) / 2.0 + playPanel.top),
            .width = 30,
            .height = 240};
}

}  // namespace quabble
