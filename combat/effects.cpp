#include "combat/effects.h"

#include <algorithm>

#include "board/grid.h"
#include "combat/stage.h"
#include "shell/arithmetic.h"
#include "shell/game.h"
#include "shell/timer_numbers.h"
#include "shell/sound.h"

namespace kr {
namespace {

void Sound(Game& g, void (*play)(Game&))
{
    if (g.SoundOn == 1) play(g);
}

// The bar keeps the proportion of what is left: its new width is left x width / (left + taken),
// computed in floating point from the current width (16 bits would overflow).
void ShrinkBar(ui::Control& bar, int16_t left, int16_t taken)
{
    bar.width = static_cast<float>(static_cast<double>(left) * bar.width / (left + taken));
}

void MarkGoalDone(Game& g, int panel, ui::Control& bar)
{
    g.screen.RequiredFrame[static_cast<size_t>(panel)]->visible = false;
    g.screen.DoneFrame[static_cast<size_t>(panel)]->visible = true;
    bar.width = 1;
}

}  // namespace

void ApplyRunEffects(Game& g, int16_t kind, int16_t power, int16_t greens)
{
    if (kind == 0 || kind == 2) Sound(g, PlayReload);
    if (kind == 3) Sound(g, PlayImpact);
    if (kind == 4) DoEngineering(g, power);
    if (kind == 5) HealHero(g, power);
    if (kind == kBrownBullet) {
        if (g.EnemyPresent) Sound(g, PlayShot);
        const int16_t amount =
            g.DeadlyBulletsTurns > 0 ? To16((g.Strength + 2) * power, "ApplyRunEffects") : power;
        ShootEnemy(g, amount, greens);
    }
    if (IsGem(kind) && kind != kBrownBullet) {
        int16_t& counter = g.Resources[static_cast<size_t>(kind)];
        counter = To16(counter + power - 1, "ApplyRunEffects");
    }
}

void ShootEnemy(Game& g, const int16_t& amount, const int16_t& greenTips)
{
    if (!g.EnemyPresent) {
        Sound(g, PlayImpact);
        return;
    }
    const int16_t damage = To16((amount + g.Accuracy) * (greenTips + 1), "ShootEnemy");
    ui::Control& bar = *g.screen.EnemyHealthBar;
    ui::Control& marker = *g.screen.HitMarker;
    if (bar.width < g.screen.BarOutlines[2]->width) {
        if (!marker.visible) {
            marker.left = bar.left + bar.width;
            marker.visible = true;
        }
        g.timers[kMarkerTimer].Restart();
    }
    g.EnemyHealth = To16(g.EnemyHealth - damage, "ShootEnemy");
    if (g.EnemyHealth > 0) {
        ShrinkBar(bar, g.EnemyHealth, damage);
    } else {
        g.EnemyPresent = false;
        g.EnemyRequired = false;
        MarkGoalDone(g, kEnemyPanel, bar);
    }
    g.screen.DamageLabel->top = g.screen.HealthLabel->top;
    g.screen.HeroShotFrame->visible = true;
    g.timers[kRiseTimer].SetEnabled(true);
}

void DoEngineering(Game& g, const int16_t& amount)
{
    const int16_t points = To16(amount + g.Dexterity, "DoEngineering");
    const bool bomb = g.BombRequired || (!g.TerminalRequired && g.BombPresent);
    const bool terminal = !bomb && (g.TerminalRequired || g.TerminalPresent);
    if (!bomb && !terminal) {
        Sound(g, PlayImpact);
        return;
    }
    Sound(g, PlayEngineer);
    int16_t& work = bomb ? g.BombWork : g.TerminalWork;
    ui::Control& bar = bomb ? *g.screen.BombWorkBar : *g.screen.TerminalWorkBar;
    work = To16(work - points, "DoEngineering");
    if (work > 0) {
        ShrinkBar(bar, work, points);
        return;
    }
    if (bomb) {
        g.BombPresent = false;
        g.BombRequired = false;
    } else {
        g.TerminalPresent = false;
        g.TerminalRequired = false;
    }
    MarkGoalDone(g, bomb ? kBombPanel : kTerminalPanel, bar);
}

void HealHero(Game& g, const int16_t& amount)
{
    Sound(g, g.Health >= g.MaxHealth ? PlayImpact : PlayHeal);
    const int16_t healed = To16(g.Health + amount + g.Intelligence, "HealHero");
    g.Health = std::min(healed, g.MaxHealth);
}

void DamageRiseTick(Game& g)
{
    ui::Control& label = *g.screen.DamageLabel;
    label.top -= 40;
    if (label.top < 200) g.screen.HeroShotFrame->visible = false;
    if (label.top < 50) {
        label.visible = false;
        g.timers[kRiseTimer].SetEnabled(false);
    }
}

void HitMarkerTick(Game& g)
{
    g.screen.HitMarker->visible = false;
    g.timers[kMarkerTimer].SetEnabled(false);
}

}  // namespace kr
