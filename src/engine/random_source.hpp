#pragma once

#include <cstdint>
#include <random>

namespace quabble {

// Where chance comes from: numbers uniform in [0, 1).
class RandomSource {
 public:
    virtual ~RandomSource() = default;
    virtual double next() = 0;
};

// The generator the game ships with. Its engine is fixed by the language's standard and its numbers are made
// from the upper 53 bits, so that a seed gives the same boards on every machine and compiler.
class SeededRandom final : public RandomSource {
 public:
    explicit SeededRandom(std::uint64_t seed) : generator_(seed) {}
    double next() override { return static_cast<double>(generator_() >> 11) * 0x1.0p-53; }

 private:
    std::mt19937_64 generator_;
};

}  // namespace quabble
