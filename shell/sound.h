#pragma once

namespace kr {

class Game;

// Names the fourteen channels and opens them in ascending order, whatever the sound switch holds.
void OpenSoundChannels(Game& g);

// Rewinds a channel and plays it without waiting. Callers test the sound switch themselves.
void PlayChannel(Game& g, int channel);

void PlayShot(Game& g);
void PlayMiss(Game& g);
void PlayImpact(Game& g);
void PlayReload(Game& g);
void PlayEngineer(Game& g);
void PlayHeal(Game& g);
void PlayGoalDone(Game& g);
void PlayDefeat(Game& g);
void PlayBoom(Game& g);
void PlayStart(Game& g);
void PlayPenalty(Game& g);
void PlayBulletTime(Game& g);
void PlayMissionDone(Game& g);

}  // namespace kr
