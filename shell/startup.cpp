#include "shell/startup.h"

#include "board/fill.h"
#include "hero/skills.h"
#include "shell/game.h"
#include "shell/events.h"
#include "shell/progress.h"
#include "shell/timer_numbers.h"
#include "shell/sound.h"
#include "shell/texts.h"
#include "shell/tutorial.h"

namespace kr {

void StartUp(Game& g, uint32_t seed)
{
    ConnectHandlers(g);
    // The hint timer runs from the moment the window exists.
    g.timers[kHintTimer].SetEnabled(true);
    g.random.Seed(seed);

    for (size_t page = 1; page < kTutorialTexts.size(); ++page) g.TutorialTexts[page] = kTutorialTexts[page];
    ShowHint(g, DrawFirstHint(g));

    OpenSoundChannels(g);
    FillSkillCost(g);

    if (!LoadProgress(g)) g.host.messages.ShowOk(LoadFailureMessage(g));

    g.screen.MainMenuScreen->left = 2280;
    g.screen.MainMenuScreen->top = 960;
    g.screen.BriefingScreen->left = 1560;
    g.screen.BriefingScreen->top = 1560;

    g.Resources.fill(0);
    g.InputReady = false;
    g.SelectedCell = -1;
    // Cells are drawn flat by the host: no 3-D edge to remove.

    for (ui::Control* plus : g.screen.PlusLabels) plus->top -= 30;
    for (ui::Control* pip : g.screen.AttributePips) {
        pip->left += 30;
        pip->top += 10;
        pip->width = 195;
        pip->height = 195;
    }
    for (size_t s = 1; s < g.screen.SkillIcons.size(); ++s) g.screen.SkillIcons[s]->top += 40;

    for (ui::Control* icon : g.screen.ResourceIcons) icon->visible = false;
    MarkBorderRing(g);

    g.screen.MenuLayer->left = 0;
    g.screen.MenuLayer->top = 0;
}

}  // namespace kr
