#pragma once

namespace kr {

class Game;

// Shows the pointer of what the next board press will do: the grenade, the blinking target of "Wybuch" or
// "Teleport", or the ordinary pointer.
void ShowBoardPointer(Game& g);

// Forgets every armed targeting skill and shows the ordinary pointer.
void ClearTargeting(Game& g);

// Alternates the two target frames; any other pointer (the enemy's turn) is left as it is.
void TargetBlinkTick(Game& g);

}  // namespace kr
