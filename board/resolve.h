#pragma once
#include <array>
#include <cstdint>
#include <vector>

#include "board/grid.h"

namespace kr {

class Game;

// A run of three or more equal icons, cells first, first + step, ... (step 1 in a row, 10 in a column).
struct Run {
    int16_t kind = 0;
    int16_t first = 0;
    int16_t step = 1;
    int16_t power = 0;   // cells in the run minus one
    int16_t greens = 0;  // green-tipped bullets among its cells
};

// Every run on the board: rows before columns, each search in increasing cell order. A cell in both a
// row run and a column run belongs to both.
std::vector<Run> FindRuns(const BoardCells& board, const std::array<bool, 100>& greenFlag);

// Hands every run to its effect and blows its cells up; with no run left the turn ends.
void ResolveBoard(Game& g);
void BlastTick(Game& g);
// Icons above each gap fall one row per tick while new ones enter the top row.
void FallTick(Game& g);
// Runs once per move, however long its cascade.
void TurnEnd(Game& g);

// Marks a cell for the blast: cleared, showing the first blast frame, its green tip gone.
void ClearCell(Game& g, int16_t cell);
// Blows up every cleared cell; the fall, any cascade and the turn end follow.
void StartBlast(Game& g);

}  // namespace kr
