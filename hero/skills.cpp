#include "hero/skills.h"

#include "combat/effects.h"
#include "combat/enemy.h"
#include "combat/outcome.h"
#include "hero/bullet_time.h"
#include "hero/panel.h"
#include "hero/targeting.h"
#include "shell/arithmetic.h"
#include "shell/game.h"
#include "shell/sound.h"

namespace kr {
namespace {

// Price of each skill by resource row: grey bullet, wrench, red cross, crosshair, grenade.
constexpr int16_t kPrices[kSkillCount][kResourceRows] = {
    {2, 0, 0, 1, 1},  // "Celny strzał"
    {0, 2, 1, 1, 0},  // "Teleport"
    {1, 2, 1, 2, 0},  // "Bullet Time"
    {2, 0, 0, 0, 4},  // "Rzut granatem"
    {0, 2, 4, 0, 0},  // "Leczenie"
    {1, 1, 0, 1, 3},  // "Wybuch"
    {5, 0, 0, 5, 0},  // "Śmiercionośne naboje"
};

// The green border promised the hero can pay, so no counter goes below zero.
void Spend(Game& g, int skill)
{
    for (int row = 0; row < kResourceRows; ++row) {
        int16_t& counter = g.Resources[static_cast<size_t>(kResourceRowKind[row])];
        counter = To16(counter - CostOf(g, skill, row), "Spend");
    }
}

void AimedShot(Game& g)
{
    const int16_t roll = Round16(g.random.Draw() * 100.0f, "AimedShot");
    const int16_t tier = roll < 34 ? 1 : roll < 67 ? 2 : 3;
    if (g.SoundOn == 1) PlayShot(g);
    // ShootEnemy adds the accuracy back: the enemy loses the tier plus the strength.
    const int16_t amount = To16(tier + g.Strength - g.Accuracy, "AimedShot");
    const int16_t noGreens = 0;
    ShootEnemy(g, amount, noGreens);
    Spend(g, kAimedShot);
    g.ImmobilisedTurns = 2;
    RefreshHeroPanel(g);
    CheckStageDone(g);
}

void Teleport(Game& g)
{
    g.TeleportPending = true;
    ShowBoardPointer(g);
    Spend(g, kTeleport);
    RefreshHeroPanel(g);
}

void BulletTime(Game& g)
{
    StartBulletTime(g);
    Spend(g, kBulletTime);
    if (g.SoundOn == 1) PlayBulletTime(g);
    RefreshHeroPanel(g);
}

void Grenade(Game& g)
{
    Spend(g, kGrenade);
    g.GrenadePending = true;
    ShowBoardPointer(g);
    RefreshHeroPanel(g);
}

void Healing(Game& g)
{
    Spend(g, kHealing);
    const int16_t roll = Round16(g.random.Draw() * static_cast<float>((g.Intelligence + 1) * 5), "Healing");
    const int16_t amount = To16(roll + g.Intelligence * 5 + 10, "Healing");
    HealHero(g, amount);
    RefreshHeroPanel(g);
    // Healing in a fight costs the hero a turn.
    if (g.EnemyPresent) EnemyTurnGate(g, TurnKind::Heal);
}

void Blast(Game& g)
{
    g.BlastPending = true;
    ShowBoardPointer(g);
    Spend(g, kBlast);
    RefreshHeroPanel(g);
}

void DeadlyBullets(Game& g)
{
    if (g.SoundOn == 1) PlayReload(g);
    // A second use while active starts the three moves again; it does not add to them.
    g.DeadlyBulletsTurns = 3;
    Spend(g, kDeadlyBullets);
    RefreshHeroPanel(g);
}

}  // namespace

void FillSkillCost(Game& g)
{
    for (int row = 0; row < kResourceRows; ++row)
        for (int skill = 0; skill < kSkillCount; ++skill)
            g.SkillCost[static_cast<size_t>(row * kSkillCount + skill)] = kPrices[skill][row];
}

int16_t CostOf(const Game& g, int skill, int row) { return g.SkillCost[static_cast<size_t>(row * kSkillCount + skill)]; }

void UseSkill(Game& g, const int16_t& skill)
{
    if (!g.InputReady || skill < 0 || skill >= kSkillCount) return;
    if (!g.screen.SkillHighlight[static_cast<size_t>(skill)]->visible) return;
    switch (skill) {
    case kAimedShot: AimedShot(g); break;
    case kTeleport: Teleport(g); break;
    case kBulletTime: BulletTime(g); break;
    case kGrenade: Grenade(g); break;
    case kHealing: Healing(g); break;
    case kBlast: Blast(g); break;
    default: DeadlyBullets(g); break;
    }
}

}  // namespace kr
