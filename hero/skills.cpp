#include "hero/skills.h"

#include "shell/game.h"

namespace kr {
namespace {

// Price of each skill by resource row: grey bullet, wrench, red cross, crosshair, grenade.
constexpr int16_t kPrices[kSkillCount][kResourceRows] = {
    {2, 0, 0, 1, 1},  // "Celny strzał"
    {0, 2, 1, 1, 0},  // "Teleport"
    {1, 2, 1, 2, 0},  // "Bullet Time"
    {2, 0, 0, 0, 4},  // "Rzut granatem"
    {0, 2, 4, 0, 0},  // "Leczenie"
    {1, 1, 0, 1, 3},  // "Wybuch"
    {5, 0, 0, 5, 0},  // "Śmiercionośne naboje"
};

}  // namespace

void FillSkillCost(Game& g)
{
    for (int row = 0; row < kResourceRows; ++row)
        for (int skill = 0; skill < kSkillCount; ++skill)
            g.SkillCost[static_cast<size_t>(row * kSkillCount + skill)] = kPrices[skill][row];
}

int16_t CostOf(const Game& g, int skill, int row) { return g.SkillCost[static_cast<size_t>(row * kSkillCount + skill)]; }

}  // namespace kr
