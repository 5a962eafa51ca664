#include "gfx/painters.hpp"

#include <algorithm>

#include "base/round_half_even.hpp"

namespace quabble {

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
        canvas.outline(box.rect(), palette::lightPen.colour, 1);

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

void drawCell(Canvas& canvas, const CellBox& box, const Sprites& sprites, std::int16_t column,
              std::int16_t row, std::int16_t tile) {
    canvas.copy(box.cell(column, row), sprites.tiles[static_cast<std::size_t>(tile)]);
}

void drawBoard(Canvas& canvas, const CellBox& box, const Sprites& sprites, const PlayGrid& grid) {
    grid.forEachCell([&](CellPosition place, const GridCell& cell) {
        drawCell(canvas, box, sprites, static_cast<std::int16_t>(place.column - 1),
                 static_cast<std::int16_t>(place.row - 1), cell.tile);
    });
}

void drawPreviewRow(Canvas& canvas, const CellBox& box, const Sprites& sprites, const GridRow& nextRow,
                    std::int16_t revealed) {
    const auto columns = static_cast<std::int32_t>(nextRow.size());
    for (std::int32_t i = 1; i <= columns; ++i) {
        const auto tile = static_cast<std::size_t>(nextRow[static_cast<std::size_t>(i - 1)].tile);
        const bool isVeiled = i < columns - revealed;
        canvas.copy(box.cell(i - 1, 0), (isVeiled ? sprites.veiledTiles : sprites.tiles)[tile]);
    }
}

void drawGauge(Canvas& canvas, const Rect& area, const Sprites& sprites, double percentage) {
    const Rect whole = Rect::ofSize(area.left, area.top, area.width(), sheet_map::gaugeRows);
    const std::int32_t rows = canvas.scale().device(whole).height();
    const std::int32_t filled = roundHalfEven(std::min(percentage, 100.0) * rows / 100);
    canvas.copyRows(whole, sprites.fullGauge, 0, filled);
    canvas.copyRows(whole, sprites.emptyGauge, filled, rows);
}

void drawPlayPanel(Canvas& canvas, const Rect& area, const Sprites& sprites) {
    canvas.copy(area, sprites.playPanel);
}

}  // namespace quabble
