#pragma once
#include <string>

#include "shell/progress_text.h"

namespace kr {

class Game;

// Reads config.cfg into the game's variables; false when the file is missing, unreadable or incomplete, in
// which case the values read keep what was read and UnlockedMissions becomes 1. Values are kept in the
// ranges later rules can handle. A file that exists but cannot be read is kept: the next save moves it aside.
bool LoadProgress(Game& g);

// What to tell the player after LoadProgress returned false.
std::string LoadFailureMessage(const Game& g);

// Writes config.cfg through a fresh temporary file renamed over it, so a failed save leaves the old file whole.
// A failure is told to the player, and the game goes on.
void SaveProgress(Game& g);

}  // namespace kr
