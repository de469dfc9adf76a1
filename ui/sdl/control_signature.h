#pragma once
#include <cstdint>

#include "ui/control.h"
#include "ui/sdl/form_renderer.h"

namespace kr::sdl {

// A hash of everything a shown control's own drawing depends on, its placement included: equal signatures
// draw the same pixels.
uint64_t ControlSignature(const ui::Control& control, const Placement& placement);

}  // namespace kr::sdl
