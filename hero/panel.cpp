#include "hero/panel.h"

#include <string>

#include "combat/outcome.h"
#include "hero/skills.h"
#include "shell/game.h"

namespace kr {
namespace {

constexpr int kResourceCap = 6;

int16_t RowCounter(const Game& g, int row) { return g.Resources[static_cast<size_t>(kResourceRowKind[row])]; }

}  // namespace

bool Affordable(const Game& g, int skill)
{
    for (int row = 0; row < kResourceRows; ++row)
        if (CostOf(g, skill, row) > RowCounter(g, row)) return false;
    return true;
}

void RefreshHeroPanel(Game& g)
{
    ui::Control& fill = *g.screen.HealthFill;
    const ui::Control& frame = *g.screen.HealthFrame;
    g.screen.HealthLabel->caption = std::to_string(g.Health);
    if (g.Health > 0) {
        fill.height = static_cast<float>(static_cast<double>(frame.height) * g.Health / g.MaxHealth);
        fill.top = frame.top + frame.height - fill.height;
    } else {
        StartFailure(g);
        fill.height = 0;
        fill.top = frame.top + frame.height;
    }

    for (int16_t& counter : g.Resources)
        if (counter > kResourceCap) counter = kResourceCap;
    for (int row = 0; row < kResourceRows; ++row) {
        const int shown = RowCounter(g, row);
        for (int k = 0; k < 6; ++k) g.screen.ResourceIcons[static_cast<size_t>(6 * row + k)]->visible = k < shown;
    }

    for (int skill = 0; skill < kSkillCount; ++skill)
        g.screen.SkillHighlight[static_cast<size_t>(skill)]->visible = Affordable(g, skill);
    if (!g.EnemyPresent) {
        g.screen.SkillHighlight[kAimedShot]->visible = false;
        g.screen.SkillHighlight[kDeadlyBullets]->visible = false;
    }
    // A targeting skill already paid for cannot be paid for again before its target is pressed.
    if (g.TeleportPending) g.screen.SkillHighlight[kTeleport]->visible = false;
    if (g.GrenadePending) g.screen.SkillHighlight[kGrenade]->visible = false;
    if (g.BlastPending) g.screen.SkillHighlight[kBlast]->visible = false;
}

}  // namespace kr
