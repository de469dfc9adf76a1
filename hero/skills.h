#pragma once
#include <cstdint>

namespace kr {

class Game;

inline constexpr int kSkillCount = 7;
inline constexpr int kResourceRows = 5;
// The gem kind counted in each resource row: grey bullet, wrench, red cross, crosshair, grenade.
inline constexpr int16_t kResourceRowKind[kResourceRows] = {0, 4, 5, 3, 2};

// Fills the constant price table: entry = resource row x 7 + skill index.
void FillSkillCost(Game& g);
int16_t CostOf(const Game& g, int skill, int row);

}  // namespace kr
