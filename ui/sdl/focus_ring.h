#pragma once
#include <SDL.h>

#include "ui/control.h"
#include "ui/sdl/shapes.h"

namespace kr::sdl {

// Draws the keyboard focus on a control drawn at `rect`: a dotted rectangle a little inside it, in black or
// white, whichever stands out from the control's colour. Drawn in 1x pixels, so each dot is a crisp square of
// scale x scale device pixels; the caller clips.
void DrawFocusRing(SDL_Renderer* renderer, const ui::Control& control, PixelRect rect);

}  // namespace kr::sdl
