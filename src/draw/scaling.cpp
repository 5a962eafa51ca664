#include "draw/scaling.hpp"

#include <algorithm>
#include <cassert>
#include <cmath>
#include <cstring>
#include <utility>

#include "base/round_half_even.hpp"

namespace quabble {
namespace {

constexpr double plainDotsPerInch = 96;
constexpr double stepsToOne = 4;

struct Division {
    std::int64_t quotient = 0;
    std::int64_t rest = 0;  // never negative
};

Division floorDivision(std::int64_t dividend, std::int64_t divisor) {
    const std::int64_t rest = (dividend % divisor + divisor) % divisor;
    return {(dividend - rest) / divisor, rest};
}

std::uint32_t mixed(std::uint32_t one, std::uint32_t other, std::uint32_t weight) {
    constexpr std::uint32_t redAndBlue = 0xFF00FF;
    constexpr std::uint32_t green = 0x00FF00;
    const std::uint32_t rest = 256 - weight;
    return (((one & redAndBlue) * rest + (other & redAndBlue) * weight) >> 8 & redAndBlue) |
           (((one & green) * rest + (other & green) * weight) >> 8 & green) | pixel_layout::opaque;
}

// A pixel is seen where its centre is.
std::int32_t pixelSeenAt(std::int32_t at, std::int32_t window, std::int32_t picture) {
    const std::int64_t centre = (2 * std::int64_t{at} + 1) * picture;
    return static_cast<std::int32_t>(floorDivision(centre, 2 * std::int64_t{window}).quotient);
}

// How much of each of the large picture's pixels lies under each device pixel, along one axis, in a measure
// in which both have whole lengths.
struct Share {
    std::int32_t pixel = 0;
    std::uint32_t length = 0;
};

std::vector<std::vector<Share>> sharesOf(std::int32_t largePixels, std::int32_t factor, Scale scale) {
    const std::int32_t large = scale.quarters();  // the length of one of the large picture's pixels
    const std::int32_t device = 4 * factor;
    const std::int32_t end = largePixels * large;
    std::vector<std::vector<Share>> shares;
    for (std::int32_t begin = 0; begin < end; begin += device) {
        std::vector<Share> under;
        const std::int32_t last = std::min(begin + device, end);
        for (std::int32_t at = begin; at < last;) {
            const std::int32_t next = std::min((at / large + 1) * large, last);
            under.push_back({at / large, static_cast<std::uint32_t>(next - at)});
            at = next;
        }
        shares.push_back(std::move(under));
    }
    return shares;
}

// A sum of colours, each counted so many times.
struct Sum {
    std::uint32_t red = 0, green = 0, blue = 0, count = 0;

