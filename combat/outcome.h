#pragma once
#include <cstdint>

namespace kr {

class Game;

// Blocks input, blinks "Misja nieudana!" for 7 s and returns to the mission list. A failure already
// under way is not started again.
void StartFailure(Game& g);
bool FailureRunning(const Game& g);
void FailureTick(Game& g);

// When no mandatory goal is left: the 7 s "Zadanie wykonane!" pause, then the next stage.
void CheckStageDone(Game& g);
void StageDoneTick(Game& g);

void ShowMissionComplete(Game& g, const int16_t& mission);
void MissionCompleteClicked(Game& g);

}  // namespace kr
