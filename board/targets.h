#pragma once
#include <cstdint>
#include <vector>

namespace kr {

class Game;

// A press on a playable cell: a waiting grenade is thrown first, then a waiting "Wybuch" strikes, and
// otherwise the press selects or swaps (which also completes "Teleport").
void BoardPressed(Game& g, int16_t cell);

// The grenade's area in the order it is hit: the 3 x 3 square round `cell`, then one cell beyond the middle of
// each side, left out where it would wrap into another row or leave the grid.
std::vector<int> GrenadeArea(int cell);

// Clears the thirteen cells within two steps of `cell` and shoots the enemy for each brown bullet among them.
void ThrowGrenade(Game& g, int16_t cell);

// Clears every icon of the pressed cell's kind, red- and green-tipped bullets alike, with no effect of its own.
void BlastKind(Game& g, int16_t cell);

}  // namespace kr
