#include "gfx/sprites.hpp"

#include <functional>

#include "draw/scaling.hpp"

namespace quabble {
namespace {

Surface cut(const Surface& sheet, const Rect& part) {
    Surface picture(part.width(), part.height());
    picture.copy(picture.bounds(), sheet, {part.left, part.top});
    return picture;
}

// `finish` brings a picture cut out of the sheet to the scale. A tile is darkened before that: combined with
// a mask whose pixels are mixed already it would get false colours.
Sprites cutAll(const Surface& sheet, std::int32_t factor,
               const std::function<Surface(const Surface&)>& finish) {
    const auto cutLarge = [&](const Rect& part) {
        return cut(sheet, {part.left * factor, part.top * factor, part.right * factor, part.bottom * factor});
    };
    Sprites sprites;
    const Surface veil = cutLarge(sheet_map::veil);
    for (std::size_t i = 0; i < sprites.tiles.size(); ++i) {
        Surface tile = cutLarge(sheet_map::tile(static_cast<std::int32_t>(i)));
        sprites.tiles[i] = finish(tile);
        tile.andCopy(tile.bounds(), veil, {0, 0});
        sprites.veiledTiles[i] = finish(tile);
    }
    sprites.emptyGauge = finish(cutLarge(sheet_map::emptyGauge));
    sprites.fullGauge = finish(cutLarge(sheet_map::fullGauge));
    sprites.playPanel = finish(cutLarge(sheet_map::playPanel));
    return sprites;
}

}  // namespace

Sprites spritesOf(const Surface& sheet, Scale scale) {
    return cutAll(sheet, 1, [scale](const Surface& picture) {
        return scale == Scale() ? picture : magnified(picture, scale);
    });
}

Sprites spritesOf(const Surface& largeSheet, std::int32_t factor, Scale scale) {
    return cutAll(largeSheet, factor,
                  [factor, scale](const Surface& picture) { return reduced(picture, factor, scale); });
}

}  // namespace quabble
