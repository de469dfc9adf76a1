#include "ui/sdl/data_check.h"

#include <exception>
#include <string>
#include <system_error>

#include "shell/texts.h"
#include "ui/picture.h"
#include "ui/sdl/fonts.h"
#include "ui/sdl/pictures.h"

namespace kr::sdl {
namespace {

int MissingPictures(const Assets& assets, int scale, std::ostream& report)
{
    int missing = 0;
    for (const ui::PictureRef picture : ui::AllPictures()) {
        if (RasterisePicture(assets, picture, scale)) continue;
        report << "missing picture: assets/pictures/" << ui::FileStem(picture) << ".svg\n";
        ++missing;
    }
    return missing;
}

int MissingSounds(const Assets& assets, std::ostream& report)
{
    int missing = 0;
    for (const char* name : kSoundFiles) {
        const std::filesystem::path file = assets.Resolve(name);
        std::error_code error;
        SDL_AudioSpec spec{};
        Uint8* samples = nullptr;
        Uint32 length = 0;
        // Only a regular file is opened: a pipe under a sound's name would hold the check forever.
        if (std::filesystem::is_regular_file(file, error) && SDL_LoadWAV(file.c_str(), &spec, &samples, &length)) {
            SDL_FreeWAV(samples);
            continue;
        }
        report << "missing sound: " << name << '\n';
        ++missing;
    }
    return missing;
}

int MissingFonts(int scale, std::ostream& report)
{
    int missing = 0;
    Fonts fonts(scale);
    for (const ui::Face face : {ui::Face::Mono, ui::Face::Sans})
        for (const bool bold : {false, true}) {
            try {
                fonts.Get(ui::Font{face, bold, 9.0f});
            } catch (const std::exception& error) {
                report << "missing font: " << error.what() << '\n';
                ++missing;
            }
        }
    return missing;
}

}  // namespace

bool CheckGameData(const Assets& assets, int scale, std::ostream& report)
{
    const int missing = MissingPictures(assets, scale, report) + MissingSounds(assets, report) +
                        MissingFonts(scale, report);
    return missing == 0;
}

}  // namespace kr::sdl
