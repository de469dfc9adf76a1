#include "ui/sdl/input.h"

namespace kr::sdl {

std::optional<int> GameKeyCode(SDL_Keycode key)
{
    if (key >= SDLK_a && key <= SDLK_z) return 'A' + (key - SDLK_a);
    if (key >= SDLK_0 && key <= SDLK_9) return '0' + (key - SDLK_0);
    if (key >= SDLK_F1 && key <= SDLK_F12) return 112 + (key - SDLK_F1);
    if (key >= SDLK_KP_1 && key <= SDLK_KP_9) return 97 + (key - SDLK_KP_1);
    switch (key) {
    case SDLK_ESCAPE: return 27;
    case SDLK_RETURN:
    case SDLK_KP_ENTER: return 13;
    case SDLK_SPACE: return 32;
    case SDLK_BACKSPACE: return 8;
    case SDLK_TAB: return 9;
    case SDLK_LEFT: return 37;
    case SDLK_UP: return 38;
    case SDLK_RIGHT: return 39;
    case SDLK_DOWN: return 40;
    case SDLK_KP_0: return 96;
    default: return std::nullopt;
    }
}

bool ShiftHeld(Uint16 modifiers) { return (modifiers & KMOD_SHIFT) != 0; }

float PixelToTwips(int pixel) { return static_cast<float>(pixel * 15 + 7); }

}  // namespace kr::sdl
