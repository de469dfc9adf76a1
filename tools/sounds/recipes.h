#pragma once
#include <array>
#include <vector>

namespace kr::sounds {

struct Recipe {
    const char* file;  // name inside dzwieki/
    std::vector<float> (*make)();
};

// The game's fourteen sound effects, in the order of its sound channels.
const std::array<Recipe, 14>& Recipes();

// Every sound's loudest sample, so that two of them overlapping stay below full scale (-7 dBFS).
inline constexpr double kPeak = 0.4467;

}  // namespace kr::sounds
