#include "tools/autoplay.h"

#include <algorithm>
#include <numeric>
#include <utility>
#include <vector>

#include "board/resolve.h"
#include "board/targets.h"
#include "hero/bullet_time.h"
#include "hero/skills.h"
#include "shell/game.h"
#include "shell/timer_numbers.h"

namespace kr {
namespace {

// An icon that will enter at the top: not known yet, so it matches nothing.
constexpr int16_t kUnknown = -3;

void ClickAt(Game& g, const ui::Control& control)
{
    const ui::Rect bounds = g.form.Bounds(control);
    const float x = bounds.left + bounds.width / 2;
    const float y = bounds.top + bounds.height / 2;
    g.form.MouseDown(x, y);
    g.form.MouseUp(x, y);
}

void PressCell(Game& g, int cell) { ClickAt(g, *g.screen.Cells[static_cast<size_t>(cell)]); }

// Icons above each cleared cell drop into it; what is left open at the top is unknown.
void Fall(BoardCells& board, std::array<bool, 100>& greens)
{
    for (int column = 1; column <= 8; ++column) {
        int write = 80 + column;
        for (int read = 80 + column; read > 10; read -= 10) {
            if (board[static_cast<size_t>(read)] == CLEARED) continue;
            board[static_cast<size_t>(write)] = board[static_cast<size_t>(read)];
            greens[static_cast<size_t>(write)] = greens[static_cast<size_t>(read)];
            write -= 10;
        }
        for (; write > 10; write -= 10) {
            board[static_cast<size_t>(write)] = kUnknown;
            greens[static_cast<size_t>(write)] = false;
        }
    }
}

// Engineering goes whole to the first goal in need: required bomb, required terminal, bomb, terminal.
struct WorkTarget {
    int left = 0;
    double weight = 0;
};

WorkTarget EngineeringTarget(const Game& g)
{
    const bool bomb = g.BombRequired || (!g.TerminalRequired && g.BombPresent);
    const bool terminal = !bomb && (g.TerminalRequired || g.TerminalPresent);
    if (bomb) return {g.BombWork, g.BombRequired ? 4.0 : 1.0};
    if (terminal) return {g.TerminalWork, g.TerminalRequired ? 3.0 : 0.5};
    return {};
}

// The next two enemy shots at their strongest could kill.
bool InDanger(const Game& g) { return g.EnemyPresent && g.Health <= g.EnemyAttack * 12 / 10 * 2 + 1; }

bool Usable(const Game& g, int skill)
{
    const size_t s = static_cast<size_t>(skill);
    return g.screen.SkillFrames[s]->visible && g.screen.SkillHighlight[s]->visible;
}

int ResourcesHeld(const Game& g) { return std::accumulate(g.Resources.begin(), g.Resources.end(), 0); }

// Uses a skill through its icon, as a player would; true when it was paid for.
bool Use(Game& g, int skill, MissionResult& result)
{
    const int before = ResourcesHeld(g);
    ClickAt(g, *g.screen.SkillIcons[static_cast<size_t>(skill)]);
    if (ResourcesHeld(g) == before) return false;
    ++result.skills;
    return true;
}

int BrownBulletsAround(const Game& g, int cell)
{
    const std::vector<int> area = GrenadeArea(cell);
    return static_cast<int>(std::count_if(area.begin(), area.end(),
                                          [&](int hit) { return g.Board[static_cast<size_t>(hit)] == kBrownBullet; }));
}

// Whether the icon at `cell` stands in a line of three equal icons, across or down.
bool InRun(const BoardCells& board, int cell)
{
    const int16_t kind = board[static_cast<size_t>(cell)];
    if (!IsGem(kind)) return false;
    for (int step : {1, 10}) {
        int length = 1;
        for (int at = cell - step; at >= 0 && board[static_cast<size_t>(at)] == kind; at -= step) ++length;
        for (int at = cell + step; at < 100 && board[static_cast<size_t>(at)] == kind; at += step) ++length;
        if (length >= 3) return true;
    }
    return false;
}

// The value of exchanging two cells, or -1 when the exchange lines up nothing.
double SwapValue(const Game& g, int from, int to)
{
    BoardCells board = g.Board;
    std::array<bool, 100> greens = g.GreenFlag;
    std::swap(board[static_cast<size_t>(from)], board[static_cast<size_t>(to)]);
    std::swap(greens[static_cast<size_t>(from)], greens[static_cast<size_t>(to)]);
    // Only the two exchanged icons can start a run on a board that had none.
    if (!InRun(board, from) && !InRun(board, to)) return -1;
    return Value(g, Foresee(g, board, greens));
}

// The most rewarding swap of any two cells, for "Teleport".
std::optional<SwapChoice> BestTeleport(const Game& g)
{
    std::optional<SwapChoice> best;
    for (int16_t a = 11; a <= 88; ++a)
        for (int16_t b = static_cast<int16_t>(a + 1); b <= 88; ++b) {
            if (!IsPlayable(a) || !IsPlayable(b)) continue;
            if (g.Board[static_cast<size_t>(a)] == g.Board[static_cast<size_t>(b)]) continue;
            const double value = SwapValue(g, a, b);
            if (value >= 0 && (!best || value > best->value)) best = SwapChoice{a, b, value};
        }
    return best;
}

// The kind whose removal by "Wybuch" brings the most through the icons that fall after it, and its value.
std::pair<int, double> BestBlastCell(const Game& g)
{
    std::pair<int, double> best{0, -1};
    for (int16_t kind = 0; kind < kGemKinds; ++kind) {
        BoardCells board = g.Board;
        std::array<bool, 100> greens = g.GreenFlag;
        int cell = 0;
        for (int i = 11; i <= 88; ++i)
            if (board[static_cast<size_t>(i)] == kind) {
                board[static_cast<size_t>(i)] = CLEARED;
                cell = i;
            }
        if (cell == 0) continue;
        Fall(board, greens);
        const double value = Value(g, Foresee(g, board, greens));
        if (value > best.second) best = {cell, value};
    }
    return best;
}

// One helpful skill, if any, measured against the best neighbour swap; true when one was used (and its target
// pressed).
bool UseHelpfulSkill(Game& g, const std::optional<SwapChoice>& best, MissionResult& result)
{
    const int missing = g.MaxHealth - g.Health;
    if (Usable(g, kHealing) && missing >= 12 && (2 * g.Health <= g.MaxHealth || InDanger(g)))
        return Use(g, kHealing, result);
    if (Usable(g, kAimedShot) && g.ImmobilisedTurns == 0) return Use(g, kAimedShot, result);
    if (Usable(g, kDeadlyBullets) && g.DeadlyBulletsTurns == 0 && g.EnemyHealth > 8)
        return Use(g, kDeadlyBullets, result);
    if (Usable(g, kBulletTime) && !BulletTimeRunning(g) && (g.BombPresent || (g.EnemyPresent && g.EnemyHealth > 20)))
        return Use(g, kBulletTime, result);
    if (Usable(g, kGrenade) && g.EnemyPresent) {
        int target = 0, most = 1;
        for (int cell = 11; cell <= 88; ++cell)
            if (IsPlayable(cell) && BrownBulletsAround(g, cell) > most) {
                most = BrownBulletsAround(g, cell);
                target = cell;
            }
        if (target != 0 && Use(g, kGrenade, result)) {
            PressCell(g, target);
            ++result.moves;
            return true;
        }
    }
    const double ordinary = best ? best->value : 0;
    if (Usable(g, kTeleport)) {
        const std::optional<SwapChoice> far = BestTeleport(g);
        if (far && far->value > ordinary * 1.5 + 6 && Use(g, kTeleport, result)) {
            PressCell(g, far->from);
            PressCell(g, far->to);
            ++result.moves;
            return true;
        }
    }
    if (Usable(g, kBlast)) {
        const auto [cell, value] = BestBlastCell(g);
        if (value > ordinary + 4 && Use(g, kBlast, result)) {
            PressCell(g, cell);
            ++result.moves;
            return true;
        }
    }
    return false;
}

// A failure comes from the bomb when it went off, else from the hero's health.
Ending LossOf(const Game& g) { return g.BombPresent && g.BombTicks <= 0 ? Ending::Bomb : Ending::EnemyFire; }

}  // namespace

MoveYield Foresee(const Game& g, BoardCells board, std::array<bool, 100> greens)
{
    MoveYield yield;
    // A cascade that keeps going past a few rounds is rare enough not to matter here.
    for (int round = 0; round < 6; ++round) {
        const std::vector<Run> runs = FindRuns(board, greens);
        if (runs.empty()) break;
        for (const Run& run : runs) {
            const int power = run.power;
            if (run.kind == kBrownBullet) {
                const int amount = g.DeadlyBulletsTurns > 0 ? (g.Strength + 2) * power : power;
                yield.damage += (amount + g.Accuracy) * (run.greens + 1);
            } else {
                yield.resources += power - 1;
                if (run.kind == 4) yield.work += power + g.Dexterity;
                if (run.kind == 5) yield.healing += power + g.Intelligence;
            }
            for (int n = 0; n <= power; ++n) {
                int16_t& cell = board[static_cast<size_t>(run.first + run.step * n)];
                if (cell != CLEARED) ++yield.cells;
                cell = CLEARED;
            }
        }
        Fall(board, greens);
    }
    return yield;
}

double Value(const Game& g, const MoveYield& yield)
{
    double value = 0;
    if (g.EnemyPresent) {
        value += (g.EnemyRequired ? 3.0 : 1.5) * std::min<int>(yield.damage, g.EnemyHealth);
        // A dead enemy shoots no more.
        if (yield.damage >= g.EnemyHealth) value += 40;
    }
    const WorkTarget work = EngineeringTarget(g);
    if (work.weight > 0) {
        value += work.weight * std::min(yield.work, work.left);
        if (yield.work >= work.left) value += 10 * work.weight;
    }
    const int healed = std::min(yield.healing, std::max(0, g.MaxHealth - g.Health));
    value += (InDanger(g) ? 3.0 : 0.7) * healed;
    return value + 0.6 * yield.resources + 0.05 * yield.cells;
}

std::optional<SwapChoice> BestSwap(const Game& g)
{
    std::optional<SwapChoice> best;
    for (int16_t cell = 11; cell <= 88; ++cell) {
        if (!IsGem(g.Board[static_cast<size_t>(cell)])) continue;
        for (int16_t step : {int16_t{1}, int16_t{10}}) {
            const auto other = static_cast<int16_t>(cell + step);
            if (!IsPlayable(other) || !IsGem(g.Board[static_cast<size_t>(other)])) continue;
            const double value = SwapValue(g, cell, other);
            if (value >= 0 && (!best || value > best->value)) best = SwapChoice{cell, other, value};
        }
    }
    return best;
}

MissionResult PlayMission(Game& g, int mission, int64_t limit)
{
    MissionResult result;
    ClickAt(g, *g.screen.PlayButton);
    ClickAt(g, *g.screen.MissionButtons[static_cast<size_t>(mission)]);
    ClickAt(g, *g.screen.StartMission);
    // A mission that is not open yet never starts: nothing to play.
    if (g.screen.MenuLayer->visible) return result;
    const int64_t start = g.timers.Now();
    while (g.timers.Now() - start < limit) {
        if (g.screen.MissionCompleteScreen->visible) {
            result.ending = Ending::Won;
            break;
        }
        if (g.timers[kFailureTimer].Enabled()) {
            result.ending = LossOf(g);
            break;
        }
        if (g.InputReady && !g.screen.MenuLayer->visible) {
            // A selection left over (a board target keeps it) would turn the next press into a deselection.
            if (g.screen.SelectionMarker->visible) PressCell(g, g.SelectedCell);
            const std::optional<SwapChoice> swap = BestSwap(g);
            if (UseHelpfulSkill(g, swap, result)) continue;
            if (swap) {
                PressCell(g, swap->from);
                PressCell(g, swap->to);
                ++result.moves;
                if (!g.InputReady) continue;
            }
        }
        // Presses that started nothing must not spin: let time pass.
        const std::optional<int64_t> next = g.timers.NextDue();
        if (!next) break;
        g.timers.AdvanceTo(*next);
    }
    result.milliseconds = g.timers.Now() - start;
    return result;
}

}  // namespace kr
