#pragma once
#include <cstdint>

namespace kr {

class Game;

// The first hint is uniform over pages 1..13: page 14 never comes first.
int16_t DrawFirstHint(Game& g);
void ShowHint(Game& g, int16_t page);
void NextHint(Game& g);
void PreviousHint(Game& g);
// Every 30 s: any of the 14 pages, possibly the one already shown.
void HintTimerTick(Game& g);
void CloseHints(Game& g);
// At a mission start: home when the tutorial switch is on, out of sight otherwise.
void PlaceTutorialPanel(Game& g);

}  // namespace kr
