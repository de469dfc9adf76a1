#pragma once
#include <cstdint>

namespace kr {

class Game;

// The ordinary press on a playable cell while input is open: select, deselect, or swap with the selected
// neighbour (with any cell while "Teleport" is armed).
void CellPressed(Game& g, int16_t cell);
// Locks input and plays the eight-tick sparkle; the last tick exchanges the icons and resolves.
void StartSwap(Game& g, int16_t from, int16_t to);
void SwapTick(Game& g);

}  // namespace kr
