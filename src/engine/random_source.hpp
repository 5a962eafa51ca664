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
    double next() override {
        ++drawn_;
        return static_cast<double>(generator_() >> 11) * 0x1.0p-53;
    }

    // How many numbers it has given, and going on behind so many more.
    std::uint64_t drawn() const { return drawn_; }
    void skip(std::uint64_t numbers) {
        generator_.discard(numbers);
        drawn_ += numbers;
    }

 private:
    std::mt19937_64 generator_;
    std::uint64_t drawn_ = 0;
};

}  // namespace quabble
