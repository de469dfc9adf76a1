#include "board/targets.h"

#include <vector>

#include "board/grid.h"
#include "board/resolve.h"
#include "board/swap.h"
#include "combat/effects.h"
#include "hero/targeting.h"
#include "shell/arithmetic.h"
#include "shell/game.h"
#include "shell/sound.h"

namespace kr {
namespace {

// The ring is never part of the field: a grenade near the edge hits it, and it is put back.
void RepairBorder(Game& g)
{
    for (int16_t cell = 0; cell < 100; ++cell) {
        if (!IsBorderRing(cell)) continue;
        g.Board[static_cast<size_t>(cell)] = BORDER;
        g.screen.Cells[static_cast<size_t>(cell)]->picture = ui::Palette(kBorderPicture);
    }
}

}  // namespace

std::vector<int> GrenadeArea(int c)
{
    std::vector<int> area{c, c - 1, c + 1, c - 10, c - 11, c - 9, c + 9, c + 10, c + 11};
    if (ColumnOf(c) != 1) area.push_back(c - 2);
    if (ColumnOf(c) != 8) area.push_back(c + 2);
    if (c >= 20) area.push_back(c - 20);
    if (c < 80) area.push_back(c + 20);
    return area;
}

void BoardPressed(Game& g, int16_t cell)
{
    if (!g.InputReady || !IsPlayable(cell)) return;
    if (g.GrenadePending) {
        ThrowGrenade(g, cell);
        return;
    }
    if (g.BlastPending) {
        BlastKind(g, cell);
        return;
    }
    CellPressed(g, cell);
}

void ThrowGrenade(Game& g, int16_t cell)
{
    g.GrenadePending = false;
    ShowBoardPointer(g);
    int bullets = 0;
    for (int hit : GrenadeArea(cell)) {
        if (g.Board[static_cast<size_t>(hit)] == kBrownBullet) ++bullets;
        ClearCell(g, static_cast<int16_t>(hit));
    }
    RepairBorder(g);
    StartBlast(g);
    const int16_t damage = Round16((g.Strength * 0.5 + 1) * bullets, "ThrowGrenade");
    g.InputReady = false;
    if (g.SoundOn == 1) PlayBoom(g);
    // The enemy takes the grenade's damage as it is: ShootEnemy adds the accuracy back, and greens count nothing.
    const int16_t amount = To16(damage - g.Accuracy, "ThrowGrenade");
    const int16_t noGreens = 0;
    ShootEnemy(g, amount, noGreens);
}

void BlastKind(Game& g, int16_t cell)
{
    const int16_t kind = g.Board[static_cast<size_t>(cell)];
    for (int16_t i = 11; i <= 88; ++i)
        if (i != cell && g.Board[static_cast<size_t>(i)] == kind) ClearCell(g, i);
    ClearCell(g, cell);
    StartBlast(g);
    if (g.SoundOn == 1) PlayBoom(g);
    g.InputReady = false;
    g.BlastPending = false;
    ShowBoardPointer(g);
}

}  // namespace kr
