#include "combat/enemy.h"

#include <string>

#include "board/resolve.h"
#include "combat/outcome.h"
#include "combat/stage.h"
#include "hero/panel.h"
#include "shell/arithmetic.h"
#include "shell/game.h"
#include "shell/timer_numbers.h"
#include "shell/sound.h"

namespace kr {
namespace {

bool BulletTimeRunning(const Game& g) { return g.timers[kBulletTimeDuration].Enabled(); }

void Fire(Game& g)
{
    const int16_t roll = Round16(g.random.Draw() * 100.0f, "EnemyAttackTick");
    if (roll < g.EnemyHitChance) {
        const int16_t spread = Round16(20.0f - g.random.Draw() * 40.0f, "EnemyAttackTick");
        const int16_t product = To16(g.EnemyAttack * spread, "EnemyAttackTick");
        const int16_t damage = To16(g.EnemyAttack + Round16(product / 100.0, "EnemyAttackTick"), "EnemyAttackTick");
        g.Health = To16(g.Health - damage, "EnemyAttackTick");
        RefreshHeroPanel(g);
        if (g.SoundOn == 1) PlayShot(g);
        g.ui.DamageLabel->caption = std::to_string(damage);
        g.ui.DamageLabel->visible = true;
    } else if (g.SoundOn == 1) {
        PlayMiss(g);
    }
    g.ui.DamageLabel->top = g.ui.HealthLabel->top;
    g.timers[kRiseTimer].SetEnabled(true);
}

}  // namespace

void EnemyTurnGate(Game& g, TurnKind turn)
{
    if (turn == TurnKind::Move && g.DeadlyBulletsTurns > 0) --g.DeadlyBulletsTurns;
    if (g.ImmobilisedTurns > 0) {
        --g.ImmobilisedTurns;
        return;
    }
    g.EnemyAttackToggle = !g.EnemyAttackToggle;
    const bool onItsTurn = !BulletTimeRunning(g) || g.EnemyAttackToggle;
    const bool able = turn == TurnKind::Heal || (g.Health > 0 && g.EnemyPresent);
    if (onItsTurn && able) StartEnemyAttack(g);
}

void StartEnemyAttack(Game& g)
{
    g.InputReady = false;
    g.form.pointer = ui::CursorPicture(ui::EnemyTurnCursor);
    ui::Timer& attack = g.timers[kAttackTimer];
    attack.tag = "4";
    attack.SetEnabled(true);
}

void EnemyAttackTick(Game& g)
{
    ui::Timer& attack = g.timers[kAttackTimer];
    const int16_t blinksLeft = TagNumber(attack.tag);
    ui::Control& frame = *g.ui.RequiredFrame[kEnemyPanel];
    if (blinksLeft > 0) {
        attack.tag = std::to_string(blinksLeft - 1);
        frame.visible = !frame.visible;
        return;
    }
    Fire(g);
    if (!g.EnemyRequired) frame.visible = false;
    attack.SetEnabled(false);
    // A hero killed by this shot, or a renewal still filling, keeps the board locked.
    if (NothingRunning(g)) g.InputReady = true;
    g.form.pointer = ui::CursorPicture(ui::NormalCursor);
}

void StopMissionClocks(Game& g)
{
    for (int timer = kFillTimer; timer <= kBombClock; ++timer) g.timers[timer].SetEnabled(false);
    g.timers[kBombClock].SetInterval(kNormalBombInterval);
    g.timers[kBulletTimeBar].SetEnabled(false);
    g.ui.BulletTimeBar->visible = false;
    g.timers[kBulletTimeDuration].SetEnabled(false);
}

void BombClockTick(Game& g)
{
    g.BombTicks = To16(g.BombTicks - 1, "BombClockTick");
    if (g.BombTicks > 0) {
        ui::Control& bar = *g.ui.BombTimeBar;
        bar.width = static_cast<float>(static_cast<double>(bar.width) * g.BombTicks / (g.BombTicks + 1));
        return;
    }
    StartFailure(g);
    if (g.SoundOn == 1) PlayBoom(g);
    StopMissionClocks(g);
}

}  // namespace kr
