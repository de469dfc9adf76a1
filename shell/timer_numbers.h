#pragma once
#include <string>

#include "shell/arithmetic.h"
#include "ui/timers.h"

namespace kr {

// The window's sixteen timers by what they carry. The numbers are the timers' own (Timer1..Timer16):
// ticks due at the same moment run in this order.
enum TimerNumber : int {
    kFillTimer = 1,
    kSwapTimer = 2,
    kBlastTimer = 3,
    kFallTimer = 4,
    kTypewriterTimer = 5,
    kBombClock = 6,
    kStageDonePause = 7,
    kNoMovesTimer = 8,
    kFailureTimer = 9,
    kRiseTimer = 10,
    kAttackTimer = 11,
    kMarkerTimer = 12,
    kTargetBlinkTimer = 13,
    kBulletTimeDuration = 14,
    kBulletTimeBar = 15,
    kHintTimer = 16,
};

// The bomb clock's pace outside Bullet Time.
inline constexpr int kNormalBombInterval = 100;

// True when nothing animates and no pause, failure or enemy attack runs, so the board may take presses again.
inline bool NothingRunning(const ui::TimerBank& timers)
{
    for (int timer : {kFillTimer, kSwapTimer, kBlastTimer, kFallTimer, kStageDonePause, kFailureTimer, kAttackTimer})
        if (timers[timer].Enabled()) return false;
    return true;
}

// An animating timer keeps the steps it has left as a number in its tag.
inline void StartCountdown(ui::Timer& timer, int steps)
{
    timer.tag = std::to_string(steps);
    timer.SetEnabled(true);
}

// The step the tag holds; the tag keeps one less.
inline int16_t TakeStep(ui::Timer& timer)
{
    const int16_t step = TagNumber(timer.tag);
    timer.tag = std::to_string(step - 1);
    return step;
}

}  // namespace kr
