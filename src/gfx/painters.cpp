#include "gfx/painters.hpp"

#include <algorithm>
#include <cassert>

#include "base/round_half_even.hpp"
#include "draw/text.hpp"
#include "gfx/sprite_sheet.hpp"

namespace quabble {
namespace {

Rect cellRect(const ScreenButton& box, std::int32_t column, std::int32_t row) {
    return Rect::ofSize(box.left + column * box.cellSize, box.top + row * box.cellSize, box.cellSize,
                        box.cellSize);
}

void copyTile(const ScreenButton& box, const Surface& spriteSheet, const Rect& square, std::int16_t tile) {
    box.surface->picture.copy(square, spriteSheet, sprites::tileAt(tile, box.cellSize));
}

}  // namespace

bool hitTest(const ScreenButton& box, float x, float y) {
    const auto left = static_cast<float>(box.left);
    const auto top = static_cast<float>(box.top);
    const auto right = static_cast<float>(box.left + box.width);
    const auto bottom = static_cast<float>(box.top + box.height);
    return left < x && x < right && top < y && y < bottom;
}

void fillBox(const ScreenButton& box) {
    if (box.fillBrush)
        box.surface->picture.fill(box.rect(), box.fillBrush->colour);
}

void drawLabelledBox(const ScreenButton& box, BoxStyle style, bool highlighted, std::int32_t shadowOffset,
                     std::string_view caption) {
    Surface& picture = box.surface->picture;
    fillBox(box);
    if (style != BoxStyle::Plain && box.framePen)
        picture.outline(box.rect(), box.framePen->colour);
    if (style == BoxStyle::DoubleFramed)
        picture.outline(box.rect().shrunkBy(1), palette::lightPen.colour);

    constexpr std::int32_t format =
        text_format::centre + text_format::verticalCentre + text_format::singleLine;
    Rect area = box.rect();
    drawText(picture, area, caption, format, palette::black, box.surface->font);
    area.right += shadowOffset;
    area.bottom -= shadowOffset;
    drawText(picture, area, caption, format, highlighted ? palette::highlightColour : box.textColour,
             box.surface->font);
}

void drawShadowText(const ScreenButton& box, std::int32_t offset, std::string_view text,
                    std::int32_t format) {
    const std::int32_t flags = format == defaultTextFormat ? text_format::verticalCentre : format;
    Rect area = box.rect();
    drawText(box.surface->picture, area, text, flags, palette::black, box.surface->font);
    area.left += offset;
    area.top -= offset;
    drawText(box.surface->picture, area, text, flags, box.textColour, box.surface->font);
}

void drawCell(const ScreenButton& box, const Surface& spriteSheet, std::int16_t column, std::int16_t row,
              std::int16_t tile) {
    copyTile(box, spriteSheet, cellRect(box, column, row), tile);
}

void drawBoard(const ScreenButton& box, const Surface& spriteSheet, const PlayGrid& grid) {
    grid.forEachCell([&](CellPosition place, const GridCell& cell) {
        copyTile(box, spriteSheet, cellRect(box, place.column - 1, place.row - 1), cell.tile);
    });
}

void drawPreviewRow(const ScreenButton& box, const Surface& spriteSheet, const GridRow& nextRow,
                    std::int16_t revealed) {
    const auto columns = static_cast<std::int32_t>(nextRow.size());
    for (std::int32_t i = 1; i <= columns; ++i) {
        const Rect square = cellRect(box, i - 1, 0);
        copyTile(box, spriteSheet, square, nextRow[static_cast<std::size_t>(i - 1)].tile);
        if (i < columns - revealed)
            box.surface->picture.andCopy(square, spriteSheet, sprites::maskAt(box.cellSize));
    }
}

void drawGauge(const ScreenButton& box, const Surface& spriteSheet, double percentage) {
    const std::int32_t filled = roundHalfEven(std::min(percentage, 100.0) * sprites::gaugeRows / 100);
    const Rect top = Rect::ofSize(box.left, box.top, box.width, filled);
    const Rect rest = Rect::ofSize(box.left, box.top + filled, box.width, sprites::gaugeRows - filled);
    box.surface->picture.copy(top, spriteSheet, sprites::fullGauge);
    box.surface->picture.copy(rest, spriteSheet, {sprites::emptyGauge.x, sprites::emptyGauge.y + filled});
}

void drawPlayPanel(const ScreenButton& box, const Surface& spriteSheet) {
    box.surface->picture.copy(box.rect(), spriteSheet, sprites::playPanel);
}

void copyPicture(const ScreenButton& box, const Surface& picture) {
    box.surface->picture.copy(box.rect(), picture, {0, 0});
}

}  // namespace quabble
