#pragma once

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

}  // namespace kr
