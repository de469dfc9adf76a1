#include "shell/events.h"

#include "board/fill.h"
#include "board/moves.h"
#include "board/resolve.h"
#include "board/swap.h"
#include "combat/effects.h"
#include "combat/enemy.h"
#include "combat/outcome.h"
#include "hero/levelup.h"
#include "shell/briefing.h"
#include "shell/game.h"
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
    Screen& s = g.ui;
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
    for (size_t cell = 0; cell < g.ui.Cells.size(); ++cell)
        g.ui.Cells[cell]->onMouseDown = [&g, cell] { CellPressed(g, static_cast<int16_t>(cell)); };
}

void ConnectTimers(Game& g)
{
    OnTick(g, 1, FillTick);
    OnTick(g, 2, SwapTick);
    OnTick(g, 3, BlastTick);
    OnTick(g, 4, FallTick);
    OnTick(g, 5, TypewriterTick);
    OnTick(g, 6, BombClockTick);
    OnTick(g, 7, StageDoneTick);
    OnTick(g, 8, NoMovesTick);
    OnTick(g, 9, FailureTick);
    OnTick(g, 10, DamageRiseTick);
    OnTick(g, 11, EnemyAttackTick);
    OnTick(g, 12, HitMarkerTick);
    OnTick(g, 16, HintTimerTick);
}

}  // namespace

void ConnectHandlers(Game& g)
{
    ConnectMenus(g);
    ConnectBoard(g);
    ConnectTimers(g);
}

}  // namespace kr
