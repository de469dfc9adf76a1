#include "shell/briefing.h"

#include "combat/stage.h"
#include "hero/bullet_time.h"
#include "hero/targeting.h"
#include "shell/arithmetic.h"
#include "shell/game.h"
#include "shell/timer_numbers.h"
#include "shell/texts.h"
#include "shell/tutorial.h"

namespace kr {
namespace {

// Length in bytes of the UTF-8 character that starts with `lead`.
size_t CharacterLength(unsigned char lead)
{
    if (lead < 0x80) return 1;
    if ((lead >> 5) == 0x6) return 2;
    if ((lead >> 4) == 0xE) return 3;
    return 4;
}

// Typing goes on into the hidden label; no one sees it, so the window need not wake for each letter.
void TypeOnUnseen(Game& g) { g.timers[kTypewriterTimer].unseen = true; }

}  // namespace

void EnableMissionButtons(Game& g)
{
    for (size_t i = 0; i < g.screen.MissionButtons.size(); ++i)
        g.screen.MissionButtons[i]->enabled = g.UnlockedMissions > static_cast<int>(i);
}

int16_t MaxHealthFor(int16_t mission, int16_t endurance)
{
    const int16_t base = To16(10 * mission + 30, "MaxHealthFor");
    const int16_t product = To16(To16(endurance * 25, "MaxHealthFor") * base, "MaxHealthFor");
    return Round16(base + product / 100.0, "MaxHealthFor");
}

void MissionChosen(Game& g, int16_t mission)
{
    if (mission >= 0 && mission <= 9) g.BriefingText = kBriefings[static_cast<size_t>(mission)];
    g.MaxHealth = MaxHealthFor(mission, g.Endurance);
    g.screen.MissionMenuScreen->visible = false;
    g.screen.BriefingScreen->visible = true;
    g.screen.BriefingLabel->caption.clear();
    g.timers[kTypewriterTimer].SetEnabled(true);
    g.timers[kTypewriterTimer].unseen = false;
    g.MissionStage = 0;
    g.ChosenMission = mission;
}

void TypewriterTick(Game& g)
{
    if (g.BriefingText.empty()) {
        g.timers[kTypewriterTimer].SetEnabled(false);
        return;
    }
    const size_t length = std::min(CharacterLength(static_cast<unsigned char>(g.BriefingText[0])), g.BriefingText.size());
    g.screen.BriefingLabel->caption += g.BriefingText.substr(0, length);
    g.BriefingText.erase(0, length);
}

void StartMissionClicked(Game& g)
{
    g.screen.BriefingScreen->visible = false;
    TypeOnUnseen(g);
    g.screen.MissionMenuScreen->visible = false;
    PlaceTutorialPanel(g);
    // Nothing paid for in another mission carries into this one: no armed target, no slow time, no deadly
    // bullets.
    ClearTargeting(g);
    EndBulletTime(g);
    g.DeadlyBulletsTurns = 0;
    const int16_t firstStage = 0;
    SetUpStage(g, g.ChosenMission, firstStage);
}

void BriefingBackClicked(Game& g)
{
    g.screen.BriefingScreen->visible = false;
    TypeOnUnseen(g);
    g.screen.MissionMenuScreen->visible = true;
}

}  // namespace kr
