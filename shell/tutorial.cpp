#include "shell/tutorial.h"

#include <string>

#include "shell/arithmetic.h"
#include "shell/game.h"
#include "shell/timer_numbers.h"

namespace kr {
namespace {

// round(r x n) redrawn while 0 or n: uniform over 1..n-1.
int16_t DrawPage(Game& g, int n)
{
    for (;;) {
        const int16_t k = Round16(g.random.Draw() * static_cast<float>(n), "DrawPage");
        if (k != 0 && k != n) return k;
    }
}

}  // namespace

int16_t DrawFirstHint(Game& g) { return DrawPage(g, 14); }

void ShowHint(Game& g, int16_t page)
{
    g.screen.HintLabel->caption = g.TutorialTexts[static_cast<size_t>(page)];
    g.screen.PageLabel->caption = std::to_string(page);
    g.TutorialPage = page;
}

void NextHint(Game& g)
{
    ShowHint(g, g.TutorialPage == 14 ? int16_t{1} : static_cast<int16_t>(g.TutorialPage + 1));
    g.timers[kHintTimer].Restart();
}

void PreviousHint(Game& g)
{
    ShowHint(g, g.TutorialPage == 1 ? int16_t{14} : static_cast<int16_t>(g.TutorialPage - 1));
    g.timers[kHintTimer].Restart();
}

void HintTimerTick(Game& g) { ShowHint(g, DrawPage(g, 15)); }

void CloseHints(Game& g) { g.screen.TutorialPanel->top = 5000; }

void PlaceTutorialPanel(Game& g)
{
    if (g.TutorialOn == 1) {
        g.screen.TutorialPanel->left = 120;
        g.screen.TutorialPanel->top = 120;
    } else {
        g.screen.TutorialPanel->top = 2000;
    }
}

}  // namespace kr
