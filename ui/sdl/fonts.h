#pragma once
#include <map>
#include <tuple>

#include "ui/control.h"
#include "ui/sdl/handles.h"

namespace kr::sdl {

// The game's faces at one scale, each opened once per face, weight and size.
class Fonts {
public:
    explicit Fonts(int scale);
    Fonts(const Fonts&) = delete;
    Fonts& operator=(const Fonts&) = delete;

    // Throws when the font file cannot be opened: the game cannot show a word without it.
    TTF_Font* Get(const ui::Font& font);

    // Size in device pixels: points at 96 dpi times the scale, rounded.
    int PixelSize(const ui::Font& font) const;

private:
    TtfLibrary library_;
    int scale_;
    std::map<std::tuple<ui::Face, bool, int>, FontPtr> open_;
};

}  // namespace kr::sdl
