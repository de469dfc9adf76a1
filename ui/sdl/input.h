#pragma once
#include <optional>

#include <SDL.h>

namespace kr::sdl {

// The game's key code for an SDL key: upper-case ASCII for letters, ASCII for digits, space and Return,
// 27 for Escape, and the classic virtual-key numbers for the arrows, function and keypad keys; nothing
// for keys the game has no code for.
std::optional<int> GameKeyCode(SDL_Keycode key);

// Whether a key came with either Shift key held, which turns Tab backwards.
bool ShiftHeld(Uint16 modifiers);

// A window pixel (1x, as SDL reports mouse positions under a logical size) to the twip at its centre.
float PixelToTwips(int pixel);

}  // namespace kr::sdl
