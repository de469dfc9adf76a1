#pragma once
#include <cstdint>

namespace kr {

class Game;

// A mission button is enabled when its number is at most UnlockedMissions.
void EnableMissionButtons(Game& g);
// Base 30 + 10 x mission, raised by a quarter per Endurance point; the product is 16-bit.
int16_t MaxHealthFor(int16_t mission, int16_t endurance);
void MissionChosen(Game& g, int16_t mission);
// One character per 10 ms tick; the tick after the last only stops the timer.
void TypewriterTick(Game& g);
void StartMissionClicked(Game& g);
void BriefingBackClicked(Game& g);

}  // namespace kr
