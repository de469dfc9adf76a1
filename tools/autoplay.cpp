#include "tools/autoplay.h"

#include <utility>

#include "board/resolve.h"
#include "shell/game.h"

namespace kr {
namespace {

void ClickAt(Game& g, const ui::Control& control)
{
    const ui::Rect bounds = g.form.Bounds(control);
    const float x = bounds.left + bounds.width / 2;
    const float y = bounds.top + bounds.height / 2;
    g.form.MouseDown(x, y);
    g.form.MouseUp(x, y);
}

}  // namespace

std::optional<std::pair<int16_t, int16_t>> FirstMatchingSwap(const BoardCells& board)
{
    static const std::array<bool, 100> kNoGreens{};
    for (int16_t cell = 11; cell <= 88; ++cell) {
        if (!IsGem(board[static_cast<size_t>(cell)])) continue;
        for (int16_t step : {int16_t{1}, int16_t{10}}) {
            const int16_t other = static_cast<int16_t>(cell + step);
            if (!IsGem(board[static_cast<size_t>(other)])) continue;
            BoardCells swapped = board;
            std::swap(swapped[static_cast<size_t>(cell)], swapped[static_cast<size_t>(other)]);
            if (!FindRuns(swapped, kNoGreens).empty()) return std::pair{cell, other};
        }
    }
    return std::nullopt;
}

MissionResult PlayMission(Game& g, int mission, int64_t limit)
{
    MissionResult result;
    ClickAt(g, *g.screen.PlayButton);
    ClickAt(g, *g.screen.MissionButtons[static_cast<size_t>(mission)]);
    ClickAt(g, *g.screen.StartMission);
    const int64_t start = g.timers.Now();
    while (g.timers.Now() - start < limit) {
        if (g.screen.MissionCompleteScreen->visible) {
            result.won = true;
            break;
        }
        if (g.screen.MenuLayer->visible && g.screen.MissionMenuScreen->visible) break;
        if (g.InputReady && !g.screen.MenuLayer->visible) {
            const auto swap = FirstMatchingSwap(g.Board).value_or(std::pair<int16_t, int16_t>{11, 12});
            ClickAt(g, *g.screen.Cells[static_cast<size_t>(swap.first)]);
            ClickAt(g, *g.screen.Cells[static_cast<size_t>(swap.second)]);
            // Presses that started no swap (say, a selection left from before) must not spin: let time pass.
            if (!g.InputReady) {
                ++result.moves;
                continue;
            }
        }
        const std::optional<int64_t> next = g.timers.NextDue();
        if (!next) break;
        g.timers.AdvanceTo(*next);
    }
    result.milliseconds = g.timers.Now() - start;
    return result;
}

}  // namespace kr
