#include "draw/large_picture.hpp"

#include <algorithm>
#include <utility>

#include "draw/png_file.hpp"
#include "draw/scaling.hpp"

namespace quabble {
namespace {

constexpr std::size_t numberSize = 4;  // bytes
constexpr std::uint32_t largestFactor = 16;
constexpr std::uint32_t largestEdge = 4096;  // as large as it is drawn

// Takes a number off the front of the bytes; there must be one.
std::uint32_t takeNumber(std::span<const std::byte>& bytes) {
    std::uint32_t number = 0;
    for (std::size_t i = 0; i < numberSize; ++i)
        number |= std::to_integer<std::uint32_t>(bytes[i]) << (8 * i);
    bytes = bytes.subspan(numberSize);
    return number;
}

}  // namespace

std::optional<LargePicture> LargePicture::of(std::span<const std::byte> file) {
    if (file.size() < 3 * numberSize)
        return std::nullopt;
    const std::uint32_t factor = takeNumber(file);
    const std::uint32_t width = takeNumber(file);
    const std::uint32_t height = takeNumber(file);
    if (factor < 1 || factor > largestFactor)
        return std::nullopt;
    const auto isSensible = [factor](std::uint32_t edge) {
        return edge >= 1 && edge <= largestEdge / factor;
    };
    if (!isSensible(width) || !isSensible(height))
        return std::nullopt;
    return LargePicture(file, static_cast<std::int32_t>(factor),
                        {static_cast<std::int32_t>(width), static_cast<std::int32_t>(height)});
}

// The band that was decoded last is kept, for what is cut next often begins in it.
const Surface& LargePicture::band(std::int32_t number) {
    if (number == decodedNumber_)
        return decoded_;
    std::span<const std::byte> bytes = bands_;
    std::span<const std::byte> file;
    for (std::int32_t i = 0; i <= number && bytes.size() >= numberSize; ++i) {
        const std::size_t length = takeNumber(bytes);
        file = bytes.first(std::min(length, bytes.size()));
        bytes = bytes.subspan(file.size());
    }
    const std::int32_t height = std::min(bandHeight, size_.height - number * bandHeight);
    const Size drawn{size_.width * factor_, height * factor_};
    auto picture = decodePng(file);
    const bool fits = picture && Size{picture->width(), picture->height()} == drawn;
    isDamaged_ = isDamaged_ || !fits;
    decoded_ = fits ? std::move(*picture) : Surface(drawn.width, drawn.height);
    decodedNumber_ = number;
    return decoded_;
}

Surface LargePicture::cut(const Rect& part) {
    Surface picture(part.width() * factor_, part.height() * factor_);
    const std::int32_t end = std::min(part.bottom, size_.height);
    for (std::int32_t top = part.top; top < end;) {
        const std::int32_t number = top / bandHeight;
        const std::int32_t bottom = std::min((number + 1) * bandHeight, end);
        const Rect place{0, (top - part.top) * factor_, picture.width(), (bottom - part.top) * factor_};
        picture.copy(place, band(number), {part.left * factor_, (top - number * bandHeight) * factor_});
        top = bottom;
    }
    return picture;
}

// Made slice by slice: as each but the last is a multiple of four of the program's pixels high, it begins and
// ends with a device pixel at every scale.
Surface reduced(LargePicture& picture, const Rect& part, Scale scale) {
    static_assert(LargePicture::bandHeight % 4 == 0);
    const Size size = scale.deviceAround({part.width(), part.height()});
    Surface whole(size.width, size.height);
    for (std::int32_t top = part.top; top < part.bottom; top += LargePicture::bandHeight) {
        const Rect slice{part.left, top, part.right, std::min(top + LargePicture::bandHeight, part.bottom)};
        const Surface made = reduced(picture.cut(slice), picture.factor(), scale);
        const std::int32_t at = scale.edge(top - part.top);
        whole.copy(Rect::ofSize(0, at, made.width(), made.height()), made, {0, 0});
    }
    return whole;
}

}  // namespace quabble
