#include "hero/panel.h"

#include <string>

#include "combat/outcome.h"
#include "hero/skills.h"
#include "shell/game.h"

namespace kr {
namespace {

constexpr int kResourceCap = 6;
constexpr int kAimedShot = 0;
constexpr int kDeadlyBullets = 6;

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
    ui::Control& fill = *g.ui.HealthFill;
    const ui::Control& frame = *g.ui.HealthFrame;
    g.ui.HealthLabel->caption = std::to_string(g.Health);
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
        for (int k = 0; k < 6; ++k) g.ui.ResourceIcons[static_cast<size_t>(6 * row + k)]->visible = k < shown;
    }

    for (int skill = 0; skill < kSkillCount; ++skill)
        g.ui.SkillHighlight[static_cast<size_t>(skill)]->visible = Affordable(g, skill);
    if (!g.EnemyPresent) {
        g.ui.SkillHighlight[kAimedShot]->visible = false;
        g.ui.SkillHighlight[kDeadlyBullets]->visible = false;
    }
}

}  // namespace kr
