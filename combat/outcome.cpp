#include "combat/outcome.h"

#include <string>

#include "combat/stage.h"
#include "hero/levelup.h"
#include "shell/arithmetic.h"
#include "shell/game.h"
#include "shell/timer_numbers.h"
#include "shell/sound.h"

namespace kr {
namespace {

// "Zadanie wykonane!" and "Misja nieudana!" each blink ten times, 700 ms apart.
constexpr int kBlinks = 10;

// Toggles a blinking label and counts the timer's tag down; true when the count has run out.
bool BlinkAndCount(ui::Timer& timer, ui::Control& label)
{
    label.visible = !label.visible;
    const int16_t left = static_cast<int16_t>(TagNumber(timer.tag) - 1);
    timer.tag = std::to_string(left);
    if (left != 0) return false;
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
    g.ui.MissionFailedLabel->visible = true;
    ui::Timer& failure = g.timers[kFailureTimer];
    failure.tag = std::to_string(kBlinks);
    failure.SetEnabled(true);
    if (g.SoundOn == 1) PlayDefeat(g);
    g.timers[kBombClock].SetEnabled(false);
}

void FailureTick(Game& g)
{
    if (!BlinkAndCount(g.timers[kFailureTimer], *g.ui.MissionFailedLabel)) return;
    g.ui.MenuLayer->visible = true;
    g.ui.MissionMenuScreen->visible = true;
}

void CheckStageDone(Game& g)
{
    // A hero who died on this turn has lost, whatever the turn also finished.
    if (FailureRunning(g)) return;
    if (g.BombRequired || g.TerminalRequired || g.EnemyRequired) return;
    ui::Timer& pause = g.timers[kStageDonePause];
    pause.tag = std::to_string(kBlinks);
    pause.SetEnabled(true);
    g.timers[kBombClock].SetEnabled(false);
    g.timers[kAttackTimer].SetEnabled(false);
    g.form.pointer = ui::CursorPicture(ui::NormalCursor);
    if (g.SoundOn == 1) PlayGoalDone(g);
    g.ui.StageDoneLabel->visible = true;
    g.InputReady = false;
}

void StageDoneTick(Game& g)
{
    if (!BlinkAndCount(g.timers[kStageDonePause], *g.ui.StageDoneLabel)) return;
    ++g.MissionStage;
    SetUpStage(g, g.ChosenMission, g.MissionStage);
}

void ShowMissionComplete(Game& g, const int16_t& mission)
{
    g.ui.MenuLayer->visible = true;
    g.ui.MissionCompleteScreen->visible = true;
    if (g.SoundOn == 1) PlayMissionDone(g);
    g.ui.MissionCompleteButton->tag = std::to_string(mission);
}

void MissionCompleteClicked(Game& g)
{
    g.ui.MissionCompleteScreen->visible = false;
    const int16_t mission = TagNumber(g.ui.MissionCompleteButton->tag);
    PrepareLevelUp(g, mission);
}

}  // namespace kr
