#include "shell/screens.h"

#include "combat/enemy.h"
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
    if (g.ui.MenuLayer->visible) return;
    switch (keyCode) {
    case kEscapeKey: g.ui.ReturnPrompt->visible = !g.ui.ReturnPrompt->visible; break;
    case kKeyN: g.ui.ReturnPrompt->visible = false; break;
    case kKeyT: ReturnToMenu(g); break;
    default: break;
    }
}

void ReturnToMenu(Game& g)
{
    g.ui.ReturnPrompt->visible = false;
    g.ui.MenuLayer->visible = true;
    g.ui.MainMenuScreen->visible = true;
    StopMissionClocks(g);
    // The stage-done pause, the failure and the enemy's attack belong to the mission being left:
    // left running they would carry on under the menu.
    for (int timer : {kStageDonePause, kFailureTimer, kAttackTimer}) g.timers[timer].SetEnabled(false);
    g.ui.StageDoneLabel->visible = false;
    g.ui.MissionFailedLabel->visible = false;
    g.form.pointer = ui::CursorPicture(ui::NormalCursor);
}

void PlayClicked(Game& g)
{
    EnableMissionButtons(g);
    g.ui.MainMenuScreen->visible = false;
    g.ui.MissionMenuScreen->visible = true;
}

void OptionsClicked(Game& g)
{
    g.ui.HeroSummary->caption = HeroSummaryText(g);
    g.ui.HeroSummary->visible = true;
    SetCheckBox(*g.ui.SoundBox, g.SoundOn, SoundBoxClicked, g);
    SetCheckBox(*g.ui.TutorialBox, g.TutorialOn, TutorialBoxClicked, g);
    g.ui.MainMenuScreen->visible = false;
    g.ui.OptionsScreen->visible = true;
}

void ExitClicked(Game& g) { g.quitRequested = true; }

void MissionMenuBackClicked(Game& g)
{
    g.ui.MissionMenuScreen->visible = false;
    g.ui.MainMenuScreen->visible = true;
}

void SoundBoxClicked(Game& g) { g.SoundOn = g.ui.SoundBox->value; }

void TutorialBoxClicked(Game& g) { g.TutorialOn = g.ui.TutorialBox->value; }

void ResetClicked(Game& g)
{
    if (!g.host.messages.AskYesNo("Resetowanie postaci",
                                  "Czy na pewno chcesz zresetować postępy w grze i zacząć wszystko od nowa?"))
        return;
    g.Strength = g.Dexterity = g.Intelligence = g.Accuracy = g.Endurance = 0;
    g.UnlockedMissions = 1;
    SaveProgress(g);
    g.ui.HeroSummary->caption = HeroSummaryText(g);
    g.ui.HeroSummary->visible = true;
}

void OptionsBackClicked(Game& g)
{
    SaveProgress(g);
    g.ui.OptionsScreen->visible = false;
    g.ui.MainMenuScreen->visible = true;
}

std::string HeroSummaryText(const Game& g)
{
    return "MOC:          " + std::to_string(g.Strength) + "\r\n" +
           "ZRĘCZNOŚĆ:    " + std::to_string(g.Dexterity) + "\r\n" +
           "CELNOŚĆ:      " + std::to_string(g.Accuracy) + "\r\n" +
           "WYTRZYMAŁOŚĆ: " + std::to_string(g.Endurance) + "\r\n" +
           "INTELIGENCJA: " + std::to_string(g.Intelligence);
}

}  // namespace kr
