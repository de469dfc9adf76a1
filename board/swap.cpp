#include "board/swap.h"

#include <string>
#include <utility>

#include "board/fill.h"
#include "board/grid.h"
#include "board/resolve.h"
#include "hero/targeting.h"
#include "shell/arithmetic.h"
#include "shell/game.h"
#include "shell/timer_numbers.h"

namespace kr {
namespace {

// Pictures both cells show at swap steps 8..2: a sparkle shrinking to nothing and growing back.
int SparkleFor(int step)
{
    constexpr int kFrames[9] = {0, 0, 7, 8, 9, 10, 9, 8, 7};
    return kFrames[step];
}

void ShowSelection(Game& g, int16_t cell)
{
    ui::Control& marker = *g.screen.SelectionMarker;
    const ui::Control& image = *g.screen.Cells[static_cast<size_t>(cell)];
    marker.left = image.left;
    marker.top = image.top;
    marker.visible = true;
    g.SelectedCell = cell;
}

}  // namespace

void CellPressed(Game& g, int16_t cell)
{
    ui::Control& marker = *g.screen.SelectionMarker;
    if (marker.visible && cell == g.SelectedCell) {
        marker.visible = false;
        g.SelectedCell = -1;
        return;
    }
    if (!marker.visible) {
        ShowSelection(g, cell);
        return;
    }
    const int distance = cell - g.SelectedCell;
    const bool neighbour = distance == 1 || distance == -1 || distance == 10 || distance == -10;
    if (!neighbour && !g.TeleportPending) return;
    StartSwap(g, g.SelectedCell, cell);
    marker.visible = false;
    if (g.TeleportPending) {
        g.TeleportPending = false;
        ShowBoardPointer(g);
    }
}

void StartSwap(Game& g, int16_t from, int16_t to)
{
    g.InputReady = false;
    g.SwapUnmatched = true;
    StartCountdown(g.timers[kSwapTimer], 8);
    g.SwapFrom = from;
    g.SwapTo = to;
}

void SwapTick(Game& g)
{
    ui::Timer& timer = g.timers[kSwapTimer];
    const int step = TakeStep(timer);
    const size_t from = static_cast<size_t>(g.SwapFrom);
    const size_t to = static_cast<size_t>(g.SwapTo);
    if (step > 1) {
        const ui::PictureRef sparkle = ui::Palette(SparkleFor(step));
        g.screen.Cells[from]->picture = sparkle;
        g.screen.Cells[to]->picture = sparkle;
        return;
    }
    std::swap(g.Board[from], g.Board[to]);
    std::swap(g.GreenFlag[from], g.GreenFlag[to]);
    ShowCell(g, g.SwapFrom);
    ShowCell(g, g.SwapTo);
    timer.SetEnabled(false);
    ResolveBoard(g);
}

}  // namespace kr
