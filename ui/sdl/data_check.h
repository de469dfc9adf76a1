#pragma once
#include <ostream>

#include "ui/sdl/assets.h"

namespace kr::sdl {

// Loads every picture, sound and font the game uses, the way the game loads them, and names each one that
// fails on `report` (by its name relative to the data folder, so two installs report alike). True when
// nothing failed. A game that starts may still lack a picture it first shows in the last mission.
bool CheckGameData(const Assets& assets, int scale, std::ostream& report);

}  // namespace kr::sdl
