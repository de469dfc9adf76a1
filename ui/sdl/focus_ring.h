#pragma once
#include <SDL.h>

#include "ui/form.h"

namespace kr::sdl {

// Draws the keyboard focus, if any control has it: a dotted rectangle a little inside the control, in black
// or white, whichever stands out from the control's colour. Drawn in 1x pixels, so each dot is a crisp
// square of scale x scale device pixels.
void DrawFocusRing(SDL_Renderer* renderer, const ui::Form& form);

}  // namespace kr::sdl
