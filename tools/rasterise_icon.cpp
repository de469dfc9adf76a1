#include <SDL_image.h>

#include <cstdlib>
#include <iostream>
#include <string>

#include "ui/sdl/handles.h"

// kruszarka-rasterise SVG SIZE PNG: draws one of our SVG pictures SIZE pixels square into a PNG, for the
// desktop's icon theme, which wants fixed sizes beside the scalable picture.
int main(int argc, char** argv)
{
    using kr::sdl::SurfacePtr;
    const int size = argc == 4 ? std::atoi(argv[2]) : 0;
    if (size < 1 || size > 1024) {
        std::cerr << "usage: kruszarka-rasterise SVG SIZE PNG   (SIZE 1..1024)\n";
        return 2;
    }
    SDL_RWops* stream = SDL_RWFromFile(argv[1], "rb");
    if (!stream) {
        std::cerr << "kruszarka-rasterise: " << argv[1] << ": " << SDL_GetError() << '\n';
        return 1;
    }
    // The loader leaves the stream open.
    const SurfacePtr picture{IMG_LoadSizedSVG_RW(stream, size, size)};
    SDL_RWclose(stream);
    if (!picture || picture->w != size || picture->h != size) {
        std::cerr << "kruszarka-rasterise: " << argv[1] << ": not a square picture: " << IMG_GetError() << '\n';
        return 1;
    }
    if (IMG_SavePNG(picture.get(), argv[3]) != 0) {
        std::cerr << "kruszarka-rasterise: " << argv[3] << ": " << IMG_GetError() << '\n';
        return 1;
    }
    return 0;
}
