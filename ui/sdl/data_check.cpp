#include "ui/sdl/data_check.h"

#include <exception>
#include <string>

#include "shell/texts.h"
#include "ui/picture.h"
#include "ui/sdl/fonts.h"
#include "ui/sdl/pictures.h"
#include "ui/sdl/sound_file.h"

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
        // Through the game's own loader, so what passes here is what the game will play.
        std::string problem;
        if (!LoadSound(assets.Resolve(name), problem).empty()) continue;
        report << "missing sound: " << name << (problem.empty() ? "" : ": " + problem) << '\n';
        ++missing;
    }
    return missing;
}

int MissingFonts(int scale, std::ostream& report)
{
    int missing = 0;
    Fonts fonts(scale);
    for (const ui::Face face : {ui::Face::Mono, ui::Face::Sans, ui::Face::Narrow})
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
