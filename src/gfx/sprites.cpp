#include "gfx/sprites.hpp"

#include "draw/scaling.hpp"

namespace quabble {
namespace {

// `cut` takes a picture out of the sheet, `finish` brings one to the scale, and `made` does both. A tile is
// darkened in between: combined with a mask whose pixels are mixed already it would get false colours.
template <typename Cut, typename Finish, typename Made>
Sprites cutAll(Cut cut, Finish finish, Made made) {
    Sprites sprites;
    const Surface veil = cut(sheet_map::veil);
    for (std::size_t i = 0; i < sprites.tiles.size(); ++i) {
        Surface tile = cut(sheet_map::tile(static_cast<std::int32_t>(i)));
        sprites.tiles[i] = finish(tile);
        tile.andCopy(tile.bounds(), veil, {0, 0});
        sprites.veiledTiles[i] = finish(tile);
    }
    sprites.emptyGauge = made(sheet_map::emptyGauge);
    sprites.fullGauge = made(sheet_map::fullGauge);
    sprites.playPanel = made(sheet_map::playPanel);
    return sprites;
}

}  // namespace

Sprites spritesOf(const Surface& sheet, Scale scale) {
    const auto cut = [&](const Rect& part) {
        Surface picture(part.width(), part.height());
        picture.copy(picture.bounds(), sheet, {part.left, part.top});
        return picture;
    };
    const auto finish = [&](const Surface& picture) {
        return scale == Scale() ? picture : magnified(picture, scale);
    };
    return cutAll(cut, finish, [&](const Rect& part) { return finish(cut(part)); });
}

Sprites spritesOf(LargePicture& sheet, Scale scale) {
    const auto cut = [&](const Rect& part) { return sheet.cut(part); };
    const auto finish = [&](const Surface& picture) { return reduced(picture, sheet.factor(), scale); };
    return cutAll(cut, finish, [&](const Rect& part) { return reduced(sheet, part, scale); });
}

}  // namespace quabble
