#include "shell/game.h"

namespace kr {
namespace {

// Design intervals of Timer1..Timer16.
constexpr int kIntervals[ui::TimerBank::kCount] = {30, 30, 45, 75, 10, 100, 700, 2000,
                                                   700, 100, 200, 800, 150, 7500, 200, 30000};

}  // namespace

Game::Game(Host services, std::filesystem::path progress) : host(services), progressFile(std::move(progress))
{
    BuildScreen(form, screen);
    for (int number = 1; number <= ui::TimerBank::kCount; ++number)
        timers[number].SetInterval(kIntervals[number - 1]);
}

}  // namespace kr
