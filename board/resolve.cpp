#include "board/resolve.h"

#include <string>

#include "board/fill.h"
#include "board/moves.h"
#include "combat/effects.h"
#include "combat/enemy.h"
#include "combat/outcome.h"
#include "hero/panel.h"
#include "shell/arithmetic.h"
#include "shell/game.h"
#include "shell/timer_numbers.h"
#include "shell/sound.h"

namespace kr {
namespace {

constexpr int kFirstBlastPicture = 11;

// Counts the cells equal to `first` from it on by `step`, up to 7 more; the greens include the first cell.
Run Measure(const BoardCells& board, const std::array<bool, 100>& greenFlag, int first, int step)
{
    const int16_t kind = board[static_cast<size_t>(first)];
    Run run{kind, static_cast<int16_t>(first), static_cast<int16_t>(step), 0,
            static_cast<int16_t>(greenFlag[static_cast<size_t>(first)] ? 1 : 0)};
    for (int j = 1; j <= 7; ++j) {
        const int cell = first + step * j;
        if (cell >= 100 || board[static_cast<size_t>(cell)] != kind) break;
        if (greenFlag[static_cast<size_t>(cell)]) ++run.greens;
        ++run.power;
    }
    return run;
}

}  // namespace

std::vector<Run> FindRuns(const BoardCells& board, const std::array<bool, 100>& greenFlag)
{
    std::vector<Run> runs;
    for (int i = 11; i <= 88;) {
        const Run run = Measure(board, greenFlag, i, 1);
        if (run.power >= 2 && IsGem(run.kind)) runs.push_back(run);
        i += run.power + 1;
    }
    for (int i = 11; i <= 88; ++i) {
        const int16_t kind = board[static_cast<size_t>(i)];
        // Only the top cell of a column run starts it, so each is found once.
        if (!IsGem(kind) || board[static_cast<size_t>(i - 10)] == kind) continue;
        const Run run = Measure(board, greenFlag, i, 10);
        if (run.power >= 2) runs.push_back(run);
    }
    return runs;
}

void ClearCell(Game& g, int16_t cell)
{
    const size_t c = static_cast<size_t>(cell);
    g.Board[c] = CLEARED;
    g.GreenFlag[c] = false;
    g.screen.Cells[c]->picture = ui::Palette(kFirstBlastPicture);
}

void StartBlast(Game& g) { StartCountdown(g.timers[kBlastTimer], 8); }

void ResolveBoard(Game& g)
{
    // Every run is found before any cell is cleared, so a cell shared by a row and a column counts in both.
    const std::vector<Run> runs = FindRuns(g.Board, g.GreenFlag);
    for (const Run& run : runs) {
        g.SwapUnmatched = false;
        ApplyRunEffects(g, run.kind, run.power, run.greens);
        for (int n = 0; n <= run.power; ++n) ClearCell(g, static_cast<int16_t>(run.first + run.step * n));
    }
    if (runs.empty()) {
        TurnEnd(g);
        return;
    }
    StartBlast(g);
}

void BlastTick(Game& g)
{
    ui::Timer& blast = g.timers[kBlastTimer];
    const int step = TakeStep(blast);
    if (step <= 5) {
        blast.SetEnabled(false);
        g.timers[kFallTimer].SetEnabled(true);
        return;
    }
    // Frames 12, 13, then nothing: the marking already showed frame 11.
    const int picture = step == 8 ? 12 : step == 7 ? 13 : kNoPicture;
    for (size_t cell = 11; cell <= 88; ++cell)
        if (g.Board[cell] == CLEARED) g.screen.Cells[cell]->picture = ui::Palette(picture);
}

void FallTick(Game& g)
{
    bool moved = false;
    for (size_t i = 88; i >= 21; --i) {
        if (g.Board[i] != CLEARED) continue;
        moved = true;
        g.Board[i] = g.Board[i - 10];
        g.Board[i - 10] = CLEARED;
        g.GreenFlag[i] = g.GreenFlag[i - 10];
        g.GreenFlag[i - 10] = false;
        if (g.Board[i] != CLEARED) ShowCell(g, static_cast<int16_t>(i));
        g.screen.Cells[i - 10]->picture = ui::Palette(kNoPicture);
    }
    for (size_t i = 11; i <= 18; ++i) {
        if (g.Board[i] != CLEARED) continue;
        moved = true;
        const int16_t n = Round16(g.random.Draw() * 100.0f, "FallTick");
        // No draw is rejected here: new icons may complete runs, which is how cascades arise.
        const bool green = n > 98;
        g.Board[i] = green ? kBrownBullet : static_cast<int16_t>(n % kGemKinds);
        g.GreenFlag[i] = green;
        ShowCell(g, static_cast<int16_t>(i));
    }
    if (moved) return;
    ResolveBoard(g);
    g.timers[kFallTimer].SetEnabled(false);
}

void TurnEnd(Game& g)
{
    if (g.SwapUnmatched) {
        g.Health = To16(g.Health - Round16(g.MaxHealth / 3.0, "TurnEnd"), "TurnEnd");
        if (g.SoundOn == 1) PlayPenalty(g);
    }
    g.InputReady = true;
    EnemyTurnGate(g, TurnKind::Move);
    RefreshHeroPanel(g);
    if (sprawdz(g))
        CheckStageDone(g);
    else
        RenewBoard(g);
}

}  // namespace kr
