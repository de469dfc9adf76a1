#pragma once
#include <cstdint>
#include <map>
#include <utility>

#include "ui/picture.h"
#include "ui/sdl/assets.h"
#include "ui/sdl/handles.h"

namespace kr::sdl {

// Rasterises the picture's SVG at its 1x size times `scale`; nullptr (and one line on stderr per file)
// when the file is missing, unreadable or not a regular file.
SurfacePtr RasterisePicture(const Assets& assets, ui::PictureRef picture, int scale);

// The textures of the game's pictures for one renderer, each rasterised once per scale.
class PictureCache {
public:
    PictureCache(SDL_Renderer* renderer, const Assets& assets, int scale);

    // nullptr for "no picture" and for a picture whose file cannot be drawn.
    SDL_Texture* Get(ui::PictureRef picture);

    uint64_t Rasterised() const { return rasterised_; }

private:
    SDL_Renderer* renderer_;
    const Assets& assets_;
    int scale_;
    std::map<std::pair<ui::PictureSet, int16_t>, TexturePtr> textures_;
    uint64_t rasterised_ = 0;
};

}  // namespace kr::sdl
