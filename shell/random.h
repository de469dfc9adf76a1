#pragma once
#include <cstdint>
#include <random>

namespace kr {

// The game's one generator: uniform single-precision draws in [0, 1), never 1.0.
class Random {
public:
    void Seed(uint32_t seed) { engine_.seed(seed); }

    // 24 random bits scaled by 2^-24: every value is exact in a float and the largest is 1 - 2^-24.
    float Draw() { return static_cast<float>(engine_() >> 8) * (1.0f / 16777216.0f); }

private:
    std::mt19937 engine_{0};
};

}  // namespace kr
