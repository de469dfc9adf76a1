#include "shell/screens.h"

#include "combat/enemy.h"
#include "hero/descriptions.h"
#include "hero/targeting.h"
#include "shell/briefing.h"
#include "shell/game.h"
#include "shell/timer_numbers.h"
#include "shell/progress.h"

namespace kr {
namespace {

void SetCheckBox(ui::Control& box, int16_t value, void (*clicked)(Game&), Game& g)
{
    // Setting a check box runs its click handler when the value changes, as a click would.
    const int16_t state = value == 1 ? int16_t{1} : int16_t{0};
    if (box.value == state) return;
    box.value = state;
    clicked(g);
}

}  // namespace

void KeyDown(Game& g, int keyCode)
{
    if (g.screen.MenuLayer->visible) return;
    switch (keyCode) {
    case kEscapeKey: g.screen.ReturnPrompt->visible = !g.screen.ReturnPrompt->visible; break;
    case kKeyN: g.screen.ReturnPrompt->visible = false; break;
    case kKeyT: ReturnToMenu(g); break;
    default: break;
    }
}

void ReturnToMenu(Game& g)
{
    g.screen.ReturnPrompt->visible = false;
    g.screen.MenuLayer->visible = true;
    g.screen.MainMenuScreen->visible = true;
    StopMissionClocks(g);
    // The stage-done pause, the failure and the enemy's attack belong to the mission being left:
    // left running they would carry on under the menu.
    for (int timer : {kStageDonePause, kFailureTimer, kAttackTimer}) g.timers[timer].SetEnabled(false);
    g.screen.StageDoneLabel->visible = false;
    g.screen.MissionFailedLabel->visible = false;
    ClearTargeting(g);
}

void PlayClicked(Game& g)
{
    EnableMissionButtons(g);
    g.screen.MainMenuScreen->visible = false;
    g.screen.MissionMenuScreen->visible = true;
}

void OptionsClicked(Game& g)
{
    g.screen.HeroSummary->caption = HeroAttributesText(g);
    g.screen.HeroSummary->visible = true;
    SetCheckBox(*g.screen.SoundBox, g.SoundOn, SoundBoxClicked, g);
    SetCheckBox(*g.screen.TutorialBox, g.TutorialOn, TutorialBoxClicked, g);
    g.screen.MainMenuScreen->visible = false;
    g.screen.OptionsScreen->visible = true;
}

void ExitClicked(Game& g) { g.quitRequested = true; }

void MissionMenuBackClicked(Game& g)
{
    g.screen.MissionMenuScreen->visible = false;
    g.screen.MainMenuScreen->visible = true;
}

void SoundBoxClicked(Game& g) { g.SoundOn = g.screen.SoundBox->value; }

void TutorialBoxClicked(Game& g) { g.TutorialOn = g.screen.TutorialBox->value; }

void ResetClicked(Game& g)
{
    if (!g.host.messages.AskYesNo("Resetowanie postaci",
                                  "Czy na pewno chcesz zresetować postępy w grze i zacząć wszystko od nowa?"))
        return;
    g.Strength = g.Dexterity = g.Intelligence = g.Accuracy = g.Endurance = 0;
    g.UnlockedMissions = 1;
    SaveProgress(g);
    g.screen.HeroSummary->caption = HeroAttributesText(g);
    g.screen.HeroSummary->visible = true;
}

void OptionsBackClicked(Game& g)
{
    SaveProgress(g);
    g.screen.OptionsScreen->visible = false;
    g.screen.MainMenuScreen->visible = true;
}


}  // namespace kr
