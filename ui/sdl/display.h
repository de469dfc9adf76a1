#pragma once

namespace kr::sdl {

// Whether started SDL video shows on a real display. Without one SDL quietly falls back to its offscreen
// driver, which only the tests and screenshots ask for by name.
bool HasDisplay();

}  // namespace kr::sdl
