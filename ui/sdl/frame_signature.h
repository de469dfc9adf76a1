#pragma once
#include <cstdint>

#include "ui/form.h"

namespace kr::sdl {

// A hash of everything a frame shows: every shown control's drawn properties and the pointer.
// Equal signatures mean the window needs no redraw.
uint64_t FrameSignature(const ui::Form& form);

}  // namespace kr::sdl
