#include "combat/outcome.h"

#include <string>

#include "combat/stage.h"
#include "hero/levelup.h"
#include "hero/targeting.h"
#include "shell/arithmetic.h"
#include "shell/game.h"
#include "shell/timer_numbers.h"
#include "shell/sound.h"

namespace kr {
namespace {

// "Zadanie wykonane!" and "Misja nieudana!" each blink ten times, 700 ms apart.
constexpr int kBlinks = 10;

// Toggles a blinking label and takes a step of the timer's count; true when the count has run out.
bool BlinkAndCount(ui::Timer& timer, ui::Control& label)
{
    label.visible = !label.visible;
    if (TakeStep(timer) != 1) return false;
    timer.SetEnabled(false);
    label.visible = false;
    return true;
}

}  // namespace

bool FailureRunning(const Game& g) { return g.timers[kFailureTimer].Enabled(); }

void StartFailure(Game& g)
{
    g.InputReady = false;
    if (FailureRunning(g)) return;
    g.screen.MissionFailedLabel->visible = true;
    StartCountdown(g.timers[kFailureTimer], kBlinks);
    if (g.SoundOn == 1) PlayDefeat(g);
    g.timers[kBombClock].SetEnabled(false);
}

void FailureTick(Game& g)
{
    if (!BlinkAndCount(g.timers[kFailureTimer], *g.screen.MissionFailedLabel)) return;
    g.screen.MenuLayer->visible = true;
    g.screen.MissionMenuScreen->visible = true;
}

void CheckStageDone(Game& g)
{
    // A hero who died on this turn has lost, whatever the turn also finished.
    if (FailureRunning(g)) return;
    if (g.BombRequired || g.TerminalRequired || g.EnemyRequired) return;
    StartCountdown(g.timers[kStageDonePause], kBlinks);
    g.timers[kBombClock].SetEnabled(false);
    g.timers[kAttackTimer].SetEnabled(false);
    ShowBoardPointer(g);
    if (g.SoundOn == 1) PlayGoalDone(g);
    g.screen.StageDoneLabel->visible = true;
    g.InputReady = false;
}

void StageDoneTick(Game& g)
{
    if (!BlinkAndCount(g.timers[kStageDonePause], *g.screen.StageDoneLabel)) return;
    ++g.MissionStage;
    SetUpStage(g, g.ChosenMission, g.MissionStage);
}

void ShowMissionComplete(Game& g, const int16_t& mission)
{
    g.screen.MenuLayer->visible = true;
    g.screen.MissionCompleteScreen->visible = true;
    if (g.SoundOn == 1) PlayMissionDone(g);
    g.screen.MissionCompleteButton->tag = std::to_string(mission);
}

void MissionCompleteClicked(Game& g)
{
    g.screen.MissionCompleteScreen->visible = false;
    const int16_t mission = TagNumber(g.screen.MissionCompleteButton->tag);
    PrepareLevelUp(g, mission);
}

}  // namespace kr
