#include "ui/sdl/cursors.h"

#include "ui/sdl/pictures.h"

namespace kr::sdl {

PointerCursors::PointerCursors(const Assets& assets, int scale) : assets_(assets), scale_(scale) {}

PointerCursors::~PointerCursors()
{
    // SDL keeps using the current cursor; hand it back its default before ours are freed.
    if (!cursors_.empty()) SDL_SetCursor(SDL_GetDefaultCursor());
}

SDL_Cursor* PointerCursors::Make(ui::PictureRef pointer)
{
    SurfacePtr drawn = RasterisePicture(assets_, pointer, scale_);
    if (!drawn) return nullptr;
    SurfacePtr image{SDL_ConvertSurfaceFormat(drawn.get(), SDL_PIXELFORMAT_ARGB8888, 0)};
    if (!image) return nullptr;
    // X11 takes cursor pixels as premultiplied alpha: keep each pixel fully opaque or fully clear.
    SDL_LockSurface(image.get());
    for (int y = 0; y < image->h; ++y) {
        auto* row = reinterpret_cast<Uint32*>(static_cast<Uint8*>(image->pixels) + y * image->pitch);
        for (int x = 0; x < image->w; ++x) row[x] = (row[x] >> 24) >= 128 ? (row[x] | 0xff000000u) : 0u;
    }
    SDL_UnlockSurface(image.get());
    const bool arrow = pointer.index == ui::NormalCursor;
    CursorPtr cursor{SDL_CreateColorCursor(image.get(), arrow ? 0 : image->w / 2, arrow ? 0 : image->h / 2)};
    return cursors_.emplace(pointer.index, std::move(cursor)).first->second.get();
}

void PointerCursors::Show(ui::PictureRef pointer)
{
    if (shown_ == pointer) return;
    shown_ = pointer;
    if (pointer.set != ui::PictureSet::Cursor) {
        SDL_SetCursor(SDL_GetDefaultCursor());
        return;
    }
    const auto found = cursors_.find(pointer.index);
    SDL_Cursor* cursor = found != cursors_.end() ? found->second.get() : Make(pointer);
    if (cursor) SDL_SetCursor(cursor);
}

}  // namespace kr::sdl
