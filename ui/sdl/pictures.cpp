#include "ui/sdl/pictures.h"

#include <SDL_image.h>
#include <iostream>
#include <mutex>
#include <set>
#include <string>

#include "ui/sdl/regular_file.h"

namespace kr::sdl {
namespace {

// A broken install should say once which file it lacks, not once a frame.
void ReportOnce(const std::string& file, const char* why)
{
    static std::mutex guard;
    static std::set<std::string> reported;
    const std::lock_guard lock(guard);
    if (reported.insert(file).second) std::cerr << "Kruszarka: cannot draw " << file << ": " << why << '\n';
}

}  // namespace

SurfacePtr RasterisePicture(const Assets& assets, ui::PictureRef picture, int scale)
{
    const std::optional<ui::PixelSize> size = ui::SizeOf(picture);
    if (!size) return nullptr;
    const std::string file = assets.Picture(ui::FileStem(picture)).string();
    SDL_RWops* stream = OpenRegularFile(file);
    if (!stream) {
        ReportOnce(file, SDL_GetError());
        return nullptr;
    }
    // The loader leaves the stream open.
    SurfacePtr surface{IMG_LoadSizedSVG_RW(stream, size->width * scale, size->height * scale)};
    SDL_RWclose(stream);
    if (!surface) ReportOnce(file, IMG_GetError());
    return surface;
}

PictureCache::PictureCache(SDL_Renderer* renderer, const Assets& assets, int scale)
    : renderer_(renderer), assets_(assets), scale_(scale)
{
}

SDL_Texture* PictureCache::Get(ui::PictureRef picture)
{
    const auto key = std::make_pair(picture.set, picture.index);
    const auto found = textures_.find(key);
    if (found != textures_.end()) return found->second.get();

    TexturePtr texture;
    if (SurfacePtr surface = RasterisePicture(assets_, picture, scale_)) {
        ++rasterised_;
        texture.reset(SDL_CreateTextureFromSurface(renderer_, surface.get()));
        if (texture) SDL_SetTextureBlendMode(texture.get(), SDL_BLENDMODE_BLEND);
    }
    // A failed picture is remembered as nullptr, so a missing file costs one attempt.
    return textures_.emplace(key, std::move(texture)).first->second.get();
}

}  // namespace kr::sdl
