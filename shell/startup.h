#pragma once
#include <cstdint>

namespace kr {

class Game;

// Prepares all state before the window is first shown; the host hands in the clock-derived seed.
void StartUp(Game& g, uint32_t seed);

}  // namespace kr
