#pragma once

namespace kr {

class Game;

enum class TurnKind { Move, Heal };

// Every completed move (and a heal while an enemy is present) passes here: the deadly-bullets count
// (moves only), the immobilisation, the Bullet Time toggle, and maybe the enemy's attack.
void EnemyTurnGate(Game& g, TurnKind turn);

// Four blinks of the enemy's frame, then one shot one second after the turn.
void StartEnemyAttack(Game& g);
void EnemyAttackTick(Game& g);

// Stops the board's animations, the typewriter and the bomb clock (back at its normal pace), and ends
// Bullet Time: what both an explosion and leaving the mission do.
void StopMissionClocks(Game& g);

// The bomb countdown; at zero the bomb goes off and the mission is lost.
void BombClockTick(Game& g);

}  // namespace kr
