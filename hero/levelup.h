#pragma once
#include <cstdint>

namespace kr {

class Game;

// After "Wymiatam!": unlocks the next mission when the newest one was won (and saves at once), then
// shows the level-up screen when a point is due, or else the mission list.
void PrepareLevelUp(Game& g, const int16_t& mission);
void PlusClicked(Game& g, int row);
void LevelUpOkClicked(Game& g);

}  // namespace kr
