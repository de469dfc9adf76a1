#include "hero/levelup.h"

#include "shell/briefing.h"
#include "shell/game.h"
#include "shell/progress.h"

namespace kr {
namespace {

constexpr int16_t kAttributeMaximum = 2;

// The attribute of each level-up row, in display order: MOC, ZRĘCZNOŚĆ, CELNOŚĆ, WYTRZYMAŁOŚĆ, INTELIGENCJA.
int16_t& AttributeOfRow(Game& g, int row)
{
    switch (row) {
    case 0: return g.Strength;
    case 1: return g.Dexterity;
    case 2: return g.Accuracy;
    case 3: return g.Endurance;
    default: return g.Intelligence;
    }
}

}  // namespace

void PrepareLevelUp(Game& g, const int16_t& mission)
{
    if (mission + 1 >= g.UnlockedMissions) {
        g.UnlockedMissions = static_cast<int16_t>(mission + 2);
        SaveProgress(g);
    }
    EnableMissionButtons(g);
    const int spent = g.Strength + g.Intelligence + g.Dexterity + g.Endurance + g.Accuracy;
    if (spent >= g.UnlockedMissions - 1) {
        g.screen.MissionMenuScreen->visible = true;
        return;
    }
    g.screen.LevelUpOk->visible = false;
    for (size_t i = 0; i < g.screen.AttributePips.size(); ++i) {
        if (i < g.screen.PlusLabels.size()) g.screen.PlusLabels[i]->visible = true;
        g.screen.AttributePips[i]->visible = false;
    }
    for (int row = 0; row < 5; ++row) {
        const int16_t points = AttributeOfRow(g, row);
        const size_t r = static_cast<size_t>(row);
        if (points > 0) g.screen.AttributePips[2 * r]->visible = true;
        // A hand-edited file may hold more than the cap: no "+" is ever offered from 2 up.
        if (points >= kAttributeMaximum) {
            g.screen.AttributePips[2 * r + 1]->visible = true;
            g.screen.PlusLabels[r]->visible = false;
        }
    }
    g.screen.LevelUpScreen->visible = true;
    g.screen.AttributeDescription->caption.clear();
    g.screen.AttributeDescription->visible = true;
}

void PlusClicked(Game& g, int row)
{
    int16_t& attribute = AttributeOfRow(g, row);
    ++attribute;
    const size_t r = static_cast<size_t>(row);
    g.screen.AttributePips[2 * r]->visible = true;
    if (attribute >= kAttributeMaximum) g.screen.AttributePips[2 * r + 1]->visible = true;
    for (ui::Control* plus : g.screen.PlusLabels) plus->visible = false;
    g.screen.AttributeDescription->visible = false;
    g.screen.LevelUpOk->visible = true;
}

void LevelUpOkClicked(Game& g)
{
    g.screen.LevelUpScreen->visible = false;
    g.screen.MissionMenuScreen->visible = true;
    SaveProgress(g);
}

}  // namespace kr
