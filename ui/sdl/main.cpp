#define SDL_MAIN_HANDLED
#include <chrono>
#include <exception>
#include <iostream>

#include "shell/game.h"
#include "shell/startup.h"
#include "ui/sdl/assets.h"
#include "ui/sdl/display.h"
#include "ui/sdl/game_window.h"
#include "ui/sdl/handles.h"
#include "ui/sdl/message_boxes.h"
#include "ui/sdl/mixer_sound.h"

namespace {

uint32_t SeedFromClock()
{
    const auto ticks = std::chrono::system_clock::now().time_since_epoch().count();
    return static_cast<uint32_t>(static_cast<uint64_t>(ticks) ^ (static_cast<uint64_t>(ticks) >> 32));
}

}  // namespace

int main()
{
    using namespace kr;
    SDL_SetMainReady();
    try {
        const sdl::Subsystem video(SDL_INIT_VIDEO);
        if (!sdl::HasDisplay()) {
            // No window can show this.
            std::cerr << "Kruszarka: nie znaleziono ekranu (ustaw DISPLAY) / no display found (set DISPLAY)\n";
            return 1;
        }
        const sdl::Assets assets = sdl::Assets::BesideExecutable();
        sdl::MixerSound sound(assets);
        sdl::SdlMessageBoxes messages;
        Game game{Host{messages, sound}};
        sdl::GameWindow gameWindow(game, assets, sdl::ChooseScale());
        messages.SetParent(gameWindow.Handle());
        StartUp(game, SeedFromClock());
        if (game.quitRequested) return 0;
        gameWindow.Show();
        gameWindow.Redraw();
        sound.Start();
        gameWindow.Run();
        return 0;
    } catch (const std::exception& error) {
        // Anything thrown here is a bug in the game: say so once, and stop. The window is gone by now.
        sdl::ShowFatalError(error.what());
        return 1;
    }
}
