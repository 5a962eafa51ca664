#include "app/layout.hpp"

#include "base/round_half_even.hpp"

namespace quabble::layout {
namespace {

constexpr std::int32_t buttonHeight = 30;
constexpr std::int32_t mainMenuButtons = 8;
constexpr std::int32_t cellSize = 28;
constexpr Size playPanelSize{400, 500};
constexpr std::int32_t playPanelLeft = 200;

ScreenButton button(std::int32_t left, std::int32_t top, std::int32_t width) {
    return {.left = left,
            .top = top,
            .width = width,
            .height = buttonHeight,
            .fillBrush = palette::backgroundBrush,
            .framePen = palette::lightPen,
            .textColour = palette::panelTextColour,
            .font = captionFont};
}

// A panel of `size` entries: a title, `values` pairs of a label and a value box, and buttons.
std::vector<ScreenButton> panel(std::int32_t size, std::size_t values) {
    std::vector<ScreenButton> entries;
    entries.reserve(static_cast<std::size_t>(size));
    for (std::int32_t i = 0; i < size; ++i)
        entries.push_back(button(25, 90 + 40 * i, 140));
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

Rect playPanel(std::int32_t top) {
    return Rect::ofSize(playPanelLeft, top, playPanelSize.width, playPanelSize.height);
}

}  // namespace

Size clientSize() {
    return {layoutUnit * 15, roundHalfEven(layoutUnit * 12.5)};
}

std::vector<ScreenButton> initMMBtns() {
    const std::int32_t left = roundHalfEven(clientSize().width / 2.0 - layoutUnit * 2.5);
    std::vector<ScreenButton> buttons;
    buttons.reserve(mainMenuButtons);
    for (std::int32_t i = 1; i <= mainMenuButtons; ++i)
        buttons.push_back(button(left, roundHalfEven(30.0 * i * 1.75), layoutUnit * 5));
    return buttons;
}

std::vector<ScreenButton> initStandardBtns() {
    return panel(8, 2);
}

std::vector<ScreenButton> initArcadeBtns() {
    return panel(10, 3);
}

Rect classicPlayPanel() {
    return playPanel(roundHalfEven((clientSize().height - 540) / 2.0));
}

Rect arcadePlayPanel() {
    return playPanel(5);
}

CellBox board(const Rect& playPanel) {
    return {roundHalfEven((playPanel.width() - 12 * cellSize) / 2.0 + playPanel.left),
            roundHalfEven((playPanel.height() - 16 * cellSize) / 2.0 + playPanel.top), cellSize};
}

CellBox preview(const CellBox& board) {
    return {board.left, board.cell(0, 16).top + 25, cellSize};
}

Rect gauge(const Rect& playPanel, const CellBox& board) {
    return Rect::ofSize(layoutUnit + board.cell(12, 0).left,
                        roundHalfEven((playPanel.height() - 240) / 2.0 + playPanel.top), 30, 240);
}

}  // namespace quabble::layout
