#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <span>

#include "draw/geometry.hpp"
#include "draw/scale.hpp"
#include "draw/surface.hpp"

namespace quabble {

// A picture that is drawn a whole number of times as large as the program's pixels. All of it would take many
// times the memory of what is made from it, so it is kept in bands, each a PNG picture of 28 rows of the
// program's pixels, from the top; the last one may be lower.
//
// At most 4096 pixels across and down, as large as it is drawn. Its file begins with three numbers of four
// bytes, the lowest first: how many times as large it is drawn, its width and its height in the program's
// pixels. Each band follows its length in bytes, such a number as well.
class LargePicture {
 public:
    static constexpr std::int32_t bandHeight = 28;

    // Of a file's bytes, which must outlive it; no band is looked at yet. Nothing when they are none.
    static std::optional<LargePicture> of(std::span<const std::byte> file);

    std::int32_t factor() const { return factor_; }
    Size size() const { return size_; }  // in the program's pixels

    // A part of it, which is given in the program's pixels, as large as it is drawn. What cannot be decoded
    // is black.
    Surface cut(const Rect& part);

    // Some of what was to be cut could not be decoded.
    bool isDamaged() const { return isDamaged_; }

 private:
    LargePicture(std::span<const std::byte> bands, std::int32_t factor, Size size)
        : bands_(bands), factor_(factor), size_(size) {}
    const Surface& band(std::int32_t number);

    std::span<const std::byte> bands_;
    std::int32_t factor_;
    Size size_;
    std::int32_t decodedNumber_ = -1;
    Surface decoded_;
    bool isDamaged_ = false;
};

// A part of a large picture at a scale: each pixel is the mean of what it covers.
Surface reduced(LargePicture& picture, const Rect& part, Scale scale);

}  // namespace quabble