    void add(std::uint32_t pixel, std::uint32_t times) {
        const Colour colour = colourOf(pixel);
        red += colour.red * times;
        green += colour.green * times;
        blue += colour.blue * times;
        count += times;
    }
    std::uint32_t mean() const {
        assert(count > 0);
        const auto part = [this](std::uint32_t sum) {
            return static_cast<std::uint8_t>((sum + count / 2) / count);
        };
        return pixelOf({part(red), part(green), part(blue)});
    }
};

}  // namespace

Surface reduced(const Surface& large, std::int32_t factor, Scale scale) {
    const auto columns = sharesOf(large.width(), factor, scale);
    const auto rows = sharesOf(large.height(), factor, scale);
    Surface picture(static_cast<std::int32_t>(columns.size()), static_cast<std::int32_t>(rows.size()));
    for (std::int32_t y = 0; y < picture.height(); ++y) {
        const auto line = picture.row(y);
        for (std::size_t x = 0; x < columns.size(); ++x) {
            Sum sum;
            for (const Share& row : rows[static_cast<std::size_t>(y)]) {
                const auto from = large.row(row.pixel);
                for (const Share& column : columns[x])
                    sum.add(from[static_cast<std::size_t>(column.pixel)], row.length * column.length);
            }
            line[x] = sum.mean();
        }
    }
    return picture;
}

Surface magnified(const Surface& picture, Scale scale) {
    const Size size{picture.width(), picture.height()};
    const Size shown = scale.deviceAround(size);
    Surface large(shown.width, shown.height);
    Magnifier(size, shown)
        .show(picture, large.row(0).data(),
              std::ptrdiff_t{shown.width} * static_cast<std::ptrdiff_t>(sizeof(std::uint32_t)));
    return large;
}

double scaleFor(double dotsPerInch, Size picture, Size available) {
    const double wanted =
        std::max(roundHalfEven(dotsPerInch / plainDotsPerInch * stepsToOne) / stepsToOne, 1.0);
    const double largest = std::min(static_cast<double>(available.width) / picture.width,
                                    static_cast<double>(available.height) / picture.height);
    if (wanted <= largest || largest <= 0)
        return wanted;
    return largest < 1 ? largest : std::floor(largest * stepsToOne) / stepsToOne;
}

Size scaled(Size size, double scale) {
    return {roundHalfEven(size.width * scale), roundHalfEven(size.height * scale)};
}

Point pixelSeenAt(Point shown, Size window, Size picture) {
    return {pixelSeenAt(shown.x, window.width, picture.width),
            pixelSeenAt(shown.y, window.height, picture.height)};
}

Magnifier::Magnifier(Size picture, Size shown)
    : picture_(picture),
      shown_(shown),
      columns_(mixes(picture.width, shown.width)),
      rows_(mixes(picture.height, shown.height)) {}

std::vector<Magnifier::Mix> Magnifier::mixes(std::int32_t from, std::int32_t to) {
    const std::int64_t times = (std::int64_t{to} + from - 1) / from;
    std::vector<Mix> mixes;
    for (std::int32_t i = 0; i < to; ++i) {
        const Division centre =
            floorDivision((2 * std::int64_t{i} + 1) * times * from - to, 2 * std::int64_t{to});
        const auto pixel = [&](std::int64_t repeated) {
            return static_cast<std::int32_t>(std::clamp<std::int64_t>(repeated / times, 0, from - 1));
        };
        const std::int32_t first = pixel(centre.quotient);
        const auto weight = static_cast<std::uint32_t>(centre.rest * 256 / (2 * std::int64_t{to}));
        mixes.push_back({first, weight == 0 ? first : pixel(centre.quotient + 1), weight});
    }
    return mixes;
}

void Magnifier::show(const Surface& picture, std::uint32_t* pixels, std::ptrdiff_t stride) {
    const auto width = static_cast<std::size_t>(shown_.width);
    for (Row& row : latest_)
        row.of = -1;
    for (std::int32_t y = 0; y < shown_.height; ++y) {
        auto* line = reinterpret_cast<std::uint32_t*>(reinterpret_cast<std::byte*>(pixels) +
                                                      std::ptrdiff_t{y} * stride);
        if (shown_ == picture_) {
            std::memcpy(line, picture.row(y).data(), width * sizeof(std::uint32_t));
            continue;
        }
        const Mix& mix = rows_[static_cast<std::size_t>(y)];
        const std::uint32_t* first = widened(picture, mix.first).pixels.data();
        if (mix.first == mix.second) {
            std::memcpy(line, first, width * sizeof(std::uint32_t));
            continue;
        }
        const std::uint32_t* second = widened(picture, mix.second).pixels.data();
        for (std::size_t x = 0; x < width; ++x)
            line[x] = mixed(first[x], second[x], mix.weight);
    }
}

// Neighbouring rows follow each other, so that the last even and the last odd one are all that is needed
// again.
const Magnifier::Row& Magnifier::widened(const Surface& picture, std::int32_t y) {
    Row& row = latest_[y % 2];
    if (row.of == y)
        return row;
    row.of = y;
    row.pixels.resize(columns_.size());
    const auto from = picture.row(y);
    for (std::size_t x = 0; x < columns_.size(); ++x) {
        const Mix& mix = columns_[x];
        const std::uint32_t first = from[static_cast<std::size_t>(mix.first)];
        row.pixels[x] =
            mix.weight == 0 ? first : mixed(first, from[static_cast<std::size_t>(mix.second)], mix.weight);
    }
    return row;
}

}  // namespace quabble
