#pragma once

namespace kr {

class Game;

// Bullet Time runs while its duration timer does.
bool BulletTimeRunning(const Game& g);

// Starts, or on a second use restarts, the 15 s of slow time: the bomb ticks every 200 ms, the enemy acts
// on every second turn, and the bar over the window shrinks towards its centre.
void StartBulletTime(Game& g);

// Two duration ticks, 7.5 s apart: the first one only plays the sound again, the second ends the effect.
void BulletTimeTick(Game& g);
void BulletTimeBarTick(Game& g);

// Stops the duration and the bar, hides the bar and puts the bomb clock back at its normal pace.
void EndBulletTime(Game& g);

}  // namespace kr
