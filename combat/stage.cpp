#include "combat/stage.h"

#include "board/fill.h"
#include "combat/catalogue.h"
#include "combat/outcome.h"
#include "hero/panel.h"
#include "shell/game.h"
#include "shell/timer_numbers.h"
#include "shell/sound.h"

namespace kr {
namespace {

constexpr float kSlotTops[3] = {0, 2220, 4440};

void CopyObjectPicture(Game& g, int panel, int16_t picture)
{
    if (picture == kKeepPicture) return;
    g.screen.GoalPicture[static_cast<size_t>(panel)]->picture = g.screen.ObjectPictures[static_cast<size_t>(picture)]->picture;
}

void SetGoals(Game& g, const StageGoals& goals)
{
    if (goals.bomb.need != Need::Absent) {
        g.BombPresent = true;
        g.BombRequired = goals.bomb.need == Need::Required;
        g.BombWork = goals.bomb.work;
        g.BombTicks = goals.bomb.ticks;
        CopyObjectPicture(g, kBombPanel, goals.bomb.picture);
    }
    if (goals.enemy.need != Need::Absent) {
        g.EnemyPresent = true;
        g.EnemyRequired = goals.enemy.need == Need::Required;
        g.EnemyHealth = goals.enemy.health;
        g.EnemyAttack = goals.enemy.attack;
        g.EnemyHitChance = goals.enemy.hitChance;
        g.screen.GoalPicture[kEnemyPanel]->picture =
            g.screen.EnemyPortraits[static_cast<size_t>(goals.enemy.portrait)]->picture;
    }
    if (goals.terminal.need != Need::Absent) {
        g.TerminalPresent = true;
        g.TerminalRequired = goals.terminal.need == Need::Required;
        g.TerminalWork = goals.terminal.work;
        CopyObjectPicture(g, kTerminalPanel, goals.terminal.picture);
    }
}

void PlacePanels(Game& g)
{
    const bool present[3] = {g.BombPresent, g.EnemyPresent, g.TerminalPresent};
    const bool required[3] = {g.BombRequired, g.EnemyRequired, g.TerminalRequired};
    size_t slot = 0;
    auto place = [&](int panel, bool framed) {
        ui::Control& frame = *g.screen.GoalPanel[static_cast<size_t>(panel)];
        frame.left = 6840;
        frame.top = kSlotTops[slot++];
        frame.visible = true;
        if (framed) g.screen.RequiredFrame[static_cast<size_t>(panel)]->visible = true;
    };
    for (int panel = 0; panel < 3; ++panel)
        if (required[panel]) place(panel, true);
    for (int panel = 0; panel < 3; ++panel)
        if (present[panel] && !required[panel]) place(panel, false);
}

}  // namespace

void SetUpStage(Game& g, const int16_t& mission, const int16_t& stage)
{
    g.screen.SelectionMarker->visible = false;
    for (size_t s = 0; s < g.screen.SkillFrames.size(); ++s)
        g.screen.SkillFrames[s]->visible = g.UnlockedMissions > static_cast<int>(s);
    g.Resources.fill(0);
    g.Health = g.MaxHealth;
    RefreshHeroPanel(g);

    for (size_t panel = 0; panel < 3; ++panel) {
        g.screen.GoalPanel[panel]->visible = false;
        g.screen.DoneFrame[panel]->visible = false;
        g.screen.RequiredFrame[panel]->visible = false;
    }
    ui::Control* const fills[4] = {g.screen.BombWorkBar, g.screen.BombTimeBar, g.screen.EnemyHealthBar, g.screen.TerminalWorkBar};
    for (size_t bar = 0; bar < g.screen.BarOutlines.size(); ++bar) fills[bar]->width = g.screen.BarOutlines[bar]->width;
    g.BombPresent = g.EnemyPresent = g.TerminalPresent = false;
    g.BombRequired = g.EnemyRequired = g.TerminalRequired = false;
    g.ImmobilisedTurns = 0;
    // The unmatched swap this flag remembers was made on a board that is about to go.
    g.SwapUnmatched = false;

    const auto stages = StagesOf(mission);
    if (stage >= 0 && static_cast<size_t>(stage) < stages.size()) {
        SetGoals(g, stages[static_cast<size_t>(stage)]);
    } else if (!stages.empty() && static_cast<size_t>(stage) == stages.size()) {
        ShowMissionComplete(g, mission);
        return;
    }

    g.screen.MenuLayer->visible = false;
    PlacePanels(g);
    g.InputReady = false;
    if (g.SoundOn == 1) PlayStart(g);
    // A bomb clock left running by the last stage must not tick into this one's fill.
    g.timers[kBombClock].SetEnabled(false);
    StartBoardFill(g);
}

}  // namespace kr
