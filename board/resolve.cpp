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

bool NothingRunning(const Game& g)
{
    for (int timer : {kFillTimer, kSwapTimer, kBlastTimer, kFallTimer, kStageDonePause, kFailureTimer, kAttackTimer})
        if (g.timers[timer].Enabled()) return false;
    return true;
}

void ResolveBoard(Game& g)
{
    BoardCells working = g.Board;
    const std::vector<Run> runs = FindRuns(g.Board, g.GreenFlag);
    for (const Run& run : runs) {
        g.SwapUnmatched = false;
        ApplyRunEffects(g, run.kind, run.power, run.greens);
        for (int n = 0; n <= run.power; ++n) {
            const size_t cell = static_cast<size_t>(run.first + run.step * n);
            working[cell] = CLEARED;
            g.ui.Cells[cell]->picture = ui::Palette(kFirstBlastPicture);
        }
    }
    g.Board = working;
    for (size_t cell = 0; cell < g.Board.size(); ++cell)
        if (g.Board[cell] == CLEARED) g.GreenFlag[cell] = false;
    if (runs.empty()) {
        TurnEnd(g);
        return;
    }
    ui::Timer& blast = g.timers[kBlastTimer];
    blast.tag = "8";
    blast.SetEnabled(true);
}

void BlastTick(Game& g)
{
    ui::Timer& blast = g.timers[kBlastTimer];
    const int step = TagNumber(blast.tag);
    blast.tag = std::to_string(step - 1);
    if (step <= 5) {
        blast.SetEnabled(false);
        g.timers[kFallTimer].SetEnabled(true);
        return;
    }
    // Frames 12, 13, then nothing: the marking already showed frame 11.
    const int picture = step == 8 ? 12 : step == 7 ? 13 : kNoPicture;
    for (size_t cell = 11; cell <= 88; ++cell)
        if (g.Board[cell] == CLEARED) g.ui.Cells[cell]->picture = ui::Palette(picture);
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
        g.ui.Cells[i - 10]->picture = ui::Palette(kNoPicture);
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
