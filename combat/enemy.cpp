#include "combat/enemy.h"

#include <string>

#include "combat/outcome.h"
#include "combat/stage.h"
#include "hero/bullet_time.h"
#include "hero/panel.h"
#include "hero/targeting.h"
#include "shell/arithmetic.h"
#include "shell/game.h"
#include "shell/timer_numbers.h"
#include "shell/sound.h"

namespace kr {
namespace {

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
        g.screen.DamageLabel->caption = std::to_string(damage);
        g.screen.DamageLabel->visible = true;
    } else if (g.SoundOn == 1) {
        PlayMiss(g);
    }
    g.screen.DamageLabel->top = g.screen.HealthLabel->top;
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
    StartCountdown(g.timers[kAttackTimer], 4);
}

void EnemyAttackTick(Game& g)
{
    ui::Timer& attack = g.timers[kAttackTimer];
    ui::Control& frame = *g.screen.RequiredFrame[kEnemyPanel];
    if (TakeStep(attack) > 0) {
        frame.visible = !frame.visible;
        return;
    }
    Fire(g);
    if (!g.EnemyRequired) frame.visible = false;
    attack.SetEnabled(false);
    // A hero killed by this shot, or a renewal still filling, keeps the board locked.
    if (NothingRunning(g.timers)) g.InputReady = true;
    ShowBoardPointer(g);
}

void StopMissionClocks(Game& g)
{
    for (int timer = kFillTimer; timer <= kBombClock; ++timer) g.timers[timer].SetEnabled(false);
    EndBulletTime(g);
}

void BombClockTick(Game& g)
{
    g.BombTicks = To16(g.BombTicks - 1, "BombClockTick");
    if (g.BombTicks > 0) {
        ui::Control& bar = *g.screen.BombTimeBar;
        bar.width = static_cast<float>(static_cast<double>(bar.width) * g.BombTicks / (g.BombTicks + 1));
        return;
    }
    StartFailure(g);
    if (g.SoundOn == 1) PlayBoom(g);
    StopMissionClocks(g);
}

}  // namespace kr
