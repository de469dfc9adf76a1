#define SDL_MAIN_HANDLED
#include <chrono>
#include <cstdlib>
#include <exception>
#include <iostream>
#include <optional>
#include <stdexcept>
#include <string>
#include <string_view>

#include "shell/game.h"
#include "shell/startup.h"
#include "tools/record.h"
#include "tools/record_file.h"
#include "ui/sdl/assets.h"
#include "ui/sdl/data_check.h"
#include "ui/sdl/display.h"
#include "ui/sdl/game_window.h"
#include "ui/sdl/handles.h"
#include "ui/sdl/message_boxes.h"
#include "ui/sdl/mixer_sound.h"
#include "ui/user_folder.h"

namespace {

constexpr const char* kUsage =
    "usage: kruszarka [--user-folder] [--check-data] [--record FILE]\n"
    "  --user-folder  keep progress in $XDG_DATA_HOME/kruszarka (~/.local/share/kruszarka), not here\n"
    "  --check-data   load every picture, sound and font, name what is missing, and exit\n"
    "  --record FILE  write the seed and every input to FILE, a script kruszarka-script replays\n";

uint32_t SeedFromClock()
{
    const auto ticks = std::chrono::system_clock::now().time_since_epoch().count();
    return static_cast<uint32_t>(static_cast<uint64_t>(ticks) ^ (static_cast<uint64_t>(ticks) >> 32));
}

// The desktop menu starts the game in the user's own folder, so its progress does not land wherever the
// menu happened to start it.
void EnterUserFolder()
{
    const auto folder = kr::ui::UserFolder(std::getenv("XDG_DATA_HOME"), std::getenv("HOME"));
    if (!folder) throw std::runtime_error("Nie wiem, gdzie zapisać postępy: brak zmiennej HOME.");
    if (const std::string why = kr::ui::EnterFolder(*folder); !why.empty())
        throw std::runtime_error("Nie mogę otworzyć folderu na postępy gry: " + why);
}

}  // namespace

int main(int argc, char** argv)
{
    using namespace kr;
    bool userFolder = false;
    bool checkData = false;
    std::optional<record::Recorder::Sink> recording;
    for (int i = 1; i < argc; ++i) {
        const std::string_view option = argv[i];
        if (option == "--user-folder") {
            userFolder = true;
        } else if (option == "--check-data") {
            checkData = true;
        } else if (option == "--record" && i + 1 < argc && !recording) {
            // Opened before anything else, relative to the folder the game was started from.
            std::string error;
            recording = record::RecordingFile(argv[++i], error);
            if (!recording) {
                std::cerr << "kruszarka: cannot record: " << error << '\n';
                return 2;
            }
        } else {
            std::cerr << kUsage;
            return 2;
        }
    }
    SDL_SetMainReady();
    try {
        if (userFolder) EnterUserFolder();
        const sdl::Subsystem video(SDL_INIT_VIDEO);
        if (!sdl::HasDisplay()) {
            // No window can show this.
            std::cerr << "Kruszarka: nie znaleziono ekranu (ustaw DISPLAY) / no display found (set DISPLAY)\n";
            return 1;
        }
        const sdl::Assets assets = sdl::Assets::BesideExecutable();
        sdl::MixerSound sound(assets, sdl::GameWindow::RealClock());
        sdl::SdlMessageBoxes messages;
        record::AnswerLog answers(messages);
        Game game{Host{recording ? static_cast<ui::MessageBoxes&>(answers) : messages, sound}};
        sdl::GameWindow gameWindow(game, assets, sdl::ChooseScale());
        if (checkData) {
            gameWindow.Redraw();
            return sdl::CheckGameData(assets, gameWindow.Scale(), std::cout) ? 0 : 1;
        }
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
        gameWindow.SetChore([&sound] { return sound.CloseWhenQuiet(); });
        gameWindow.Run();
        return 0;
    } catch (const std::exception& error) {
        // Anything thrown here is a bug in the game or a folder it cannot use: say so once, and stop.
        sdl::ShowFatalError(error.what());
        return 1;
    }
}
