#pragma once
#include <cstdint>

namespace kr {

class Game;

// The effect of one run on the fight, in the game's fixed order; resources are capped later by the panel.
void ApplyRunEffects(Game& g, int16_t kind, int16_t power, int16_t greens);

// Damage = (amount + Accuracy) x (green tips + 1); the bar shrinks in proportion to the health left.
void ShootEnemy(Game& g, const int16_t& amount, const int16_t& greenTips);
// All points go to the first goal needing work: required bomb, required terminal, bomb, terminal.
void DoEngineering(Game& g, const int16_t& amount);
void HealHero(Game& g, const int16_t& amount);

void DamageRiseTick(Game& g);
void HitMarkerTick(Game& g);

}  // namespace kr
