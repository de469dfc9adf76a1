#include "board/moves.h"

#include "board/fill.h"
#include "shell/game.h"
#include "shell/timer_numbers.h"

namespace kr {
namespace {

struct Direction {
    int step;         // where the icon moves
    bool borderTest;  // up and down must not move onto the border
    int pairs[4][2];  // cells that, both holding the kind, complete a line with the moved icon
};

constexpr Direction kDirections[4] = {
    {-1, false, {{-2, -3}, {-11, -21}, {-11, 9}, {9, 19}}},
    {1, false, {{2, 3}, {-9, -19}, {-9, 11}, {11, 21}}},
    {-10, true, {{-20, -30}, {-11, -12}, {-11, -9}, {-9, -8}}},
    {10, true, {{20, 30}, {11, 12}, {11, 9}, {9, 8}}},
};

}  // namespace

bool HasPossibleMove(const BoardCells& board)
{
    auto at = [&](int i) { return board[static_cast<size_t>(i)]; };
    for (int i = 11; i <= 88; ++i) {
        const int16_t kind = at(i);
        if (!IsGem(kind)) continue;
        for (const Direction& direction : kDirections) {
            const int16_t target = at(i + direction.step);
            if (target == kind || (direction.borderTest && target == BORDER)) continue;
            // The nearer cell is read first: a border cell never holds the kind, so the
            // farther cell is only read while it lies inside the grid.
            for (const auto& pair : direction.pairs)
                if (at(i + pair[0]) == kind && at(i + pair[1]) == kind) return true;
        }
    }
    return false;
}

bool sprawdz(Game& g) { return HasPossibleMove(g.Board); }

void RenewBoard(Game& g)
{
    g.screen.NoMovesLabel->visible = true;
    g.timers[kNoMovesTimer].SetEnabled(true);
    StartBoardFill(g);
    g.InputReady = false;
}

void NoMovesTick(Game& g)
{
    g.screen.NoMovesLabel->visible = false;
    g.timers[kNoMovesTimer].SetEnabled(false);
}

}  // namespace kr
