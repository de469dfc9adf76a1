#pragma once
#include <cstdint>

namespace kr {

class Game;

inline constexpr int kBombPanel = 0;
inline constexpr int kEnemyPanel = 1;
inline constexpr int kTerminalPanel = 2;

// Prepares the game screen for one stage: full health, no resources, the goal panels of the stage
// (mandatory ones first, in the order bomb, enemy, terminal), and a new board. One past the last
// stage shows the mission-complete screen instead.
void SetUpStage(Game& g, const int16_t& mission, const int16_t& stage);

}  // namespace kr
