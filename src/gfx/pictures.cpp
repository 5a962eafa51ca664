#include "gfx/pictures.hpp"

#include <array>
#include <optional>
#include <span>
#include <string>

#include "draw/bitmap_file.hpp"
#include "draw/canvas.hpp"
#include "draw/fingerprint.hpp"
#include "draw/large_picture.hpp"
#include "draw/scaling.hpp"
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

Surface standInSheet() {
    Canvas sheet(sheet_map::size, Scale());
    for (std::int32_t tile = 0; tile < tiles::count; ++tile) {
        const Rect square = sheet_map::tile(tile);
        sheet.fill(square, standInColours[static_cast<std::size_t>(tile)]);
        sheet.outline(square, standInPanel);
        if (tile != tiles::empty) {
            sheet.write(square, std::to_string(tile),
                        text_format::centre + text_format::verticalCentre + text_format::singleLine,
                        {Typeface::SansBold, 11}, palette::black);
        }
    }
    sheet.fill(sheet_map::veil, standInMask);
    sheet.fill(sheet_map::emptyGauge, standInPanel);
    sheet.fill(sheet_map::fullGauge, palette::highlightColour);
    sheet.fill(sheet_map::playPanel, standInPanel);
    return sheet.picture();
}

// A large version ends in the fingerprint of the picture that it belongs to, its last byte first: somebody
// may have put a picture of his own in that one's place.
std::optional<LargePicture> largeVersion(std::span<const std::byte> file, const Surface& plain) {
    if (file.size() < fingerprintSize)
        return std::nullopt;
    const auto signature = file.last(fingerprintSize);
    std::uint64_t fingerprint = 0;
    for (std::size_t i = 0; i < fingerprintSize; ++i)
        fingerprint |= std::to_integer<std::uint64_t>(signature[i]) << (8 * i);
    if (fingerprint != fingerprintOf(plain))
        return std::nullopt;
    auto large = LargePicture::of(file.first(file.size() - fingerprintSize));
    return large && large->size() == Size{plain.width(), plain.height()} ? large : std::nullopt;
}

}  // namespace

const Sprites& Pictures::sprites(Scale scale) {
    if (sprites_ && scale == scale_)
        return *sprites_;
    scale_ = scale;
    const auto sheet = decodeBitmap(frontEnd_.programFile("ALLPICDATA.BMP"));
    if (!sheet || sheet->width() < sheet_map::size.width || sheet->height() < sheet_map::size.height)
        return sprites_.emplace(spritesOf(standInSheet(), scale));
    const FileBytes file = scale == Scale() ? FileBytes() : frontEnd_.programFile("ALLPICDATA.BIG");
    if (auto large = largeVersion(file, *sheet)) {
        sprites_ = spritesOf(*large, scale);
        if (!large->isDamaged())
            return *sprites_;
    }
    return sprites_.emplace(spritesOf(*sheet, scale));
}

Surface Pictures::backdrop(Scale scale) {
    auto plain = decodeBitmap(frontEnd_.programFile("BGIMG.BMP"));
    if (!plain)
        return {};
    if (scale == Scale())
        return std::move(*plain);
    const FileBytes file = frontEnd_.programFile("BGIMG.BIG");
    if (auto large = largeVersion(file, *plain)) {
        Surface picture = reduced(*large, plain->bounds(), scale);
        if (!large->isDamaged())
            return picture;
    }
    return magnified(*plain, scale);
}

}  // namespace quabble
