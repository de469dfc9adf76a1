#include "ui/sdl/display.h"

#include <SDL.h>

#include <cstring>

namespace kr::sdl {

bool HasDisplay()
{
    const char* driver = SDL_GetCurrentVideoDriver();
    if (!driver) return false;
    if (std::strcmp(driver, "offscreen") != 0 && std::strcmp(driver, "dummy") != 0) return true;
    // The hint falls back to the SDL_VIDEODRIVER environment variable, which may list several drivers.
    const char* asked = SDL_GetHint(SDL_HINT_VIDEODRIVER);
    return asked && std::strstr(asked, driver);
}

}  // namespace kr::sdl
