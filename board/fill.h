#pragma once
#include <cstdint>

namespace kr {

class Game;

// Puts BORDER round the ring with its bevelled picture; those cells ignore the mouse.
void MarkBorderRing(Game& g);

// Shows the cell's gem: the green-tipped bullet when its GreenFlag is set, else its kind.
void ShowCell(Game& g, int16_t cell);

// Blanks the 64 playable cells and starts the fill timer at cell 99; board values are left until
// the fill reaches them.
void StartBoardFill(Game& g);

// Draws a gem for a playable cell that completes no run with the cells right of it and below it.
void GenerateCell(Game& g, int16_t cell);

// One fill tick: one playable cell, from the bottom-right corner to the top-left.
void FillTick(Game& g);

}  // namespace kr
