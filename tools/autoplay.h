#pragma once
#include <array>
#include <cstdint>
#include <optional>

#include "board/grid.h"

namespace kr {

class Game;

// What one move would bring, counting the runs it lines up and those the icons already on the board form as
// they fall (the icons that enter at the top are unknown and match nothing).
struct MoveYield {
    int damage = 0;     // to the enemy, with the hero's accuracy and any deadly bullets
    int work = 0;       // engineering points, dexterity included
    int healing = 0;    // health points, intelligence included
    int resources = 0;  // resource points of every kind
    int cells = 0;      // icons removed
};

MoveYield Foresee(const Game& g, BoardCells board, std::array<bool, 100> greens);

// How much the stage gains from a move's yield: damage to an enemy, work on a door, terminal or bomb, healing
// when the next shots could kill, then resources and the size of the move.
double Value(const Game& g, const MoveYield& yield);

struct SwapChoice {
    int16_t from = 0;
    int16_t to = 0;
    double value = 0;
};

// The best swap of two neighbours that lines up a run; nothing when none does.
std::optional<SwapChoice> BestSwap(const Game& g);

// Why a mission ended.
enum class Ending { Won, EnemyFire, Bomb, NoTime };

struct MissionResult {
    Ending ending = Ending::NoTime;
    int moves = 0;             // swaps and board targets
    int skills = 0;            // skills used
    int64_t milliseconds = 0;  // virtual time from the start button to the outcome
};

// A careful player: from the main menu it starts the mission, then each turn uses the skills that help (an
// aimed shot before a long fight, deadly bullets, healing in danger, Bullet Time against a bomb, a grenade where
// brown bullets cluster, "Wybuch" or "Teleport" when no neighbour swap is worth much) and otherwise makes the
// best swap, until the mission is won or lost or `limit` ms of virtual time pass.
MissionResult PlayMission(Game& g, int mission, int64_t limit = 3'600'000);

}  // namespace kr
