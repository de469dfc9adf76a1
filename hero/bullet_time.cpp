#include "hero/bullet_time.h"

#include <algorithm>

#include "shell/arithmetic.h"
#include "shell/game.h"
#include "shell/sound.h"
#include "shell/timer_numbers.h"

namespace kr {
namespace {

constexpr int kSlowBombInterval = 200;
constexpr float kBarLeft = 2400;
constexpr float kBarWidth = 3855;
constexpr float kBarStep = 52;

}  // namespace

bool BulletTimeRunning(const Game& g) { return g.timers[kBulletTimeDuration].Enabled(); }

void StartBulletTime(Game& g)
{
    g.EnemyAttackToggle = false;
    g.timers[kBombClock].SetInterval(kSlowBombInterval);
    // A second use starts the count of halves again; the timer itself keeps its pace.
    StartCountdown(g.timers[kBulletTimeDuration], 1);
    ui::Control& bar = *g.screen.BulletTimeBar;
    bar.left = kBarLeft;
    bar.width = kBarWidth;
    bar.visible = true;
    g.timers[kBulletTimeBar].SetEnabled(true);
}

void BulletTimeTick(Game& g)
{
    ui::Timer& duration = g.timers[kBulletTimeDuration];
    if (TagNumber(duration.tag) == 1) {
        duration.tag = "0";
        if (g.SoundOn == 1) PlayBulletTime(g);
        return;
    }
    EndBulletTime(g);
}

void BulletTimeBarTick(Game& g)
{
    // 75 ticks fit in the 15 s but the bar is gone after 74: it stops at nothing rather than turning inside out.
    ui::Control& bar = *g.screen.BulletTimeBar;
    const float width = std::max(0.0f, bar.width - kBarStep);
    bar.left += (bar.width - width) / 2;
    bar.width = width;
}

void EndBulletTime(Game& g)
{
    g.timers[kBulletTimeDuration].SetEnabled(false);
    g.timers[kBulletTimeBar].SetEnabled(false);
    g.screen.BulletTimeBar->visible = false;
    g.timers[kBombClock].SetInterval(kNormalBombInterval);
}

}  // namespace kr
