#include "shell/events.h"

#include <functional>

#include "board/fill.h"
#include "board/moves.h"
#include "board/resolve.h"
#include "board/swap.h"
#include "board/targets.h"
#include "combat/effects.h"
#include "combat/enemy.h"
#include "combat/outcome.h"
#include "hero/bullet_time.h"
#include "hero/descriptions.h"
#include "hero/levelup.h"
#include "hero/skills.h"
#include "hero/targeting.h"
#include "shell/briefing.h"
#include "shell/game.h"
#include "shell/timer_numbers.h"
#include "shell/screens.h"
#include "shell/tutorial.h"

namespace kr {
namespace {

void OnClick(ui::Control* control, Game& g, void (*handler)(Game&))
{
    control->onClick = [&g, handler] { handler(g); };
}

void OnTick(Game& g, int timer, void (*handler)(Game&))
{
    g.timers[timer].onTick = [&g, handler] { handler(g); };
}

void ConnectMenus(Game& g)
{
    Screen& s = g.screen;
    OnClick(s.PlayButton, g, PlayClicked);
    OnClick(s.OptionsButton, g, OptionsClicked);
    OnClick(s.ExitButton, g, ExitClicked);
    OnClick(s.MissionMenuBack, g, MissionMenuBackClicked);
    for (size_t i = 0; i < s.MissionButtons.size(); ++i)
        s.MissionButtons[i]->onClick = [&g, i] { MissionChosen(g, static_cast<int16_t>(i)); };
    OnClick(s.StartMission, g, StartMissionClicked);
    OnClick(s.BriefingBack, g, BriefingBackClicked);
    OnClick(s.SoundBox, g, SoundBoxClicked);
    OnClick(s.TutorialBox, g, TutorialBoxClicked);
    OnClick(s.ResetButton, g, ResetClicked);
    OnClick(s.OptionsBack, g, OptionsBackClicked);
    OnClick(s.MissionCompleteButton, g, MissionCompleteClicked);
    for (size_t r = 0; r < s.PlusLabels.size(); ++r)
        s.PlusLabels[r]->onClick = [&g, r] { PlusClicked(g, static_cast<int>(r)); };
    OnClick(s.LevelUpOk, g, LevelUpOkClicked);
    OnClick(s.PreviousHint, g, PreviousHint);
    OnClick(s.NextHint, g, NextHint);
    OnClick(s.CloseHints, g, CloseHints);
    g.form.onKeyDown = [&g](int key) { KeyDown(g, key); };
}

void ConnectBoard(Game& g)
{
    for (size_t cell = 0; cell < g.screen.Cells.size(); ++cell)
        g.screen.Cells[cell]->onMouseDown = [&g, cell] { BoardPressed(g, static_cast<int16_t>(cell)); };
}

// Every control that stands for a skill: its frame, its icon and its six price slots.
void ForEachSkillControl(Screen& s, const std::function<void(ui::Control&, int16_t)>& each)
{
    for (size_t k = 0; k < s.SkillFrames.size(); ++k) {
        each(*s.SkillFrames[k], static_cast<int16_t>(k));
        each(*s.SkillIcons[k], static_cast<int16_t>(k));
    }
    for (size_t slot = 0; slot < s.CostIcons.size(); ++slot)
        each(*s.CostIcons[slot], SkillOfCostSlot(static_cast<int>(slot)));
}

// A skill is used by a press on any of its controls, or by a click on a "5x".
void ConnectSkills(Game& g)
{
    ForEachSkillControl(g.screen, [&g](ui::Control& control, int16_t skill) {
        control.onMouseDown = [&g, skill] { UseSkill(g, skill); };
    });
    for (ui::Control* label : g.screen.FiveTimesLabels) label->onClick = [&g] { UseSkill(g, kDeadlyBullets); };
}

// Moving over a skill or the hero describes it; moving over the board or a background clears the text.
void ConnectDescriptions(Game& g)
{
    Screen& s = g.screen;
    ForEachSkillControl(s, [&g](ui::Control& control, int16_t skill) {
        control.onMouseMove = [&g, skill] { ShowSkillDescription(g, skill); };
    });
    for (ui::Control* label : s.FiveTimesLabels) label->onMouseMove = [&g] { ShowSkillDescription(g, kDeadlyBullets); };

    const auto hero = [&g] { ShowHeroAttributes(g); };
    s.HeroPanel->onMouseMove = hero;
    s.HeroPortrait->onMouseMove = hero;
    for (ui::Control* icon : s.ResourceIcons) icon->onMouseMove = hero;

    const auto clear = [&g] { ClearDescription(g); };
    g.form.onBackgroundMouseMove = clear;
    s.SkillPanel->onMouseMove = clear;
    for (ui::Control* cell : s.Cells) cell->onMouseMove = clear;

    for (size_t r = 0; r < s.PlusLabels.size(); ++r) {
        const auto row = static_cast<int>(r);
        const auto attribute = [&g, row] { ShowAttributeDescription(g, row); };
        s.LevelUpLabels[r + 1]->onMouseMove = attribute;
        s.PlusLabels[r]->onMouseMove = attribute;
    }
}

void ConnectTimers(Game& g)
{
    OnTick(g, kFillTimer, FillTick);
    OnTick(g, kSwapTimer, SwapTick);
    OnTick(g, kBlastTimer, BlastTick);
    OnTick(g, kFallTimer, FallTick);
    OnTick(g, kTypewriterTimer, TypewriterTick);
    OnTick(g, kBombClock, BombClockTick);
    OnTick(g, kStageDonePause, StageDoneTick);
    OnTick(g, kNoMovesTimer, NoMovesTick);
    OnTick(g, kFailureTimer, FailureTick);
    OnTick(g, kRiseTimer, DamageRiseTick);
    OnTick(g, kAttackTimer, EnemyAttackTick);
    OnTick(g, kMarkerTimer, HitMarkerTick);
    OnTick(g, kTargetBlinkTimer, TargetBlinkTick);
    OnTick(g, kBulletTimeDuration, BulletTimeTick);
    OnTick(g, kBulletTimeBar, BulletTimeBarTick);
    OnTick(g, kHintTimer, HintTimerTick);
}

}  // namespace

void ConnectHandlers(Game& g)
{
    ConnectMenus(g);
    ConnectBoard(g);
    ConnectSkills(g);
    ConnectDescriptions(g);
    ConnectTimers(g);
}

}  // namespace kr
