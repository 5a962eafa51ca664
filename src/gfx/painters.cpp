#include "gfx/painters.hpp"

#include <algorithm>

#include "base/round_half_even.hpp"
#include "gfx/sprite_sheet.hpp"

namespace quabble {
namespace {

void copyTile(Canvas& canvas, const Rect& square, const Surface& spriteSheet, std::int16_t tile) {
    canvas.copy(square, spriteSheet, sprites::tileAt(tile, square.width()));
}

}  // namespace

bool hitTest(const Rect& area, float x, float y) {
    return static_cast<float>(area.left) < x && x < static_cast<float>(area.right) &&
           static_cast<float>(area.top) < y && y < static_cast<float>(area.bottom);
}

void fillBox(Canvas& canvas, const ScreenButton& box) {
    if (box.fillBrush)
        canvas.fill(box.rect(), box.fillBrush->colour);
}

void drawLabelledBox(Canvas& canvas, const ScreenButton& box, BoxStyle style, bool highlighted,
                     std::int32_t shadowOffset, std::string_view caption) {
    fillBox(canvas, box);
    if (style != BoxStyle::Plain && box.framePen)
        canvas.outline(box.rect(), box.framePen->colour);
    if (style == BoxStyle::DoubleFramed)
        canvas.outline(box.rect().shrunkBy(1), palette::lightPen.colour);

    constexpr std::int32_t format =
        text_format::centre + text_format::verticalCentre + text_format::singleLine;
    Rect area = box.rect();
    canvas.write(area, caption, format, box.font, palette::black);
    area.right += shadowOffset;
    area.bottom -= shadowOffset;
    canvas.write(area, caption, format, box.font, highlighted ? palette::highlightColour : box.textColour);
}

void drawShadowText(Canvas& canvas, const ScreenButton& box, std::int32_t offset, std::string_view text,
                    std::int32_t format) {
    const std::int32_t flags = format == defaultTextFormat ? text_format::verticalCentre : format;
    Rect area = box.rect();
    canvas.write(area, text, flags, box.font, palette::black);
    area.left += offset;
    area.top -= offset;
    canvas.write(area, text, flags, box.font, box.textColour);
}

void drawCell(Canvas& canvas, const CellBox& box, const Surface& spriteSheet, std::int16_t column,
              std::int16_t row, std::int16_t tile) {
    copyTile(canvas, box.cell(column, row), spriteSheet, tile);
}

void drawBoard(Canvas& canvas, const CellBox& box, const Surface& spriteSheet, const PlayGrid& grid) {
    grid.forEachCell([&](CellPosition place, const GridCell& cell) {
        copyTile(canvas, box.cell(place.column - 1, place.row - 1), spriteSheet, cell.tile);
    });
}

void drawPreviewRow(Canvas& canvas, const CellBox& box, const Surface& spriteSheet, const GridRow& nextRow,
                    std::int16_t revealed) {
    const auto columns = static_cast<std::int32_t>(nextRow.size());
    for (std::int32_t i = 1; i <= columns; ++i) {
        const Rect square = box.cell(i - 1, 0);
        copyTile(canvas, square, spriteSheet, nextRow[static_cast<std::size_t>(i - 1)].tile);
        if (i < columns - revealed)
            canvas.andCopy(square, spriteSheet, sprites::maskAt(box.cellSize));
    }
}

void drawGauge(Canvas& canvas, const Rect& area, const Surface& spriteSheet, double percentage) {
    const std::int32_t filled = roundHalfEven(std::min(percentage, 100.0) * sprites::gaugeRows / 100);
    const Rect whole = Rect::ofSize(area.left, area.top, area.width(), sprites::gaugeRows);
    const std::int32_t end = area.top + filled;
    canvas.copy({whole.left, whole.top, whole.right, end}, spriteSheet, sprites::fullGauge);
    canvas.copy({whole.left, end, whole.right, whole.bottom}, spriteSheet,
                {sprites::emptyGauge.x, sprites::emptyGauge.y + filled});
}

void drawPlayPanel(Canvas& canvas, const Rect& area, const Surface& spriteSheet) {
    canvas.copy(area, spriteSheet, sprites::playPanel);
}

void copyPicture(Canvas& canvas, const Rect& area, const Surface& picture) {
    canvas.copy(area, picture, {0, 0});
}

}  // namespace quabble
