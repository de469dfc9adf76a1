#include "board/fill.h"

#include "board/grid.h"
#include "shell/arithmetic.h"
#include "shell/game.h"
#include "shell/timer_numbers.h"

namespace kr {

void MarkBorderRing(Game& g)
{
    for (int16_t cell = 0; cell < 100; ++cell) {
        if (!IsBorderRing(cell)) continue;
        ui::Control& image = *g.screen.Cells[static_cast<size_t>(cell)];
        image.picture = g.screen.Cells[0]->picture;
        image.enabled = false;
        g.Board[static_cast<size_t>(cell)] = BORDER;
    }
}

void ShowCell(Game& g, int16_t cell)
{
    const size_t c = static_cast<size_t>(cell);
    g.screen.Cells[c]->picture = ui::Palette(g.GreenFlag[c] ? kGreenBulletPicture : g.Board[c]);
}

void StartBoardFill(Game& g)
{
    for (int16_t cell = 11; cell <= 88; ++cell)
        if (IsPlayable(cell)) g.screen.Cells[static_cast<size_t>(cell)]->picture = ui::Palette(kNoPicture);
    g.FillCounter = 99;
    g.timers[kFillTimer].SetEnabled(true);
}

void GenerateCell(Game& g, int16_t cell)
{
    const size_t c = static_cast<size_t>(cell);
    auto at = [&](size_t i) { return g.Board[i]; };
    for (;;) {
        const float r = g.random.Draw();
        const int16_t n = Round16(r * 100.0f, "GenerateCell");
        const bool green = n == 100;
        const int16_t kind = green ? kBrownBullet : static_cast<int16_t>(n % kGemKinds);
        g.GreenFlag[c] = green;
        g.Board[c] = kind;
        const bool rowRun = at(c + 1) == kind && at(c + 2) == kind;
        // Row 8's c + 20 lies past the grid; c + 10 is the border there, so the pair can only
        // match when c + 10 holds the kind.
        const bool columnRun = at(c + 10) == kind && at(c + 20) == kind;
        if (!rowRun && !columnRun) break;
    }
    ShowCell(g, cell);
}

void FillTick(Game& g)
{
    while (IsBorderRing(g.FillCounter)) --g.FillCounter;
    GenerateCell(g, g.FillCounter);
    --g.FillCounter;
    if (g.FillCounter != 10) return;
    g.timers[kFillTimer].SetEnabled(false);
    // A fill that ends under the stage-done pause or the failure must neither start the bomb clock
    // nor hand the board back to the player.
    const bool ending = g.timers[kStageDonePause].Enabled() || g.timers[kFailureTimer].Enabled();
    if (g.BombPresent && !ending) g.timers[kBombClock].SetEnabled(true);
    if (NothingRunning(g.timers)) g.InputReady = true;
}

}  // namespace kr
