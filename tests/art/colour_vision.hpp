#pragma once

#include <algorithm>
#include <array>
#include <cmath>
#include <complex>
#include <numbers>

namespace quabble {

// A colour in linear light, red, green and blue from 0 to 1.
using LinearColour = std::array<double, 3>;
// CIE 1976 L*, a*, b* under D65.
using Lab = std::array<double, 3>;

// IEC 61966-2-1, from a channel of 0 to 255.
inline double linear(double channel) {
    const double c = channel / 255;
    return c <= 0.04045 ? c / 12.92 : std::pow((c + 0.055) / 1.055, 2.4);
}

inline double relativeLuminance(const LinearColour& c) {
    return 0.2126 * c[0] + 0.7152 * c[1] + 0.0722 * c[2];
}

// The contrast ratio of WCAG 2, from 1 to 21.
inline double contrast(const LinearColour& one, const LinearColour& other) {
    const double a = relativeLuminance(one) + 0.05;
    const double b = relativeLuminance(other) + 0.05;
    return a > b ? a / b : b / a;
}

inline Lab labOf(const LinearColour& c) {
    const auto f = [](double t) { return t > 216.0 / 24389 ? std::cbrt(t) : (24389.0 / 27 * t + 16) / 116; };
    const double x = f((0.4124564 * c[0] + 0.3575761 * c[1] + 0.1804375 * c[2]) / 0.95047);
    const double y = f(relativeLuminance(c));
    const double z = f((0.0193339 * c[0] + 0.1191920 * c[1] + 0.9503041 * c[2]) / 1.08883);
    return {116 * y - 16, 500 * (x - y), 200 * (y - z)};
}

// What is seen with a kind of sight: the matrices of Machado, Oliveira and Fernandes (2009) for severity 1.
struct Sight {
    const char* name;
    std::array<double, 9> matrix;

    LinearColour operator()(const LinearColour& c) const {
        LinearColour seen{};
        for (std::size_t i = 0; i < 3; ++i) {
            const double value = matrix[3 * i] * c[0] + matrix[3 * i + 1] * c[1] + matrix[3 * i + 2] * c[2];
            seen[i] = std::min(std::max(value, 0.0), 1.0);
        }
        return seen;
    }
};
constexpr std::array<Sight, 4> sights{
    {{"normal", {1, 0, 0, 0, 1, 0, 0, 0, 1}},
     {"protanopia",
      {0.152286, 1.052583, -0.204868, 0.114503, 0.786281, 0.099216, -0.003882, -0.048116, 1.051998}},
     {"deuteranopia",
      {0.367322, 0.860646, -0.227968, 0.280085, 0.672501, 0.047413, -0.011820, 0.042940, 0.968881}},
     {"tritanopia",
      {1.255528, -0.076749, -0.178779, -0.078411, 0.930809, 0.147602, 0.004733, 0.691367, 0.303900}}}};

// CIEDE2000 with all weights 1, in the notation of Sharma, Wu and Dalal (2005).
inline double ciede2000(const Lab& one, const Lab& other) {
    constexpr double pi = std::numbers::pi;
    const auto radians = [](double degrees) { return degrees * pi / 180; };
    const auto power7 = [](double c) { return std::pow(c, 7) / (std::pow(c, 7) + std::pow(25.0, 7)); };
    const double meanC = (std::hypot(one[1], one[2]) + std::hypot(other[1], other[2])) / 2;
    const double stretch = 1.5 - 0.5 * std::sqrt(power7(meanC));
    const std::complex<double> z1(stretch * one[1], one[2]);
    const std::complex<double> z2(stretch * other[1], other[2]);
    const double hueStep = std::arg(z2 * std::conj(z1));
    const double middle = std::arg(z1) + hueStep / 2;
    const double meanHue = middle < 0 ? middle + 2 * pi : middle;
    const double meanL = (one[0] + other[0]) / 2 - 50;
    const double meanChroma = (std::abs(z1) + std::abs(z2)) / 2;
    const double t = 1 - 0.17 * std::cos(meanHue - radians(30)) + 0.24 * std::cos(2 * meanHue) +
                     0.32 * std::cos(3 * meanHue + radians(6)) - 0.20 * std::cos(4 * meanHue - radians(63));
    const double sl = 1 + 0.015 * meanL * meanL / std::sqrt(20 + meanL * meanL);
    const double sc = 1 + 0.045 * meanChroma;
    const double sh = 1 + 0.015 * meanChroma * t;
    const double bump = (meanHue * 180 / pi - 275) / 25;
    const double rt = -std::sin(radians(60 * std::exp(-bump * bump))) * 2 * std::sqrt(power7(meanChroma));
    const double dl = (other[0] - one[0]) / sl;
    const double dc = (std::abs(z2) - std::abs(z1)) / sc;
    const double dh = 2 * std::sqrt(std::abs(z1) * std::abs(z2)) * std::sin(hueStep / 2) / sh;
    return std::sqrt(dl * dl + dc * dc + dh * dh + rt * dc * dh);
}

}  // namespace quabble
