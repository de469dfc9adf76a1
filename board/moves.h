#pragma once

#include "board/grid.h"

namespace kr {

class Game;

// Whether some swap of two neighbours lines up three equal icons. Reads the board only.
bool HasPossibleMove(const BoardCells& board);
bool sprawdz(Game& g);

// "Brak możliwych ruchów" for 2 s while a new board fills.
void RenewBoard(Game& g);
void NoMovesTick(Game& g);

}  // namespace kr
