#include "ui/sdl/fonts.h"

#include <cmath>
#include <stdexcept>
#include <string>

#include "ui/sdl/regular_file.h"

namespace kr::sdl {
namespace {

const char* FileOf(ui::Face face, bool bold)
{
    // Liberation has the metrics of the faces the game was laid out in. The bold file, not
    // TTF_STYLE_BOLD: synthetic bold is wider and blurs at 1x.
    if (face == ui::Face::Mono)
        return bold ? "/usr/share/fonts/truetype/liberation/LiberationMono-Bold.ttf"
                    : "/usr/share/fonts/truetype/liberation/LiberationMono-Regular.ttf";
    if (face == ui::Face::Narrow)
        return bold ? "/usr/share/fonts/truetype/liberation/LiberationSansNarrow-Bold.ttf"
                    : "/usr/share/fonts/truetype/liberation/LiberationSansNarrow-Regular.ttf";
    return bold ? "/usr/share/fonts/truetype/liberation/LiberationSans-Bold.ttf"
                : "/usr/share/fonts/truetype/liberation/LiberationSans-Regular.ttf";
}

}  // namespace

Fonts::Fonts(int scale) : scale_(scale) {}

int Fonts::PixelSize(const ui::Font& font) const
{
    // TTF_OpenFontDPI takes whole points, and the game's sizes are 8.25, 9.75, 20.25 pt: opening at the pixel
    // size keeps 8.25 pt at the 11 px the layout was drawn with, where 8 pt at 96 dpi would give 10.7.
    return static_cast<int>(std::lround(font.points * 96.0f / 72.0f * static_cast<float>(scale_)));
}

TTF_Font* Fonts::Get(const ui::Font& font)
{
    const int pixels = PixelSize(font);
    const auto key = std::make_tuple(font.face, font.bold, pixels);
    const auto found = open_.find(key);
    if (found != open_.end()) return found->second.get();
    const char* file = FileOf(font.face, font.bold);
    SDL_RWops* const stream = OpenRegularFile(file);
    FontPtr opened{stream ? TTF_OpenFontDPIRW(stream, 1, pixels, 72, 72) : nullptr};
    if (!opened) throw std::runtime_error(std::string("Fonts::Get: ") + file + ": " + TTF_GetError());
    return open_.emplace(key, std::move(opened)).first->second.get();
}

}  // namespace kr::sdl
