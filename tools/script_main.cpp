#include <chrono>
#include <exception>
#include <fstream>
#include <iostream>
#include <optional>

#include "tools/script.h"
#include "ui/sdl/assets.h"
#include "ui/sdl/screenshot.h"

// kruszarka-script [FILE]: runs a scenario from FILE or stdin against the real game, headless.
// Only a screenshot touches SDL, and it needs no display.
int main(int argc, char** argv)
{
    using namespace kr;
    if (argc > 2) {
        std::cerr << "usage: kruszarka-script [FILE]\n";
        return 2;
    }
    std::ifstream file;
    if (argc == 2) {
        file.open(argv[1]);
        if (!file) {
            std::cerr << "kruszarka-script: cannot read " << argv[1] << '\n';
            return 2;
        }
    }
    std::istream& in = argc == 2 ? static_cast<std::istream&>(file) : std::cin;

    const sdl::Assets assets = sdl::Assets::BesideExecutable();
    std::optional<sdl::ScreenshotCamera> camera;
    const script::ScreenshotWriter screenshot = [&](const Game& game, const std::string& name) {
        try {
            if (!camera) camera.emplace(assets);
            return camera->Save(game.form, name);
        } catch (const std::exception& error) {
            std::cerr << "kruszarka-script: " << error.what() << '\n';
            return false;
        }
    };
    const auto seed = static_cast<uint32_t>(std::chrono::system_clock::now().time_since_epoch().count());
    try {
        script::ScriptRunner runner(std::cout, seed, screenshot);
        return runner.Run(in);
    } catch (const std::exception& error) {
        // A bug in the game, not in the script.
        std::cout.flush();
        std::cerr << "kruszarka-script: " << error.what() << '\n';
        return 3;
    }
}
