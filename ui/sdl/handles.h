#pragma once
#include <memory>

#include <SDL.h>
#include <SDL_ttf.h>

namespace kr::sdl {

// Owns one SDL object and hands it back to SDL's own destroy function.
template <auto Destroy>
struct Destroyer {
    template <typename T>
    void operator()(T* object) const
    {
        if (object) Destroy(object);
    }
};

using WindowPtr = std::unique_ptr<SDL_Window, Destroyer<SDL_DestroyWindow>>;
using RendererPtr = std::unique_ptr<SDL_Renderer, Destroyer<SDL_DestroyRenderer>>;
using TexturePtr = std::unique_ptr<SDL_Texture, Destroyer<SDL_DestroyTexture>>;
using SurfacePtr = std::unique_ptr<SDL_Surface, Destroyer<SDL_FreeSurface>>;
using CursorPtr = std::unique_ptr<SDL_Cursor, Destroyer<SDL_FreeCursor>>;
using FontPtr = std::unique_ptr<TTF_Font, Destroyer<TTF_CloseFont>>;

// One started SDL subsystem; SDL counts starts, so nested owners are fine.
class Subsystem {
public:
    explicit Subsystem(Uint32 flags);
    ~Subsystem();
    Subsystem(const Subsystem&) = delete;
    Subsystem& operator=(const Subsystem&) = delete;

private:
    Uint32 flags_;
};

// SDL_ttf, started for as long as one of these lives (TTF_Init counts too).
class TtfLibrary {
public:
    TtfLibrary();
    ~TtfLibrary();
    TtfLibrary(const TtfLibrary&) = delete;
    TtfLibrary& operator=(const TtfLibrary&) = delete;
};

}  // namespace kr::sdl
