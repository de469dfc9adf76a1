#pragma once
#include <cstdint>

namespace kr {

class Game;

inline constexpr int kSkillCount = 7;
inline constexpr int kResourceRows = 5;
// The gem kind counted in each resource row: grey bullet, wrench, red cross, crosshair, grenade.
inline constexpr int16_t kResourceRowKind[kResourceRows] = {0, 4, 5, 3, 2};

// The skills by their place in the panel, top to bottom.
enum SkillIndex : int16_t {
    kAimedShot = 0,
    kTeleport = 1,
    kBulletTime = 2,
    kGrenade = 3,
    kHealing = 4,
    kBlast = 5,
    kDeadlyBullets = 6,
};

// Fills the constant price table: entry = resource row x 7 + skill index.
void FillSkillCost(Game& g);
int16_t CostOf(const Game& g, int skill, int row);

// The skill whose price slots hold cost icon `slot` (six slots a skill).
inline int16_t SkillOfCostSlot(int slot) { return static_cast<int16_t>(slot / 6); }

// Pays for skill s and acts at once or arms its target; nothing while input is locked or while the skill's
// frame shows no green border.
void UseSkill(Game& g, const int16_t& skill);

}  // namespace kr
