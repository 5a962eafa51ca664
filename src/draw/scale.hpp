#pragma once

#include <algorithm>
#include <cstdint>

#include "draw/geometry.hpp"

namespace quabble {

// How many pixels of the screen, device pixels, one of the program's takes, across and down: quarters from 1
// to 4.
class Scale {
 public:
    constexpr Scale() = default;  // 1
    static constexpr Scale ofQuarters(std::int32_t quarters) {
        Scale scale;
        scale.quarters_ = std::clamp(quarters, 4, 16);
        return scale;
    }

    // The quarter that is nearest to the factor.
    static constexpr Scale nearest(double factor) {
        return ofQuarters((static_cast<std::int32_t>(std::clamp(factor, 1.0, 4.0) * 8) + 1) / 2);
    }

    constexpr std::int32_t quarters() const { return quarters_; }
    constexpr double factor() const { return quarters_ / 4.0; }

    // Where an edge lies: x * factor, rounded, a half up. So whatever is a whole number of device pixels wide
    // is as wide everywhere.
    constexpr std::int32_t edge(std::int32_t x) const { return floorOfQuarter(x * quarters_ + 2); }
    constexpr Rect device(const Rect& area) const {
        return {edge(area.left), edge(area.top), edge(area.right), edge(area.bottom)};
    }
    constexpr Size device(Size size) const { return {edge(size.width), edge(size.height)}; }
    // The smallest size that covers an area of that size wherever it lies.
    constexpr Size deviceAround(Size size) const {
        return {floorOfQuarter(size.width * quarters_ + 3), floorOfQuarter(size.height * quarters_ + 3)};
    }

    // The program's pixel that a device pixel is part of.
    constexpr Point pixelAt(Point device) const { return {pixelAt(device.x), pixelAt(device.y)}; }

    // The thickness of a line, in device pixels.
    constexpr std::int32_t line() const { return floorOfQuarter(quarters_ + 2); }

    friend bool operator==(const Scale&, const Scale&) = default;

 private:
    static constexpr std::int32_t floorOfQuarter(std::int32_t number) { return number >> 2; }
    constexpr std::int32_t pixelAt(std::int32_t device) const {
        const std::int32_t dividend = 4 * device + 1;
        return dividend >= 0 ? dividend / quarters_ : -((-dividend + quarters_ - 1) / quarters_);
    }

    std::int32_t quarters_ = 4;
};

}  // namespace quabble
