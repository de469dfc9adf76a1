#include "tools/soak_invariants.h"

#include <charconv>

#include "board/grid.h"
#include "shell/game.h"
#include "shell/timer_numbers.h"

namespace kr::soak {
namespace {

std::string Cell(size_t i) { return "cell " + std::to_string(i); }

// A running sequence's step, -1 when it is stopped; its tag counts down from the start.
int Step(const Game& g, int timer)
{
    const ui::Timer& t = g.timers[timer];
    if (!t.Enabled()) return -1;
    int step = 0;
    std::from_chars(t.tag.data(), t.tag.data() + t.tag.size(), step);
    return step;
}

// A sequence that was running and now shows a higher step was started again over itself.
std::optional<std::string> Restarted(const char* what, int before, int now)
{
    if (before >= 0 && now > before)
        return std::string(what) + " started again while it ran (step " + std::to_string(before) + " -> " +
               std::to_string(now) + ")";
    return std::nullopt;
}

}  // namespace

std::optional<std::string> BoardBroken(const Game& g)
{
    for (size_t i = 0; i < g.Board.size(); ++i) {
        const int16_t value = g.Board[i];
        if (IsBorderRing(static_cast<int>(i))) {
            if (value != BORDER) return Cell(i) + " of the border ring holds " + std::to_string(value);
        } else if (!IsGem(value) && value != CLEARED) {
            return Cell(i) + " holds " + std::to_string(value);
        }
        if (g.GreenFlag[i] && value != kBrownBullet)
            return Cell(i) + " has a green flag on " + std::to_string(value);
    }
    return std::nullopt;
}

std::optional<std::string> Invariants::Check(const Game& g)
{
    if (std::optional<std::string> broken = BoardBroken(g)) return broken;
    const int64_t now = g.timers.Now();
    const bool menu = g.screen.MenuLayer->visible;
    if (g.InputReady) {
        // The board is handed back only at a turn's end or a fill's, both after the panel's refresh.
        for (size_t i = 11; i <= 88; ++i)
            if (g.Board[i] == CLEARED) return Cell(i) + " is still cleared while the board takes input";
        for (size_t kind = 0; kind < g.Resources.size(); ++kind)
            if (g.Resources[kind] < 0 || g.Resources[kind] > 6)
                return "resource " + std::to_string(kind) + " is " + std::to_string(g.Resources[kind]);
    }
    const int stageDone = Step(g, kStageDonePause), failure = Step(g, kFailureTimer);
    if (stageDone >= 0 && failure >= 0) return std::string("the stage-done pause and the failure run together");
    if (auto restarted = Restarted("the stage-done pause", stageDoneStep_, stageDone)) return restarted;
    if (auto restarted = Restarted("the failure sequence", failureStep_, failure)) return restarted;
    stageDoneStep_ = stageDone;
    failureStep_ = failure;
    if (menu || g.InputReady) lastResponsive_ = now;
    if (now - lastResponsive_ > softLockLimit_)
        return "no input and no menu for " + std::to_string(now - lastResponsive_) + " ms";
    return std::nullopt;
}

}  // namespace kr::soak
