#define SDL_MAIN_HANDLED
#include <chrono>
#include <exception>
#include <iostream>
#include <optional>
#include <string>

#include "shell/game.h"
#include "shell/startup.h"
#include "tools/record.h"
#include "tools/record_file.h"
#include "ui/sdl/assets.h"
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

// kruszarka [--record FILE]: FILE receives the seed and every input, as a script kruszarka-script replays.
int main(int argc, char** argv)
{
    using namespace kr;
    std::optional<record::Recorder::Sink> recording;
    if (argc == 3 && std::string(argv[1]) == "--record") {
        std::string error;
        recording = record::RecordingFile(argv[2], error);
        if (!recording) {
            std::cerr << "kruszarka: cannot record: " << error << '\n';
            return 2;
        }
    } else if (argc != 1) {
        std::cerr << "usage: kruszarka [--record FILE]\n";
        return 2;
    }
    SDL_SetMainReady();
    try {
        const sdl::Subsystem video(SDL_INIT_VIDEO);
        const sdl::Assets assets = sdl::Assets::BesideExecutable();
        sdl::MixerSound sound(assets);
        sdl::SdlMessageBoxes messages;
        record::AnswerLog answers(messages);
        Game game{Host{recording ? static_cast<ui::MessageBoxes&>(answers) : messages, sound}};
        sdl::GameWindow gameWindow(game, assets, sdl::ChooseScale());
        messages.SetParent(gameWindow.Handle());
        const uint32_t seed = SeedFromClock();
        StartUp(game, seed);
        std::optional<record::Recorder> recorder;
        if (recording) {
            recorder.emplace(game, answers, *recording);
            recorder->Started(seed);
            gameWindow.Record(&*recorder);
        }
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
