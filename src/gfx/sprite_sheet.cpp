#include "gfx/sprite_sheet.hpp"

#include <array>
#include <optional>

#include "draw/bitmap_file.hpp"
#include "draw/text.hpp"
#include "engine/grid_cell.hpp"
#include "gfx/palette.hpp"

namespace quabble {
namespace {

constexpr std::array<Colour, tiles::count> standInColours{{{24, 26, 36},
                                                           {214, 69, 65},
                                                           {242, 200, 66},
                                                           {96, 178, 230},
                                                           {122, 82, 168},
                                                           {128, 128, 128},
                                                           {90, 90, 90},
                                                           {150, 40, 38},
                                                           {168, 136, 30},
                                                           {52, 116, 160},
                                                           {255, 255, 255},
                                                           {255, 210, 120},
                                                           {150, 120, 100},
                                                           {60, 56, 60}}};
constexpr Colour standInMask{0x70, 0x70, 0x70};
constexpr Colour standInPanel{16, 17, 24};

void drawStandInTile(Surface& sheet, std::int16_t tile) {
    const Point at = sprites::tileAt(tile, sprites::tileSize);
    const Rect square = Rect::ofSize(at.x, at.y, sprites::tileSize, sprites::tileSize);
    sheet.fill(square, standInColours[static_cast<std::size_t>(tile)]);
    sheet.outline(square, standInPanel);
    if (tile != tiles::empty) {
        drawText(sheet, square, std::to_string(tile),
                 text_format::centre + text_format::verticalCentre + text_format::singleLine, palette::black,
                 {Typeface::SansBold, 11});
    }
}

Surface standInSheet() {
    Surface sheet(sprites::sheetSize.width, sprites::sheetSize.height);
    for (std::int16_t tile = 0; tile < tiles::count; ++tile)
        drawStandInTile(sheet, tile);
    const Point mask = sprites::maskAt(sprites::tileSize);
    sheet.fill(Rect::ofSize(mask.x, mask.y, sprites::tileSize, sprites::tileSize), standInMask);
    const auto gauge = [](Point at) {
        return Rect::ofSize(at.x, at.y, sprites::gaugeWidth, sprites::gaugeRows);
    };
    sheet.fill(gauge(sprites::emptyGauge), standInPanel);
    sheet.fill(gauge(sprites::fullGauge), palette::highlightColour);
    const Rect panel = Rect::ofSize(sprites::playPanel.x, sprites::playPanel.y, sprites::playPanelSize.width,
                                    sprites::playPanelSize.height);
    sheet.fill(panel, standInPanel);
    return sheet;
}

}  // namespace

Pictures loadGraphics(FrontEnd& frontEnd) {
    std::optional<Surface> sheet = decodeBitmap(frontEnd.programFile("ALLPICDATA.BMP"));
    if (!sheet || sheet->width() < sprites::sheetSize.width || sheet->height() < sprites::sheetSize.height)
        sheet = standInSheet();
    return {std::move(*sheet), decodeBitmap(frontEnd.programFile("BGIMG.BMP")).value_or(Surface{})};
}

}  // namespace quabble
